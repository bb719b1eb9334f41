// SPDX-License-Identifier: MIT
/// @file
/// The constructors of arcs.
///
/// An arc is centre, radius, ends, angles and sense, whatever it is built from. Three points give
/// the centre as the crossing of two perpendicular bisectors. Ends and a radius give two centres,
/// where the circle about the start crosses the bisector; their sweeps add up to a full turn, so
/// the sweep picks one. A given centre that is not equally far from both ends moves onto their
/// bisector. Input that determines no arc leaves one that is not created. Constant cost.
#include <cmath>

#include "gmkernel/GmArc.h"

namespace {

GmDir upAxis() {
    return GmDir(0.0, 0.0, 1.0);
}

/// The polar angle of a point seen from a centre.
GmAngle angleAbout(GmPoint const& m, GmPoint const& p) {
    return GmAngle((p - m).RAngle(), true);
}

struct CentreAndRadius {
    GmPoint m;
    double r;
};

/// The centre on the perpendicular bisector of the chord, on the side of `m`, at the radius |m sp|
/// (|m ep| where the chord is longer than the diameter): sp + c/2 + t n with c the chord, n the
/// chord turned clockwise and t = sqrt(r^2 / c^2 - 1/4).
CentreAndRadius centreOnBisector(GmPoint const& sp, GmPoint const& ep, GmPoint const& m) {
    double r = m.Dist(sp);
    if (sp.Dist(ep) > 2.0 * r) r = m.Dist(ep);
    const GmVec chord = ep - sp;
    const double radicand = r * r / chord.Norm() - 0.25;
    const double t = radicand > 0.0 ? std::sqrt(radicand) : 0.0;
    const GmVec n = chord.Normalized(GmBase::eRotCW);
    const double side = n * (m - sp) < 0.0 ? -1.0 : 1.0;
    return {GmPoint(sp + 0.5 * chord + side * t * n), r};
}

/// Is `m` as good as equally far from both points, or do the points coincide?
bool isCentre(GmPoint const& sp, GmPoint const& ep, GmPoint const& m) {
    const bool full = std::fabs(ep.X() - sp.X()) < GmBase::m_scdPrecCalc &&
                      std::fabs(ep.Y() - sp.Y()) < GmBase::m_scdPrecCalc;
    return full || std::fabs(m.Dist(sp) - m.Dist(ep)) < GmBase::m_scdPrecCalc;
}

/// The sweep in degrees from `sp` to `ep` about `m` in the given sense, in [0, 360).
double sweepDegrees(GmPoint const& sp, GmPoint const& ep, GmPoint const& m, GmBase::eRotDir rot) {
    const double sweep = (sp - m).DAngle(ep - m, rot);
    return rot == GmBase::eRotCW ? -sweep : sweep;
}

}  // namespace

GmArc::GmArc() : m_eDir(eRotNone) {
    m_eType = eGmArc;
    GmArc::Undefine();
}

GmArc::GmArc(GmArc const& arc)
    : GmCircle(arc),
      boost::equality_comparable<GmArc>(arc),
      m_SP(arc.m_SP),
      m_EP(arc.m_EP),
      m_SAng(arc.m_SAng),
      m_EAng(arc.m_EAng),
      m_eDir(arc.m_eDir) {
    m_eType = eGmArc;
}

GmArc::GmArc(GmCircle const& circle, GmPoint const& sp, GmPoint const& ep, eRotDir rot)
    : GmCircle(circle), m_eDir(eRotNone) {
    if (!AreDefined(sp, ep)) return;
    const auto offCircle = [&](GmPoint const& p) {
        return std::fabs(m_M.Dist(p) - m_dR) > m_scdPrec;
    };
    if (offCircle(sp) || offCircle(ep)) {
        m_bCreationOK = false;
        return;
    }
    SetEnds(sp, ep);
    m_eDir = rot;
}

GmArc::GmArc(GmCircle const& circle, GmPoint const& sp, GmPoint const& ep, bool bShort)
    : GmCircle(circle), m_eDir(eRotNone) {
    if (!AreDefined(sp, ep)) return;
    if (std::fabs(m_M.Dist(sp) - m_M.Dist(ep)) > 2.0 * m_scdPrec) {
        GmArc::Undefine();
        return;
    }
    SetEnds(sp, ep);
    m_eDir = bShort ? m_SAng.Rotation(m_EAng) : m_EAng.Rotation(m_SAng);
}

GmArc::GmArc(GmCircle const& circle, double sAng, double eAng, eRotDir rot)
    : GmCircle(circle), m_eDir(eRotNone) {
    m_eType = eGmArc;
    if (m_bCreationOK) SetAngles(sAng, eAng, rot);
}

