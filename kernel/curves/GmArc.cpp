// SPDX-License-Identifier: MIT
/// @file
/// The arc: its sweep over a circle.
///
/// Which points lie in the sweep, and where along it, is told in plain numbers. Ends, angles and
/// radius are stored side by side; moving an end does not project it onto the circle.
#include "gmkernel/GmArc.h"

#include <cmath>
#include <utility>

#include "gmkernel/GmBeam.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/Joining.h"
#include "kernel/curves/PlainCurve.h"
#include "kernel/curves/VerifiedCast.h"
#include "kernel/curves/kernels/AngleOrder.h"
#include "kernel/values/Constants.h"
#include "kernel/values/TraceText.h"

using gmkernel_detail::curveAs;
using gmkernel_detail::plain;
using gmkernel_detail::plainOf;

namespace {

/// Does a transform turn the x-y plane over?
bool mirrors(GmMatrix const& m) {
    GmPoint x(1.0, 0.0, 0.0);
    GmPoint y(0.0, 1.0, 0.0);
    GmPoint origin(0.0, 0.0, 0.0);
    x.Transform(m);
    y.Transform(m);
    origin.Transform(m);
    const GmVec cross = (x - origin) % (y - origin);
    return cross.Z() < 0.0;
}

}  // namespace

GmArc& GmArc::operator=(GmArc const& arc) {
    GmCircle::operator=(arc);
    m_SP = arc.m_SP;
    m_EP = arc.m_EP;
    m_SAng = arc.m_SAng;
    m_EAng = arc.m_EAng;
    m_eDir = arc.m_eDir;
    return *this;
}

GmArc* GmArc::Clone() const {
    return new GmArc(*this);
}

void GmArc::Undefine() {
    GmCircle::Undefine();
    m_SP = GmPoint();
    m_EP = GmPoint();
    m_SAng = GmAngle(0.0, true);
    m_EAng = GmAngle(0.0, true);
    m_eDir = eRotNone;
}

bool GmArc::Trim(GmCurve* next) {
    return gmkernel_detail::trimToCrossing(*this, next);
}

GmCurve* GmArc::Concat(GmCurve const& next, int mode) {
    GmLine normalAtNext;
    if (auto const* stretch = curveAs<GmStretch>(next)) {
        normalAtNext = GmLine(*stretch, next.SP(), ePLNormal);
    } else if (auto const* arc = curveAs<GmArc>(next)) {
        normalAtNext = GmLine(next.SP(), arc->M());
    }
    return gmkernel_detail::connectingCurve(*this, GmLine(m_EP, m_M), next, normalAtNext, mode);
}

bool GmArc::Concat(GmCurve const& next) {
    const GmCircle circle(*this);
    int count = 0;
    bool takeSecond = false;
    if (auto const* stretch = curveAs<GmStretch>(next)) {
        count = circle.IntersectionWithLine(GmLine(*stretch));
        takeSecond =
            count > 1 && m_EP.Dist(circle.GetSolution(0)) > m_EP.Dist(circle.GetSolution(1));
    } else if (auto const* arc = curveAs<GmArc>(next)) {
        count = circle.IntersectionWithCircle(*arc);
        if (count == 0) return next.SP() == m_EP;
        takeSecond = count > 1 && m_EP.AngDist(circle.GetSolution(0), m_M) >
                                      m_EP.AngDist(circle.GetSolution(1), m_M);
    }
    if (count == 0) return false;
    gmkernel_detail::joinAt(*this, next, circle.GetSolution(takeSecond ? 1 : 0));
    return true;
}

void GmArc::Invert() {
    std::swap(m_SP, m_EP);
    std::swap(m_SAng, m_EAng);
    m_eDir = static_cast<eRotDir>(-m_eDir);
}

bool GmArc::Element(GmPoint const& p, double eps) const {
    return gmkernel_detail::isOn(plainOf(*this), plain(p), eps);
}

bool GmArc::Element(GmPoint const& p) const {
    return Element(p, gmkernel_detail::kArcElementPrec);
}

double GmArc::DistSP(GmPoint const& p) const {
    if (p == m_SP || !m_SAng.CreationOK()) return 0.0;
    return gmkernel_detail::lengthUpTo(plainOf(*this), GmDir(m_M, p).Angle().Degree());
}

