// SPDX-License-Identifier: MIT
/// @file
/// The distances of points, segments and arcs.
///
/// Two bounded curves that do not cross are nearest at an end of one of them or at two points that
/// face each other, with the connection perpendicular to both. Two segments need no facing pair, an
/// arc has one: towards the foot of its centre on the line, or towards the other centre. Squares
/// are compared and one root is taken at last. Where one circle lies inside the other, another pair
/// faces each other, which is not tried: the distance may come out too large. Constant cost.
#include "kernel/curves/dispatch/DistanceFunctions.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <vector>

#include "kernel/curves/PlainCurve.h"

namespace gmkernel_detail {

namespace {

/// The point at the distance `r` from `from` in the direction of `to`.
GmPoint towards(GmPoint const& from, GmPoint const& to, double r) {
    return GmPoint(from + r * GmVec(GmDir(from, to)));
}

bool cross(GmBase const& a, GmBase const& b) {
    std::vector<GmPoint> points;
    ::Intersection(a, b, points);
    return !points.empty();
}

double squaredToEnds(GmPoint const& p, GmCurve const& curve) {
    return std::min(p.Dist2(curve.SP()), p.Dist2(curve.EP()));
}

double squared(GmPoint const& p, GmStretch const& stretch) {
    const GmPoint foot = stretch.GmLine::MinDist(p, false);
    const bool inside = isBetweenEnds(plainOf(stretch), plain(foot));
    return inside ? p.Dist2(foot) : squaredToEnds(p, stretch);
}

double squared(GmPoint const& p, GmArc const& arc) {
    const GmPoint foot = towards(arc.M(), p, arc.R());
    return arc.Element(foot) ? p.Dist2(foot) : squaredToEnds(p, arc);
}

/// Lowers a squared distance by those of the ends of each curve from the other one.
template <class A, class B>
double loweredByEnds(double candidate, A const& a, B const& b) {
    candidate = std::min(candidate, squared(a.SP(), b));
    candidate = std::min(candidate, squared(a.EP(), b));
    candidate = std::min(candidate, squared(b.SP(), a));
    return std::min(candidate, squared(b.EP(), a));
}

double squaredFacing(GmArc const& arc, GmStretch const& stretch) {
    const GmPoint foot = stretch.GmLine::MinDist(arc.M(), false);
    if (!stretch.Element(foot)) return std::numeric_limits<double>::max();
    const GmPoint onArc = towards(arc.M(), foot, arc.R());
    return arc.Element(onArc) ? foot.Dist2(onArc) : std::numeric_limits<double>::max();
}

double squaredFacing(GmArc const& a, GmArc const& b) {
    const GmVec u(GmDir(a.M(), b.M()));
    const GmPoint onA(a.M() + a.R() * u);
    if (!a.Element(onA)) return std::numeric_limits<double>::max();
    const GmPoint onB(b.M() - b.R() * u);
    return b.Element(onB) ? onA.Dist2(onB) : std::numeric_limits<double>::max();
}

}  // namespace

double distance(GmPoint const& a, GmPoint const& b) {
    return a.Dist(b);
}

double distance(GmPoint const& p, GmArc const& arc) {
    return std::sqrt(squared(p, arc));
}

double distance(GmPoint const& p, GmStretch const& stretch) {
    return std::sqrt(squared(p, stretch));
}

double distance(GmStretch const& a, GmStretch const& b) {
    if (cross(a, b)) return 0.0;
    return std::sqrt(loweredByEnds(std::numeric_limits<double>::max(), a, b));
}

double distance(GmArc const& arc, GmStretch const& stretch) {
    if (cross(arc, stretch)) return 0.0;
    return std::sqrt(loweredByEnds(squaredFacing(arc, stretch), arc, stretch));
}

double distance(GmArc const& a, GmArc const& b) {
    if (cross(a, b)) return 0.0;
    return std::sqrt(loweredByEnds(squaredFacing(a, b), a, b));
}

}  // namespace gmkernel_detail
