// SPDX-License-Identifier: MIT
/// @file
/// Areas and lengths over arcs.
///
/// With the chord L and the bulge b the segment of an arc has the area
/// L^2 ((1 + b^2)^2 atan b - b (1 - b^2)) / (8 b^2), which for small b is the series
/// L^2 (b/3 + b^3/15 - b^5/105 + ...), its terms b^(2k-1) / ((2k+1)(2k-1)(2k-3)) with changing
/// signs from the second on. The length of the arc is L (1 + b^2) (atan b) / b. The arc tangent is
/// halved down by atan x = 2 atan(x / (1 + sqrt(1 + x x))) until its own series is short.
#include "region/plane/Measures.h"

#include <cmath>

namespace gmregion {

namespace {

/// Up to this bulge the series of the segment is used; there its last term is below rounding.
constexpr double kSeriesBulge = 0.25;

double segmentSeries(double b) {
    const double squared = b * b;
    double power = b;
    double sum = b / 3.0;
    double sign = 1.0;
    for (int k = 2; k < 16; ++k) {
        power *= squared;
        sum += sign * power / ((2.0 * k + 1.0) * (2.0 * k - 1.0) * (2.0 * k - 3.0));
        sign = -sign;
    }
    return sum;
}

/// The area of the segment in squares of the chord, b >= 0.
double segmentShare(double b) {
    if (b < kSeriesBulge) return segmentSeries(b);
    const double q = 1.0 + b * b;
    return (q * q * arcTangent(b) - b * (1.0 - b) * (1.0 + b)) / (8.0 * b * b);
}

}  // namespace

double arcTangent(double x) {
    double factor = 1.0;
    while (x > 0.125) {
        x = x / (1.0 + std::sqrt(1.0 + x * x));
        factor *= 2.0;
    }
    const double squared = x * x;
    double sum = 0.0;
    for (int k = 10; k >= 0; --k)
        sum = 1.0 / (2.0 * k + 1.0) - squared * sum;
    return factor * x * sum;
}

double segmentArea(const Element& e) {
    if (e.bulge == 0.0) return 0.0;
    const Vec2 chord = e.ep - e.sp;
    const double share = segmentShare(std::fabs(e.bulge));
    return dot(chord, chord) * (e.bulge > 0.0 ? share : -share);
}

double sweptTwice(const Element& e, Vec2 from) {
    return cross(e.sp - from, e.ep - from) + 2.0 * segmentArea(e);
}

double lengthAlong(const Element& e) {
    const Vec2 chord = e.ep - e.sp;
    const double width = std::sqrt(dot(chord, chord));
    const double b = std::fabs(e.bulge);
    if (b == 0.0) return width;
    return width * (1.0 + b * b) * (arcTangent(b) / b);
}

}  // namespace gmregion
