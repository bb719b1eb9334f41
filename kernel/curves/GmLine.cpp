// SPDX-License-Identifier: MIT
/// @file
/// The line as a point and a unit direction.
///
/// Nearest points are projections onto the direction. Distances go by the slope form instead, the
/// one in which the intersection kernels decide about touching, so that both agree to the last
/// digit; they leave z out. A bisector runs along the sum of both unit directions. Directions are
/// not tested for being zero: what follows from a line through coincident points has no meaning.
#include "gmkernel/GmLine.h"

#include <cmath>

#include "gmkernel/GmRect.h"
#include "kernel/curves/SupportHits.h"
#include "kernel/curves/kernels/SlopeForm.h"

using gmkernel_detail::plain;

GmLine::GmLine() {
    m_eType = eGmLine;
    GmLine::Undefine();
}

GmLine::GmLine(GmLine const& line)
    : GmCurve(line), boost::equality_comparable<GmLine>(line), m_SP(line.m_SP), m_Dir(line.m_Dir) {
    m_eType = eGmLine;
}

GmLine::GmLine(GmPoint const& p1, GmPoint const& p2) : GmLine() {
    if (p1.CreationOK() && p2.CreationOK()) Define(p1, p1.Dir(p2));
}

GmLine::GmLine(GmPoint const& p, GmDir const& dir) : GmLine() {
    if (p.CreationOK()) Define(p, dir);
}

GmLine::GmLine(GmLine const& line, GmPoint const& p, eLineCustructionTypePL type) : GmLine() {
    if (!line.CreationOK() || !p.CreationOK()) return;
    switch (type) {
        case ePLParallel:
            Define(p, line.m_Dir);
            break;
        case ePLNormal:
            Define(p, line.m_Dir.Normalized(eRotCW));
            break;
        case ePLCopy:
        default:
            Define(line.m_SP, line.m_Dir);
            break;
    }
}

GmLine::GmLine(GmPoint const& p1, GmPoint const& p2, eLineCustructionTypePP type) : GmLine() {
    if (!p1.CreationOK() || !p2.CreationOK() || p1 == p2) return;
    switch (type) {
        case ePPMidNormal:
            Define(p1.Mean(p2), p1.Dir(p2).Normalized(eRotCW));
            break;
        case ePPNormalFirst:
            Define(p1, p1.Dir(p2).Normalized(eRotCW));
            break;
        case ePPNormalSecond:
            Define(p2, p2.Dir(p1).Normalized(eRotCW));
            break;
        case ePPThrough:
        default:
            Define(p1, p1.Dir(p2));
            break;
    }
}

GmLine::GmLine(GmLine const& line, double d) : GmLine() {
    if (line.CreationOK()) Define(GmPoint(line.m_SP + d * GmVec(line.Normal())), line.m_Dir);
}

GmLine::GmLine(GmLine const& a, GmLine const& b) : GmLine() {
    if (!a.CreationOK() || !b.CreationOK()) return;
    const GmLine supportingLine(a);
    if (supportingLine.IntersectionWithLine(b) > 0) {
        Define(supportingLine.GetSolution(0), a.m_Dir.Sym(b.m_Dir));
    } else {
        Define(a.SP().Mean(b.SP()), a.m_Dir);
    }
}

GmLine::~GmLine() = default;

GmLine& GmLine::operator=(GmLine const& line) {
    if (this == &line) return *this;
    CopyCurvePart(line);
    m_SP = line.m_SP;
    m_Dir = line.m_Dir;
    return *this;
}

void GmLine::Define(GmPoint const& p, GmDir const& dir) {
    m_SP = p;
    m_Dir = dir;
    m_bCreationOK = true;
}

GmLine* GmLine::Clone() const {
    return new GmLine(*this);
}

GmRect GmLine::BoundingRect() const {
    return m_SP.BoundingRect();
}

void GmLine::Undefine() {
    GmCurve::Undefine();
    m_Dir = GmDir();
    m_SP = GmPoint();
}

void GmLine::Invert() {
    m_Dir = -m_Dir;
}

bool GmLine::Element(GmPoint const& p, double eps) const {
    return p.Dist(NP(p)) < eps;
}

bool GmLine::Element(GmPoint const& p) const {
    return Element(p, m_scdPrec);
}

double GmLine::Dist(GmPoint const& p) const {
    const gmkernel_detail::SlopeForm form = gmkernel_detail::slopeForm(plain(m_SP), plain(m_Dir));
    if (form.parallelToY) return std::fabs(p.X() - m_SP.X());
    return std::fabs(p.Y() - form.k * p.X() - form.d) / std::sqrt(form.k * form.k + 1.0);
}

double GmLine::DistSP(GmPoint const& p) const {
    return m_SP.Dist(p);
}

GmPoint GmLine::MinDist(GmPoint const& p, bool /*bPreferSP*/) const {
    const GmVec dir(m_Dir);
    const double t = (p - m_SP) * dir;
    return GmPoint(m_SP + t * dir);
}

GmPoint GmLine::SP() const {
    return m_SP;
}

GmPoint GmLine::NP(GmPoint const& p) const {
    return MinDist(p, false);
}

GmLine GmLine::Tangent(GmPoint const& /*p*/) const {
    return GmLine(*this);
}

GmCurve* GmLine::GetParallel(double d) const {
    return new GmLine(*this, d);
}

void GmLine::Translation(GmVec const& v) {
    m_SP.Translation(v);
}

void GmLine::Transform(GmMatrix const& /*m*/) {}

std::string GmLine::GetTraceString() const {
    return {};
}

GmDir const& GmLine::Dir() const {
    return m_Dir;
}

double GmLine::k() const {
    return gmkernel_detail::slopeForm(plain(m_SP), plain(m_Dir)).k;
}

double GmLine::d() const {
    return gmkernel_detail::slopeForm(plain(m_SP), plain(m_Dir)).d;
}

GmDir GmLine::Normal() const {
    return m_Dir.Normalized(eRotCW);
}

double GmLine::Dist(GmLine const& line) const {
    return GmParallelDir(m_Dir, line.m_Dir) ? Dist(line.SP()) : 0.0;
}

int GmLine::PointPos(GmPoint const& p) const {
    if (Element(p)) return 0;
    const double angle = m_Dir.RAngle(GmDir(p - NP(p)));
    return angle > 0.0 ? -1 : 1;
}

int GmLine::IntersectionWithLine(GmLine const& line) const {
    return gmkernel_detail::storeHits(gmkernel_detail::supportHits(*this, line), m_ptSol);
}

GmLine GmLine::Inverted() const {
    return GmLine(SP(), -m_Dir);
}

bool GmLine::operator==(GmLine const& line) const {
    if (this == &line) return true;
    return Element(line.SP()) && (m_Dir == line.m_Dir || m_Dir.Inverted() == line.m_Dir);
}
