// SPDX-License-Identifier: MIT
/// @file
/// The helix as an arc and a height.
///
/// All questions in the plane go to the arc below; the height at a point is linear in the angle
/// swept up to it. Distances in space to a helix would need an equation without a closed solution:
/// what asks for them is not provided, and the nearest point is that of the arc, lifted.
#include "gmkernel/GmHelix.h"

#include <cmath>

#include "gmkernel/GmLine.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"
#include "kernel/values/TraceText.h"

namespace {

GmPoint projected(GmPoint const& p) {
    return GmPoint(p.X(), p.Y());
}

GmPoint atHeight(GmPoint const& p, double height) {
    GmPoint result(p);
    result.Z(height);
    return result;
}

}  // namespace

GmHelix::GmHelix(GmPoint const& sp, GmPoint const& ep, GmPoint const& m, eRotDir rot)
    : m_Arc(projected(sp), projected(ep), projected(m), rot),
      m_dStartHeight(sp.Z()),
      m_dEndHeight(ep.Z()) {
    m_eType = eGmHelix;
    m_bCreationOK = m_Arc.CreationOK();
}

GmHelix::GmHelix(GmArc const& arc)
    : m_Arc(arc), m_dStartHeight(arc.SP().Z()), m_dEndHeight(arc.EP().Z()) {
    m_eType = eGmHelix;
    m_bCreationOK = m_Arc.CreationOK();
}

GmHelix::GmHelix(GmHelix const& helix)
    : GmCurve(helix),
      m_Arc(helix.m_Arc),
      m_dStartHeight(helix.m_dStartHeight),
      m_dEndHeight(helix.m_dEndHeight) {
    m_eType = eGmHelix;
}

GmHelix::GmHelix(GmHelix const& helix, double d)
    : m_Arc(helix.m_Arc, d),
      m_dStartHeight(helix.m_dStartHeight),
      m_dEndHeight(helix.m_dEndHeight) {
    m_eType = eGmHelix;
    m_bCreationOK = m_Arc.CreationOK();
}

GmHelix::~GmHelix() = default;

GmHelix& GmHelix::operator=(GmHelix const& helix) {
    if (this == &helix) return *this;
    CopyCurvePart(helix);
    m_Arc = helix.m_Arc;
    m_dStartHeight = helix.m_dStartHeight;
    m_dEndHeight = helix.m_dEndHeight;
    return *this;
}

GmHelix* GmHelix::Clone() const {
    return new GmHelix(*this);
}

GmRect GmHelix::BoundingRect() const {
    return GmRect();
}

bool GmHelix::Trim(GmCurve* next) {
    return m_Arc.Trim(next);
}

bool GmHelix::Element(GmPoint const& p) const {
    const GmPoint below = projected(p);
    return m_Arc.Element(below) && std::fabs(HeightAt(SweepTo(below)) - p.Z()) < m_scdPrec;
}

bool GmHelix::Element(GmPoint const& /*p*/, double /*eps*/) const {
    return false;
}

double GmHelix::Dist(GmPoint const& /*p*/) const {
    return 0.0;
}

GmPoint GmHelix::MinDist(GmPoint const& p, bool bPreferSP) const {
    const GmPoint nearest = m_Arc.MinDist(projected(p), bPreferSP);
    const double sweep = SweepTo(nearest);
    const bool isStart = nearest == m_Arc.SP() && sweep < m_scdPrecAngRad;
    if (!isStart) return atHeight(nearest, HeightAt(sweep));
    if (bPreferSP) return SP();
    return EP().Dist2(p) <= SP().Dist2(p) ? EP() : SP();
}

GmPoint GmHelix::SP() const {
    return atHeight(m_Arc.SP(), m_dStartHeight);
}

GmPoint GmHelix::EP() const {
    return atHeight(m_Arc.EP(), m_dEndHeight);
}

GmDir GmHelix::TangSP() const {
    return m_Arc.TangSP();
}

GmDir GmHelix::TangEP() const {
    return m_Arc.TangEP();
}

GmPoint GmHelix::NP(GmPoint const& /*p*/) const {
    return GmPoint();
}

GmLine GmHelix::Tangent(GmPoint const& /*p*/) const {
    return GmLine();
}

double GmHelix::Length() const {
    const double around = m_Arc.R() * m_Arc.Ang2Pi();
    const double rise = m_dEndHeight - m_dStartHeight;
    return std::sqrt(around * around + rise * rise);
}

GmCurve* GmHelix::GetParallel(double d) const {
    return new GmHelix(*this, d);
}

void GmHelix::Translation(GmVec const& /*v*/) {}

void GmHelix::Transform(GmMatrix const& m) {
    m_Arc.Transform(m);
    m_bCreationOK = m_Arc.CreationOK();
}

std::string GmHelix::GetTraceString() const {
    const GmPoint sp = SP();
    const GmPoint ep = EP();
    const GmPoint m = M();
    return gmkernel_detail::arcText("helix", Dir() == eRotCW, sp.X(), sp.Y(), ep.X(), ep.Y(), m.X(),
                                    m.Y());
}

GmPoint GmHelix::M() const {
    return m_Arc.M();
}

double GmHelix::R() const {
    return m_Arc.R();
}

GmBase::eRotDir GmHelix::Dir() const {
    return m_Arc.Dir();
}

GmArc const& GmHelix::GetArc() const {
    return m_Arc;
}

void GmHelix::SetArc(GmArc& /*arc*/) {}

double GmHelix::SweepTo(GmPoint const& p) const {
    return std::fabs(GmVec(M(), m_Arc.SP()).RAngle(GmVec(M(), p), Dir()));
}

double GmHelix::HeightAt(double sweep) const {
    return m_dStartHeight + (m_dEndHeight - m_dStartHeight) * sweep / m_Arc.Ang2Pi();
}
