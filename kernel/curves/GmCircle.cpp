// SPDX-License-Identifier: MIT
#include "gmkernel/GmCircle.h"

#include <algorithm>
#include <cmath>

#include "gmkernel/GmRect.h"
#include "kernel/curves/SupportHits.h"
#include "kernel/values/Constants.h"
#include "kernel/values/TraceText.h"

GmCircle::GmCircle() {
    m_eType = eGmCircle;
    GmCircle::Undefine();
}

GmCircle::GmCircle(GmCircle const& circle)
    : GmCurve(circle),
      boost::equality_comparable<GmCircle>(circle),
      m_M(circle.m_M),
      m_Axis(circle.m_Axis),
      m_dR(circle.m_dR) {
    m_eType = eGmCircle;
}

GmCircle::GmCircle(GmPoint const& m, double r, bool /*flag*/)
    : GmCircle(m, GmDir(0.0, 0.0, 1.0), r) {}

GmCircle::GmCircle(GmPoint const& m, GmDir const& axis, double r) : GmCircle() {
    if (m.CreationOK()) Define(m, axis, std::fabs(r));
}

GmCircle::GmCircle(GmCircle const& circle, double d) : GmCircle() {
    const double r = circle.m_dR + d;
    if (circle.CreationOK() && r >= m_scdPrec) Define(circle.m_M, circle.m_Axis, r);
}

GmCircle::~GmCircle() = default;

GmCircle& GmCircle::operator=(GmCircle const& circle) {
    if (this == &circle) return *this;
    CopyCurvePart(circle);
    m_M = circle.m_M;
    m_Axis = circle.m_Axis;
    m_dR = circle.m_dR;
    return *this;
}

void GmCircle::Define(GmPoint const& m, GmDir const& axis, double r) {
    m_M = m;
    m_Axis = axis;
    m_dR = r;
    m_bCreationOK = true;
}

GmCircle* GmCircle::Clone() const {
    return new GmCircle(*this);
}

GmRect GmCircle::BoundingRect() const {
    return GmRect(GmPoint(m_M.X() - m_dR, m_M.Y() + m_dR), GmPoint(m_M.X() + m_dR, m_M.Y() - m_dR));
}

void GmCircle::Undefine() {
    GmCurve::Undefine();
    m_M = GmPoint(0.0, 0.0);
    m_dR = 0.0;
    m_Axis = GmDir(0.0, 0.0, 1.0);
}

bool GmCircle::Element(GmPoint const& p, double eps) const {
    return GmCircle::Dist(p) < eps;
}

bool GmCircle::Element(GmPoint const& p) const {
    return Element(p, m_scdPrec);
}

double GmCircle::Dist(GmPoint const& p) const {
    return std::fabs(m_M.Dist(p) - m_dR);
}

bool GmCircle::In(GmPoint const& p) {
    return m_M.Dist(p) < m_dR;
}

bool GmCircle::Out(GmPoint const& p) {
    return m_M.Dist(p) > m_dR;
}

GmLine GmCircle::Tangent(GmPoint const& p) const {
    if (GmCircle::Dist(p) <= m_scdPrec) return GmLine(p, GmDir(m_M, p).Normalized(eRotCW));
    return GmLine();
}

double GmCircle::Length() const {
    return 2.0 * m_dR * gmkernel_detail::kPi;
}

GmCurve* GmCircle::GetParallel(double d) const {
    return new GmCircle(*this, d);
}

void GmCircle::Translation(GmVec const& v) {
    m_M.Translation(v);
}

void GmCircle::Transform(GmMatrix const& /*m*/) {}

std::string GmCircle::GetTraceString() const {
    return gmkernel_detail::circleText(m_M.X(), m_M.Y(), m_dR);
}

GmPoint GmCircle::M() const {
    return m_M;
}

double GmCircle::R() const {
    return m_dR;
}

GmDir const& GmCircle::Axis() const {
    return m_Axis;
}

GmDir GmCircle::TangDir(GmPoint const& p) const {
    if (!Element(p)) return GmDir();
    GmDir tangent(m_M, p);
    tangent.Normalize(eRotCW);
    return tangent;
}

double GmCircle::Dist(GmLine const& line) const {
    return std::max(0.0, line.Dist(m_M) - m_dR);
}

double GmCircle::Dist(GmCircle const& circle) const {
    const double larger = std::max(m_dR, circle.m_dR);
    const double smaller = std::min(m_dR, circle.m_dR);
    const double dist = m_M.Dist(circle.m_M);
    if (larger > dist + smaller) return larger - dist - smaller;
    return std::max(0.0, dist - m_dR - circle.m_dR);
}

int GmCircle::IntersectionWithLine(GmLine const& line) const {
    return gmkernel_detail::storeHits(gmkernel_detail::supportHits(*this, line), m_ptSol);
}

int GmCircle::IntersectionWithCircle(GmCircle const& circle) const {
    return gmkernel_detail::storeHits(gmkernel_detail::supportHits(*this, circle), m_ptSol);
}

bool GmCircle::operator==(GmCircle const& circle) const {
    return this == &circle || (m_dR == circle.m_dR && m_M == circle.m_M);
}