GmArc::GmArc(GmPoint const& m, double r, double sAng, double eAng, eRotDir rot) : m_eDir(eRotNone) {
    m_eType = eGmArc;
    if (!m.CreationOK() || r < m_scdPrec) {
        GmArc::Undefine();
        return;
    }
    Define(m, upAxis(), std::fabs(r));
    SetAngles(sAng, eAng, rot);
}

GmArc::GmArc(GmPoint const& sp, GmPoint const& ep, GmPoint const& m, eRotDir rot)
    : m_eDir(eRotNone) {
    m_eType = eGmArc;
    if (!sp.CreationOK() || !ep.CreationOK() || !m.CreationOK()) {
        GmArc::Undefine();
        return;
    }
    const CentreAndRadius circle =
        isCentre(sp, ep, m) ? CentreAndRadius{m, m.Dist(sp)} : centreOnBisector(sp, ep, m);
    Define(circle.m, upAxis(), circle.r);
    SetEnds(sp, ep);
    m_eDir = rot;
}

GmArc::GmArc(GmPoint const& p1, GmPoint const& p2, GmPoint const& p3) : m_eDir(eRotNone) {
    m_eType = eGmArc;
    // Undefined for undefined or equal points.
    const GmLine bisector12(p1, p2, ePPMidNormal);
    const GmLine bisector13(p1, p3, ePPMidNormal);
    if (!bisector12.CreationOK() || !bisector13.CreationOK()) return;
    if (bisector12.IntersectionWithLine(bisector13) == 0) return;

    const GmPoint m = bisector12.GetSolution(0);
    const double r = m.Dist(p1);
    if (r < m_scdPrec) {
        GmArc::Undefine();
        return;
    }
    Define(m, upAxis(), r);
    SetEnds(p1, p3);
    m_eDir = Rotation(m_SAng, angleAbout(m, p2), m_EAng);
}

GmArc::GmArc(GmPoint const& sp, GmPoint const& ep, double r, bool bShort, eRotDir rot)
    : m_eDir(eRotNone) {
    m_eType = eGmArc;
    const GmCircle aboutStart(sp, r, false);
    const GmLine bisector(sp, ep, ePPMidNormal);
    if (bisector.CreationOK()) aboutStart.IntersectionWithLine(bisector);
    for (GmPoint const& m : aboutStart.GetPtSol()) {
        const bool isShort = sweepDegrees(sp, ep, m, rot) <= 180.0;
        // The other crossing, where there is one, has the complementary sweep.
        if (isShort != bShort && &m == &aboutStart.GetPtSol().front()) continue;
        Define(m, upAxis(), aboutStart.R());
        SetEnds(sp, ep);
        m_eDir = rot;
        return;
    }
    GmArc::Undefine();
}

GmArc::GmArc(GmArc const& arc, double d) : m_eDir(eRotNone) {
    m_eType = eGmArc;
    const double r = arc.m_eDir == eRotCCW ? arc.m_dR + d : arc.m_dR - d;
    if (!arc.CreationOK() || !(r >= m_scdPrec)) return;

    Define(arc.m_M, arc.m_Axis, r);
    const auto scaled = [&](GmPoint const& p) { return GmPoint(m_M + (p - m_M) * r / arc.m_dR); };
    m_SP = scaled(arc.m_SP);
    m_EP = scaled(arc.m_EP);
    m_SAng = arc.m_SAng;
    m_EAng = arc.m_EAng;
    m_eDir = arc.m_eDir;
}

GmArc::~GmArc() = default;

bool GmArc::AreDefined(GmPoint const& sp, GmPoint const& ep) {
    m_eType = eGmArc;
    const bool defined = m_bCreationOK && sp.CreationOK() && ep.CreationOK();
    if (!defined) GmArc::Undefine();
    return defined;
}

void GmArc::SetEnds(GmPoint const& sp, GmPoint const& ep) {
    m_SP = sp;
    m_EP = ep;
    m_SAng = angleAbout(m_M, sp);
    m_EAng = angleAbout(m_M, ep);
}

void GmArc::SetAngles(double sAng, double eAng, eRotDir rot) {
    m_SAng = GmAngle(sAng, true);
    m_EAng = GmAngle(eAng, true);
    m_eDir = rot;
    m_SP = SP_Ang();
    m_EP = EP_Ang();
}

GmPoint GmArc::SP_Ang() const {
    return GmPoint(m_M + m_dR * GmVec(GmDir(m_SAng)));
}

GmPoint GmArc::EP_Ang() const {
    return GmPoint(m_M + m_dR * GmVec(GmDir(m_EAng)));
}
