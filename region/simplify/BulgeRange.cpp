// SPDX-License-Identifier: MIT
/// @file
/// Which arcs over a chord pass points within given distances.
///
/// The chord runs from 0 to L along x. The arc of bulge b has its centre at height L (1 - b^2) / 4b
/// and the radius L (1 + b^2) / 4b. That a point (x, y) has the signed distance s from its circle,
/// positive on the left, is
///
///     (y - s) b^2 + 2 (D/L) b - (y + s) = 0  with  D = x (x - L) + y^2 - s^2,
///
/// a square equation for b, of which one root belongs to arcs through the strip over the chord:
/// with S the root of (D/L)^2 + (y - s)(y + s), (y + s) / (D/L - S), and where D is positive the
/// same number in the form without cancellation. Arcs over one chord do not cross, so the distances
/// t and -t bound a range of bulges, and the ranges of many points have an interval in common, in
/// time linear in them. No centre occurs, and flat arcs need no case of their own.
#include "region/simplify/BulgeRange.h"

#include <algorithm>
#include <cmath>

#include "region/simplify/Directions.h"

namespace gmregion {

namespace {

/// Half a turn, and rounding.
constexpr double kWidest = 1.0 + 1.0 / 1099511627776.0;  // 2^-40

/// The bulge at which a point has the signed distance s; not a number where it is that near to an
/// end of the chord.
double bulgeAt(double x, double y, double width, double s) {
    const double d = (x * (x - width) + (y - s) * (y + s)) / width;
    const double root = std::sqrt(d * d + (y - s) * (y + s));
    return d <= 0.0 ? (y + s) / (d - root) : -(d + root) / (y - s);
}

}  // namespace

BulgeRange::BulgeRange(Vec2 sp, Vec2 ep)
    : m_sp(sp), m_width(lengthOf(ep - sp)), m_low(-kWidest), m_high(kWidest) {
    m_along = (1.0 / m_width) * (ep - sp);
}

BulgeRange::Place BulgeRange::placeOf(Vec2 p) const {
    return {dot(m_along, p - m_sp), cross(m_along, p - m_sp)};
}

void BulgeRange::keepNear(Vec2 p, double t) {
    const Place at = placeOf(p);
    const double low = bulgeAt(at.x, at.y, m_width, t);
    const double high = bulgeAt(at.x, at.y, m_width, -t);
    if (!(low <= high)) return;
    m_low = std::max(m_low, low);
    m_high = std::min(m_high, high);
}

void BulgeRange::weigh(Vec2 p) {
    const Place at = placeOf(p);
    const double b = bulgeAt(at.x, at.y, m_width, 0.0);
    const double d = (at.x * (at.x - m_width) + at.y * at.y) / m_width;
    // How far the arc moves there for a change of the bulge.
    const double speed = 2.0 * (d + at.y * b) / (1.0 + b * b);
    const double weight = speed * speed;
    if (!std::isfinite(b) || !std::isfinite(weight)) return;
    m_weights += weight;
    m_sum += weight * b;
}

double BulgeRange::best() const {
    const double mean = m_weights > 0.0 ? m_sum / m_weights : middle();
    return std::max(m_low, std::min(m_high, mean));
}

}  // namespace gmregion
