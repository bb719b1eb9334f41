// SPDX-License-Identifier: MIT
/// @file
/// The arc or chamfer that comes into a corner, from its two elements alone.
///
/// A rounding is the arc between the contacts of a touching circle. A chamfer joins the points in
/// which a circle about the corner meets both elements: its radius is the distance, or gives the
/// length. Between segments leg and length form an isosceles triangle, which is solved; beside an
/// arc the length grows with the radius, and bisection finds it to within a fixed number, in a
/// fixed number of steps. Where a circle does not meet both elements there is no transition. Other
/// elements of the contour are not looked at.
#include "kernel/contour/transitions/Transition.h"

#include <algorithm>
#include <cmath>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/transitions/FilletCircle.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// The search for a chamfer of given length: steps of halving and deviation that is accepted.
constexpr int kMaxHalvings = 20;
constexpr double kLengthPrec = 0.005;

bool areSegments(GmCurve const& first, GmCurve const& second) {
    return first.IsStretch() && second.IsStretch();
}

/// A circle has to meet a segment in exactly one point.
GmPoint contactWith(GmCircle const& circle, GmCurve const& element) {
    if (auto const* arc = curveAs<GmArc>(element)) return contactWithArc(circle, *arc);
    return circle.Intersection(&element) == 1 ? circle.GetSolution(0) : GmPoint();
}

CornerContacts contactsOf(GmCircle const& circle, GmCurve const& first, GmCurve const& second) {
    return {contactWith(circle, first), contactWith(circle, second)};
}

GmCircle circleAboutCorner(GmCurve const& first, double radius) {
    return GmCircle(first.EP(), radius, false);
}

Transition chamferOver(CornerContacts const& contacts) {
    if (!contacts.AreUsable()) return {};
    return {std::make_unique<GmStretch>(contacts.onFirst, contacts.onSecond), contacts};
}

Transition rounding(GmCurve const& first, GmCurve const& second, double radius) {
    const GmCircle circle = filletCircle(first, second, radius);
    if (!circle.CreationOK()) return {};
    const CornerContacts contacts = contactsOf(circle, first, second);
    if (!contacts.AreUsable()) return {};
    return {std::make_unique<GmArc>(circle, contacts.onFirst, contacts.onSecond, true), contacts};
}

Transition chamferAtDistance(GmCurve const& first, GmCurve const& second, double dist) {
    return chamferOver(contactsOf(circleAboutCorner(first, dist), first, second));
}

/// The distance from the corner of two segments at which a chamfer has the length: both legs and
/// the chamfer form an isosceles triangle.
double distanceForLength(GmStretch const& first, GmStretch const& second, double length) {
    const double angle = first.Dir().RAngle(-second.Dir());
    return length / std::fabs(2.0 * std::sin(angle / 2.0));
}

/// Bisects the radius of the circle about the corner between 0 and the shorter of the two chords.
Transition chamferBySearch(GmCurve const& first, GmCurve const& second, double length) {
    double lower = 0.0;
    double upper = std::min(first.SP().Dist(first.EP()), second.SP().Dist(second.EP()));
    double current = 0.0;
    CornerContacts contacts;
    for (int i = 0; i < kMaxHalvings && !(std::fabs(current - length) <= kLengthPrec); ++i) {
        const double radius = (lower + upper) / 2.0;
        contacts = contactsOf(circleAboutCorner(first, radius), first, second);
        const GmStretch chamfer(contacts.onFirst, contacts.onSecond);
        if (!chamfer.CreationOK()) break;
        current = chamfer.Length();
        if (length < 0.0 && current > 0.0) break;
        (current > length ? upper : lower) = radius;
    }
    return std::fabs(current - length) <= kLengthPrec ? chamferOver(contacts) : Transition();
}

Transition chamferOfLength(GmCurve const& first, GmCurve const& second, double length) {
    auto const* const a = curveAs<GmStretch>(first);
    auto const* const b = curveAs<GmStretch>(second);
    if (!a || !b) return chamferBySearch(first, second, length);
    return chamferAtDistance(first, second, distanceForLength(*a, *b, length));
}

}  // namespace

bool CornerContacts::AreUsable() const {
    return onFirst.CreationOK() && onSecond.CreationOK() && !(onFirst == onSecond);
}

bool isContinued(GmContour::eTransType type, GmCurve const& first, GmCurve const& second) {
    const bool matters = areSegments(first, second) || type == GmContour::eTransRadius;
    return matters && first.TangEP() == second.TangSP();
}

Transition transitionAt(GmContour::eTransType type, GmCurve const& first, GmCurve const& second,
                        double value) {
    switch (type) {
        case GmContour::eTransRadius:
            return rounding(first, second, value);
        case GmContour::eTransChamferDist:
            return chamferAtDistance(first, second, value);
        case GmContour::eTransChamferLength:
            return chamferOfLength(first, second, value);
        default:
            return {};
    }
}

GmPoint contactWithArc(GmCircle const& circle, GmArc const& arc) {
    const int count = circle.Intersection(&arc);
    if (count == 0) return GmPoint();
    if (count == 1) return circle.GetSolution(0);
    const GmVec towardsCircle(arc.M(), circle.M());
    const auto turnTo = [&](GmPoint const& p) {
        return std::fabs(towardsCircle.RAngle(GmVec(arc.M(), p), arc.Dir()));
    };
    const bool takeSecond = turnTo(circle.GetSolution(1)) <= turnTo(circle.GetSolution(0));
    return circle.GetSolution(takeSecond ? 1 : 0);
}

}  // namespace gmkernel_detail
