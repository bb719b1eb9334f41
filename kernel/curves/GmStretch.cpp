// SPDX-License-Identifier: MIT
/// @file
/// The segment: a line with two ends.
///
/// A point lies on the segment when its foot on the supporting line does, by the parameter along
/// the longer axis, and when it is near to the foot. The direction follows the ends and keeps its
/// last value when they meet, so that a segment without length still has one. Where a foot lies
/// beyond the ends the nearer end is the nearest point, as distance along a line grows away from
/// the foot.
#include "gmkernel/GmStretch.h"

#include <utility>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmRect.h"
#include "kernel/curves/Joining.h"
#include "kernel/curves/PlainCurve.h"
#include "kernel/curves/VerifiedCast.h"
#include "kernel/values/TraceText.h"

using gmkernel_detail::curveAs;

GmStretch::GmStretch() {
    m_eType = eGmStretch;
}

GmStretch::GmStretch(GmStretch const& stretch)
    : GmLine(stretch), boost::equality_comparable<GmStretch>(stretch), m_EP(stretch.m_EP) {
    m_eType = eGmStretch;
}

GmStretch::GmStretch(GmPoint const& p1, GmPoint const& p2) : GmStretch() {
    if (!p1.CreationOK() || !p2.CreationOK()) return;
    Define(p1, p1.Dir(p2));
    m_EP = p2;
}

GmStretch::GmStretch(GmPoint const& p, GmDir const& dir, double len) : GmStretch() {
    if (!p.CreationOK() || !dir.CreationOK()) return;
    Define(p, dir);
    m_EP = GmPoint(p + len * GmVec(dir));
}

GmStretch::GmStretch(GmStretch const& stretch, double d) : GmStretch() {
    if (!stretch.CreationOK()) return;
    const GmVec shift = d * GmVec(stretch.Normal());
    Define(GmPoint(stretch.m_SP + shift), stretch.m_Dir);
    m_EP = GmPoint(stretch.m_EP + shift);
}

GmStretch::~GmStretch() = default;

GmStretch& GmStretch::operator=(GmStretch const& stretch) {
    GmLine::operator=(stretch);
    m_EP = stretch.m_EP;
    return *this;
}

GmStretch* GmStretch::Clone() const {
    return new GmStretch(*this);
}

GmRect GmStretch::BoundingRect() const {
    return GmRect(m_SP, m_EP);
}

void GmStretch::Undefine() {
    GmLine::Undefine();
    m_EP = GmPoint();
}

bool GmStretch::Trim(GmCurve* next) {
    return gmkernel_detail::trimToCrossing(*this, next);
}

GmCurve* GmStretch::Concat(GmCurve const& next, int mode) {
    GmLine normalAtNext;
    if (auto const* stretch = curveAs<GmStretch>(next)) {
        normalAtNext = GmLine(*stretch, next.SP(), ePLNormal);
    } else if (auto const* arc = curveAs<GmArc>(next)) {
        normalAtNext = GmLine(arc->M(), next.SP());
    }
    return gmkernel_detail::connectingCurve(*this, GmLine(*this, EP(), ePLNormal), next,
                                            normalAtNext, mode);
}

bool GmStretch::Concat(GmCurve const& next) {
    const GmLine supportingLine(*this);
    if (auto const* stretch = curveAs<GmStretch>(next)) {
        if (supportingLine.IntersectionWithLine(*stretch) == 0) return false;
        gmkernel_detail::joinAt(*this, next, supportingLine.GetSolution(0));
        return true;
    }
    auto const* const arc = curveAs<GmArc>(next);
    if (arc == nullptr) return false;

    const GmCircle circle(*arc);
    const int count = circle.IntersectionWithLine(supportingLine);
    if (count == 0) return false;
    const auto turn = [&](unsigned i) { return EP().AngDist(circle.GetSolution(i), circle.M()); };
    const unsigned chosen = count > 1 && turn(0) > turn(1) ? 1 : 0;
    gmkernel_detail::joinAt(*this, next, circle.GetSolution(chosen));
    return true;
}

void GmStretch::Invert() {
    std::swap(m_SP, m_EP);
    m_Dir.Invert();
}

bool GmStretch::Element(GmPoint const& p, double eps) const {
    return gmkernel_detail::isOn(gmkernel_detail::plainOf(*this), gmkernel_detail::plain(p), eps);
}

double GmStretch::Dist(GmPoint const& p) const {
    return gmkernel_detail::distanceTo(gmkernel_detail::plainOf(*this), gmkernel_detail::plain(p));
}

GmPoint GmStretch::MinDist(GmPoint const& p, bool bPreferSP) const {
    const GmPoint foot = GmLine::MinDist(p, false);
    if (Element(foot)) return foot;
    if (bPreferSP) return m_SP;
    return m_EP.Dist2(p) <= m_SP.Dist2(p) ? m_EP : m_SP;
}

void GmStretch::SetSP(GmPoint const& p) {
    m_SP = p;
    FollowEnds();
}

void GmStretch::SetEP(GmPoint const& p) {
    m_EP = p;
    FollowEnds();
}

void GmStretch::FollowEnds() {
    if (m_SP != m_EP) m_Dir = m_SP.Dir(m_EP);
}

GmPoint GmStretch::EP() const {
    return m_EP;
}

GmDir GmStretch::TangSP() const {
    return m_Dir;
}

GmDir GmStretch::TangEP() const {
    return m_Dir;
}

double GmStretch::Length() const {
    return m_SP.Dist(m_EP);
}

GmCurve* GmStretch::GetParallel(double d) const {
    return new GmStretch(*this, d);
}

void GmStretch::Translation(GmVec const& v) {
    m_SP.Translation(v);
    m_EP.Translation(v);
}

void GmStretch::Transform(GmMatrix const& m) {
    m_EP.Transform(m);
    m_SP.Transform(m);
    m_Dir = m_SP.Dir(m_EP);
}

std::string GmStretch::GetTraceString() const {
    return gmkernel_detail::stretchText(m_SP.X(), m_SP.Y(), m_EP.X(), m_EP.Y());
}

GmPoint GmStretch::HP() const {
    return GmPoint(m_SP, m_EP);
}

GmDir GmStretch::TangHP() const {
    return m_Dir;
}

GmStretch GmStretch::Inverted() const {
    return GmStretch(m_EP, m_SP);
}

bool GmStretch::operator==(GmStretch const& stretch) const {
    return this == &stretch || (m_SP == stretch.m_SP && m_EP == stretch.m_EP);
}
