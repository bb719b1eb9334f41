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

#include <array>
#include <cmath>
#include <cstddef>

namespace gmregion {

namespace {

/// Up to this bulge the series of the segment is used; there its last term is below rounding.
constexpr double kSeriesBulge = 0.25;

/// The coefficients of b (b b)^k, k from 0, of the area of the segment in squares of the chord.
constexpr auto kSegmentSeries = [] {
    std::array<double, 15> series{1.0 / 3.0};
    double sign = 1.0;
    for (std::size_t i = 1; i < series.size(); ++i) {
        const double k = static_cast<double>(i) + 1.0;
        series[i] = sign / ((2.0 * k + 1.0) * (2.0 * k - 1.0) * (2.0 * k - 3.0));
        sign = -sign;
    }
    return series;
}();

/// The coefficients of x (x x)^k with changing signs of the arc tangent.
constexpr std::array<double, 11> kArcTangentSeries{1.0,        1.0 / 3.0,  1.0 / 5.0,  1.0 / 7.0,
                                                   1.0 / 9.0,  1.0 / 11.0, 1.0 / 13.0, 1.0 / 15.0,
                                                   1.0 / 17.0, 1.0 / 19.0, 1.0 / 21.0};

double segmentSeries(double b) {
    double sum = 0.0;
    for (std::size_t i = kSegmentSeries.size(); i-- > 0;)
        sum = kSegmentSeries[i] + b * b * sum;
    return b * sum;
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
    for (std::size_t i = kArcTangentSeries.size(); i-- > 0;)
        sum = kArcTangentSeries[i] - squared * sum;
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
