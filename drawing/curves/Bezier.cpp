// SPDX-License-Identifier: MIT
/// @file
/// Rational curves by repeated halving of their control polygon.
///
/// Points between control points are taken of points with weights, which is the same as of points
/// in space seen from the origin. The last two points before the one on the curve span its tangent.

#include "drawing/curves/Bezier.h"

#include <algorithm>

namespace gmdrawing {

using gmregion::Vec2;

namespace {

/// Inside a curve that stands still its direction is told by a piece as long as this part of it.
constexpr double kStep = 1e-3;

/// Of the length of a curve: what its points may differ by rounding.
constexpr double kRounding = 1e-14;

WeightedPoint between(const WeightedPoint& a, const WeightedPoint& b, double t) {
    const double left = (1.0 - t) * a.weight;
    const double right = t * b.weight;
    const double weight = left + right;
    return {(left / weight) * a.p + (right / weight) * b.p, weight};
}

/// One step of the scheme in place: every point moves towards the next, the last one goes.
void contract(Bezier& points, double t) {
    for (std::size_t i = 0; i + 1 < points.size(); ++i)
        points[i] = between(points[i], points[i + 1], t);
    points.pop_back();
}

Vec2 position(Bezier points, double t) {
    while (points.size() > 1)
        contract(points, t);
    return points.front().p;
}

/// Direction from the first control point to the next one in another place.
Vec2 leavingDirection(const Bezier& curve, double rounding) {
    for (const WeightedPoint& point : curve) {
        const Vec2 along = point.p - curve.front().p;
        if (length(along) > rounding) return unit(along);
    }
    return {};
}

Bezier turnedRound(Bezier curve) {
    std::reverse(curve.begin(), curve.end());
    return curve;
}

/// Where the curve stands still.
Vec2 limitDirection(const Bezier& curve, double t, double rounding) {
    if (t == 0.0) return leavingDirection(curve, rounding);
    if (t == 1.0) return -1.0 * leavingDirection(turnedRound(curve), rounding);
    const bool nearEnd = t > 1.0 - kStep;
    return unit(position(curve, nearEnd ? t : t + kStep) -
                position(curve, nearEnd ? t - kStep : t));
}

/// The part up to t: the first points of all steps.
Bezier head(const Bezier& curve, double t) {
    Bezier points = curve;
    Bezier result = {points.front()};
    while (points.size() > 1) {
        contract(points, t);
        result.push_back(points.front());
    }
    return result;
}

}  // namespace

CurvePoint pointAt(const Bezier& curve, double t) {
    Bezier points = curve;
    while (points.size() > 2)
        contract(points, t);
    const Vec2 along = points[1].p - points[0].p;
    const double rounding = kRounding * controlLength(curve);
    const Vec2 direction =
        length(along) > rounding ? unit(along) : limitDirection(curve, t, rounding);
    if (t == 0.0) return {curve.front().p, direction};
    if (t == 1.0) return {curve.back().p, direction};
    return {between(points[0], points[1], t).p, direction};
}

Bezier piece(const Bezier& curve, double from, double to) {
    Bezier upTo = to < 1.0 ? head(curve, to) : curve;
    if (from <= 0.0) return upTo;
    return turnedRound(head(turnedRound(upTo), 1.0 - from / to));
}

Bezier mapped(const Bezier& curve, const Placement& placement) {
    Bezier result = curve;
    for (WeightedPoint& point : result)
        point.p = placement.apply(point.p);
    return result;
}

double controlLength(const Bezier& curve) {
    double sum = 0.0;
    for (std::size_t i = 1; i < curve.size(); ++i)
        sum += distance(curve[i - 1].p, curve[i].p);
    return sum;
}

}  // namespace gmdrawing
