// SPDX-License-Identifier: MIT
/// @file
/// Circles through points and circles that touch lines and circles.
///
/// The centre is equally far from all that is touched, so it is the crossing of two places of such
/// points: perpendicular bisectors, bisectors of lines, parallels at the radius, and circles with
/// the radius added or taken off. Two crossings are told apart by the order of the contacts around
/// the centre. Without a crossing the circle is undefined; contacts are not tested against the
/// bounds of curves. Constant cost.
#include <cmath>

#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"
#include "kernel/curves/SupportHits.h"

namespace {

GmDir upAxis() {
    return GmDir(0.0, 0.0, 1.0);
}

/// Where the centres of the circles of radius `r` lie that touch `c` from outside or inside.
GmCircle centresTouching(GmCircle const& c, double r, bool bOutside) {
    return GmCircle(c.M(), bOutside ? c.R() + r : std::fabs(c.R() - r), true);
}

/// From the centre of a circle of radius `r` towards the point in which it touches `c`.
GmVec towardsTouch(GmPoint const& centre, GmCircle const& c, double r, bool bOutside) {
    const GmVec toCentre(centre, c.M());
    return !bOutside && c.R() >= r ? -toCentre : toCentre;
}

}  // namespace

GmCircle::GmCircle(GmPoint const& p1, GmPoint const& p2, GmPoint const& p3) : GmCircle() {
    if (!p1.CreationOK() || !p2.CreationOK() || !p3.CreationOK()) return;
    if (p1 == p2 || p1 == p3 || p2 == p3) return;
    const GmLine bisector(p1, p2, ePPMidNormal);
    if (bisector.IntersectionWithLine(GmLine(p1, p3, ePPMidNormal)) == 0) return;
    const GmPoint m = bisector.GetSolution(0);
    Define(m, upAxis(), m.Dist(p1));
}

GmCircle::GmCircle(GmLine const& l1, GmLine const& l2, GmLine const& l3) : GmCircle() {
    if (!l1.CreationOK() || !l2.CreationOK() || !l3.CreationOK()) return;
    const GmLine bisector(l1, l2);
    if (bisector.IntersectionWithLine(GmLine(GmLine(l1.SP(), -l1.Dir()), l3)) == 0) return;
    const GmPoint m = bisector.GetSolution(0);
    Define(m, upAxis(), l1.Dist(m));
}

GmCircle::GmCircle(GmLine const& l1, GmLine const& l2, double r) : GmCircle() {
    if (!l1.CreationOK() || !l2.CreationOK()) return;
    const auto crossing = gmkernel_detail::supportHits(l1, l2);
    if (crossing.begin() == crossing.end()) return;
    const GmVec bisector(l1.Dir().Sym(l2.Dir()));
    const double angle = l1.Dir().RAngle(l2.Dir());
    const double dist = std::fabs(r / std::sin(angle / 2.0));
    const GmPoint corner = gmkernel_detail::pointOf(*crossing.begin());
    Define(GmPoint(corner + dist * bisector), upAxis(), std::fabs(r));
}

GmCircle::GmCircle(GmCircle const& c, GmLine const& l, double r, bool bRight, bool bOutside,
                   bool bAfter)
    : GmCircle() {
    if (l.CreationOK() && c.CreationOK() && r > 0.0)
        CreateTangCircle(c, l, r, bRight, bOutside, bAfter);
}

GmCircle::GmCircle(GmCircle const& c1, GmCircle const& c2, double r, bool bCW, bool bOutside1,
                   bool bOutside2, bool bOther)
    : GmCircle() {
    if (c1.CreationOK() && c2.CreationOK() && r > 0.0)
        CreateTangCircle(c1, c2, r, bCW, bOutside1, bOutside2, bOther);
}

void GmCircle::CreateTangCircle(GmCircle const& c, GmLine const& l, double r, bool bRight,
                                bool bOutside, bool bAfter) {
    const GmCircle centres = centresTouching(c, r, bOutside);
    const int count = centres.IntersectionWithLine(GmLine(l, bRight ? r : -r));
    if (count == 0) {
        GmCircle::Undefine();
        return;
    }
    GmPoint m = centres.GetSolution(0);
    const GmVec away = GmVec(l.Dir()).Normalized(bRight ? eRotCW : eRotCCW);
    const double angle = towardsTouch(m, c, r, bOutside).RAngle(away);
    if ((bRight == bAfter) != (angle > 0.0) && count > 1) m = centres.GetSolution(1);
    Define(m, upAxis(), r);
}

void GmCircle::CreateTangCircle(GmCircle const& c1, GmCircle const& c2, double r, bool bCW,
                                bool bOutside1, bool bOutside2, bool bOther) {
    const GmCircle centres = centresTouching(c1, r, bOutside1);
    const int count = centres.IntersectionWithCircle(centresTouching(c2, r, bOutside2));
    if (count == 0) {
        GmCircle::Undefine();
        return;
    }
    GmPoint m = centres.GetSolution(0);
    const double angle =
        towardsTouch(m, c1, r, bOutside1).RAngle(towardsTouch(m, c2, r, bOutside2));
    if ((bCW == bOther) != (angle > 0.0) && count > 1) m = centres.GetSolution(1);
    Define(m, upAxis(), r);
}