GmPoint GmArc::MinDist(GmPoint const& p, bool bPreferSP) const {
    if (p == m_M) return m_SP;
    const GmBeam ray(m_M, GmDir(m_M, p));
    if (Intersection(&ray) > 0) return GetSolution(0);
    if (bPreferSP) return m_SP;
    return m_EP.Dist2(p) <= m_SP.Dist2(p) ? m_EP : m_SP;
}

bool GmArc::In(GmPoint const& /*p*/) {
    return false;
}

bool GmArc::Out(GmPoint const& /*p*/) {
    return false;
}

void GmArc::SetSP(GmPoint const& p) {
    m_SP = p;
    m_SAng = GmDir(m_M, p).Angle();
}

void GmArc::SetEP(GmPoint const& p) {
    m_EP = p;
    m_EAng = GmDir(m_M, p).Angle();
}

GmPoint GmArc::SP() const {
    return m_SP;
}

GmPoint GmArc::EP() const {
    return m_EP;
}

GmDir GmArc::TangentAt(GmDir const& radial) const {
    GmDir tangent(radial);
    tangent.Normalize(eRotCW);
    if (m_eDir != eRotCW) tangent.Invert();
    return tangent;
}

GmDir GmArc::TangSP() const {
    return TangentAt(GmDir(m_SAng));
}

GmDir GmArc::TangEP() const {
    return TangentAt(GmDir(m_EAng));
}

GmDir GmArc::TangHP() const {
    return TangentAt(GmDir(m_M, HP()));
}

double GmArc::Length() const {
    return m_dR * Ang2Pi();
}

GmCurve* GmArc::GetParallel(double d) const {
    return new GmArc(*this, d);
}

void GmArc::Translation(GmVec const& v) {
    GmCircle::Translation(v);
    m_EP.Translation(v);
    m_SP.Translation(v);
}

void GmArc::Transform(GmMatrix const& m) {
    eRotDir rot = m_eDir;
    if (mirrors(m)) rot = m_eDir == eRotCW ? eRotCCW : eRotCW;
    m_SP.Transform(m);
    m_EP.Transform(m);
    m_M.Transform(m);
    *this = GmArc(m_SP, m_EP, m_M, rot);
}

std::string GmArc::GetTraceString() const {
    return gmkernel_detail::arcText("circ", m_eDir == eRotCW, m_SP.X(), m_SP.Y(), m_EP.X(),
                                    m_EP.Y(), m_M.X(), m_M.Y());
}

GmBase::eRotDir GmArc::Dir() const {
    return m_eDir;
}

double GmArc::SAng() const {
    return m_SAng.Radiant();
}

double GmArc::EAng() const {
    return m_EAng.Radiant();
}

double GmArc::SAngDeg() const {
    return m_SAng.Degree();
}

double GmArc::EAngDeg() const {
    return m_EAng.Degree();
}

double GmArc::Ang() const {
    const bool hasAngles = m_SAng.CreationOK() && m_EAng.CreationOK();
    return hasAngles ? gmkernel_detail::sweepOf(plainOf(*this)) : 0.0;
}

double GmArc::Ang2Pi() const {
    return IsFullCircle() ? 2.0 * gmkernel_detail::kPi : Ang();
}

bool GmArc::IsFullCircle() const {
    return gmkernel_detail::isFullCircle(plainOf(*this));
}

GmPoint GmArc::SectionPoint(int i, int n) const {
    const double sweep = m_eDir == eRotCW ? -Ang() : Ang();
    if (!m_SAng.CreationOK()) return m_M;
    return pointOf(gmkernel_detail::pointAfter(plainOf(*this), sweep / n * i));
}

GmPoint GmArc::HP() const {
    return SectionPoint(1, 2);
}

GmArc GmArc::Inverted() const {
    return GmArc(GmCircle(m_M, m_dR, false), m_EP, m_SP, static_cast<eRotDir>(-m_eDir));
}

bool GmArc::operator==(GmArc const& arc) const {
    if (this == &arc) return true;
    return GmCircle::operator==(arc) && m_SP == arc.m_SP && m_EP == arc.m_EP &&
           m_SAng == arc.m_SAng && m_EAng == arc.m_EAng && m_eDir == arc.m_eDir &&
           GmBase::operator==(arc);
}

GmBase::eRotDir GmArc::Rotation(GmAngle const& a0, GmAngle const& a1, GmAngle const& a2) const {
    return gmkernel_detail::angleOrder(a0.Degree(), a1.Degree(), a2.Degree());
}
