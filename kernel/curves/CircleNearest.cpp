// SPDX-License-Identifier: MIT
/// @file
/// Nearest and touching points of circles and arcs.
///
/// A nearest point lies on a line through the centre: the full circle is intersected with that line
/// and of the two points those are kept that the curve's own membership test accepts, so that one
/// routine serves the full circle and the arc.
#include <cmath>

#include "gmkernel/GmBeam.h"
#include "gmkernel/GmCircle.h"
#include "kernel/curves/VerifiedCast.h"

namespace {

/// Of the points in a circle's solution list the one that lies on the curve itself; of two such
/// points the first when `preferFirst` says so. Undefined when there is none.
template <class PreferFirst>
GmPoint acceptedSolution(GmCircle const& circle, PreferFirst const& preferFirst) {
    auto const& found = circle.GetPtSol();
    const bool first = !found.empty() && circle.Element(found[0]);
    const bool second = found.size() > 1 && circle.Element(found[1]);
    if (first && second) return preferFirst(found[0], found[1]) ? found[0] : found[1];
    if (first) return found[0];
    return second ? found[1] : GmPoint();
}

/// The point of the curve on the line through its centre and the reference, the one nearer to the
/// reference or (`farther`) the other one; ties go to the second solution.
GmPoint onLineOfCentres(GmCircle const& circle, GmPoint const& reference, bool farther) {
    circle.IntersectionWithLine(GmLine(circle.M(), GmDir(circle.M(), reference)));
    return acceptedSolution(circle, [&](GmPoint const& first, GmPoint const& second) {
        const double d0 = reference.Dist2(first);
        const double d1 = reference.Dist2(second);
        return farther ? d1 < d0 : d1 > d0;
    });
}

/// The point of the curve on the perpendicular to a straight curve through its centre.
GmPoint facingStraight(GmCircle const& circle, GmLine const& straight) {
    circle.IntersectionWithLine(GmLine(circle.M(), straight.Dir().Normalized(GmBase::eRotCW)));
    return acceptedSolution(circle, [&](GmPoint const& first, GmPoint const& second) {
        return straight.Dist(first) < straight.Dist(second);
    });
}

/// The point of the curve on the line of centres with another circle or arc. Concentric curves take
/// the other's start as reference.
GmPoint facingRound(GmCircle const& circle, GmCircle const& other) {
    GmPoint reference = other.M();
    if (reference == circle.M()) reference = other.SP();
    if (!reference.CreationOK()) return circle.SP();
    return onLineOfCentres(circle, reference, true);
}

}  // namespace

GmPoint GmCircle::NP(GmPoint const& p) const {
    return p == m_M ? SP() : onLineOfCentres(*this, p, false);
}

GmPoint GmCircle::NP(GmCurve const* c) const {
    if (c == nullptr) return GmPoint();
    if (auto const* line = gmkernel_detail::straightPart(*c)) return facingStraight(*this, *line);
    if (auto const* circle = gmkernel_detail::roundPart(*c)) return facingRound(*this, *circle);
    return GmPoint();
}

GmPoint GmCircle::MinDist(GmPoint const& p, bool /*bPreferSP*/) const {
    if (p == m_M) return SP();
    const GmBeam ray(m_M, GmDir(m_M, p));
    return Intersection(&ray) > 0 ? GetSolution(0) : GmPoint();
}

GmPoint GmCircle::GetTangPoint(GmLine const& line) {
    if (!(std::fabs(line.Dist(m_M) - m_dR) < m_scdPrec)) return GmPoint();
    return line.GmLine::MinDist(m_M, false);
}

GmPoint GmCircle::GetTangPoint(GmCircle const& circle) {
    const double dist = m_M.Dist(circle.m_M);
    const auto rimTowards = [](GmCircle const& from, GmCircle const& to) {
        return GmPoint(from.m_M + from.m_dR * GmVec(GmDir(from.m_M, to.m_M)));
    };
    if (std::fabs(m_dR + circle.m_dR - dist) < m_scdPrec) return rimTowards(*this, circle);
    if (std::fabs(std::fabs(m_dR - circle.m_dR) - dist) < m_scdPrec) {
        if (circle.m_dR < m_dR) return rimTowards(*this, circle);
        if (circle.m_dR > m_dR) return rimTowards(circle, *this);
    }
    return GmPoint();
}
