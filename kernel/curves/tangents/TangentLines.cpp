// SPDX-License-Identifier: MIT
/// @file
/// Lines built from their tangency to circles.
///
/// From a point: the touching point sees point and centre at a right angle, so it lies on the
/// circle over them as diameter (Thales). Common to two circles: the difference of the radii, or
/// their sum for a tangent that crosses between them, over the distance of the centres is the sine
/// of the angle to the line of centres. Which of the tangents is meant follows from the sides of
/// the circles. Constant cost.
#include <algorithm>
#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"

namespace {

double degreesOf(double radians) {
    return GmAngle(radians, true).Degree();
}

/// Does a tangent of the kind exist? A circle inside the other has none, and circles that overlap
/// have no crossing one. Equal concentric circles are refused by their distance.
bool hasTangent(double r1, double r2, double dist, bool crossing) {
    if (crossing && r1 + r2 > dist) return false;
    return dist + r1 >= r2 && dist + r2 >= r1 && dist > 0.0;
}

}  // namespace

GmLine::GmLine(GmPoint const& p, GmCircle const& c, bool bRight) : GmLine() {
    if (!c.CreationOK() || !p.CreationOK()) return;
    const GmPoint middle(p, c.M());
    const GmCircle thales(middle, p.Dist(middle), false);
    const int count = thales.IntersectionWithCircle(c);
    if (count == 0) return;
    GmPoint touch = thales.GetSolution(0);
    const double toCentre = GmVec(p, touch).DAngle(GmVec(touch, c.M()));
    const bool otherSide = bRight ? toCentre > 0.0 : toCentre < 0.0;
    if (otherSide && count > 1) touch = thales.GetSolution(1);
    const GmDir dir =
        p == touch ? GmDir(touch, c.M()).Normalized(bRight ? eRotCCW : eRotCW) : GmDir(p, touch);
    Define(touch, dir);
}

GmLine::GmLine(GmCircle const& c1, bool bRight1, GmCircle const& c2, bool bRight2) : GmLine() {
    if (!c1.CreationOK() || !c2.CreationOK()) return;
    const double dx = c2.M().X() - c1.M().X();
    const double dy = c2.M().Y() - c1.M().Y();
    const double dist = std::sqrt(dx * dx + dy * dy);
    const bool crossing = bRight1 != bRight2;
    if (!hasTangent(c1.R(), c2.R(), dist, crossing)) return;
    // A circle that touches the other from inside may give a quotient beyond 1 by rounding.
    const double sine = (crossing ? c1.R() + c2.R() : c1.R() - c2.R()) / dist;
    const double inclination = degreesOf(std::asin(std::clamp(sine, -1.0, 1.0)));
    const double side = bRight1 ? -1.0 : 1.0;
    const double radial = GmVec(dx, dy, 0.0).DAngle() - side * (90.0 - inclination);
    const GmVec toTouch = c2.R() * GmVec(GmDir(GmAngle(radial, false)));
    const GmPoint touch(crossing ? c2.M() - toTouch : c2.M() + toTouch);
    Define(touch, GmDir(GmAngle(radial + 90.0 * side, false)));
}
