// SPDX-License-Identifier: MIT
/// @file
/// First moments and close boxes over arcs.
///
/// The segment between an arc and its chord L has the moment L^3 / 12 about the centre, which lies
/// L (1 - b^2) / (4 b) beyond the middle of the chord. About that middle it is
/// L^3 (1/12 - S (1 - b^2) / (4 b)) with S L^2 the area, always to the right of the chord since
/// area and side change signs together. For small b that difference is nothing but rounding; there
/// S / b is the series s0 + s1 b^2 + ... of the area, and the difference the quarter of the sum of
/// (s(m-1) - s(m)) b^(2m).
///
/// An arc leaves the box of its ends where its normal is an axis direction v. With c and s the
/// cosine and sine from the normal at the start to v, that point lies (c - 1) / k along v from the
/// start, taken as -s^2 / (k (1 + c)), which loses no digits when k is small.
#include "region/locate/Moments.h"

#include <cmath>

#include "region/plane/Carrier.h"
#include "region/plane/Measures.h"

namespace gmregion {

namespace {

/// Up to this bulge the series is used; there its last term is below rounding.
constexpr double kSeriesBulge = 0.25;

/// The coefficient of b^(2m + 1) in the series of the segment's area in squares of the chord.
double areaTerm(int m) {
    if (m == 0) return 1.0 / 3.0;
    const double term = 1.0 / ((2.0 * m + 3.0) * (2.0 * m + 1.0) * (2.0 * m - 1.0));
    return m % 2 == 1 ? term : -term;
}

/// The moment of the segment about the middle of its chord, in cubes of the chord, to the right.
double momentShare(const Element& e) {
    const double squaredBulge = e.bulge * e.bulge;
    if (squaredBulge < kSeriesBulge * kSeriesBulge) {
        double power = 1.0;
        double sum = 0.0;
        for (int m = 1; m < 15; ++m) {
            power *= squaredBulge;
            sum += (areaTerm(m - 1) - areaTerm(m)) * power;
        }
        return 0.25 * sum;
    }
    const Vec2 chord = e.ep - e.sp;
    const double share = segmentArea(e) / dot(chord, chord);
    return 1.0 / 12.0 - share * (1.0 - e.bulge) * (1.0 + e.bulge) / (4.0 * e.bulge);
}

}  // namespace

Moment sweptMoment(const Element& e, Vec2 from) {
    const Vec2 a = e.sp - from;
    const Vec2 b = e.ep - from;
    const double triangle = 0.5 * cross(a, b);
    Moment moment{triangle, (triangle / 3.0) * (a + b)};
    const Vec2 chord = b - a;
    if (e.bulge == 0.0 || !(dot(chord, chord) > 0.0)) return moment;
    const double segment = segmentArea(e);
    moment.area += segment;
    moment.first = moment.first + (0.5 * segment) * (a + b) +
                   (momentShare(e) * dot(chord, chord)) * rightNormal(chord);
    return moment;
}

Box closeBox(const Element& e) {
    Box box;
    box.include(e.sp);
    box.include(e.ep);
    if (e.bulge == 0.0 || e.sp == e.ep) return box;
    const Carrier c = carrierOf(e);
    const Vec2 atEnd = c.normal - c.curvature * (e.ep - e.sp);
    const double sense = e.bulge > 0.0 ? 1.0 : -1.0;
    for (const Vec2 v : {Vec2{1, 0}, Vec2{0, 1}, Vec2{-1, 0}, Vec2{0, -1}}) {
        const double sine = cross(c.normal, v);
        if (!(sense * sine > 0.0 && sense * cross(v, atEnd) > 0.0)) continue;
        const double cosine = dot(c.normal, v);
        // Half a turn or more passes v in the far half, where 1 + c would lose digits instead.
        const double rise = cosine > 0.0 ? -sine * (sine / c.curvature) / (1.0 + cosine)
                                         : (cosine - 1.0) / c.curvature;
        const Vec2 extreme = e.sp + rise * v;
        box.include(v.x != 0.0 ? Vec2{extreme.x, e.sp.y} : Vec2{e.sp.x, extreme.y});
    }
    return box;
}

}  // namespace gmregion
