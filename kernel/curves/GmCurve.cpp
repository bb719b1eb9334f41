// SPDX-License-Identifier: MIT
/// @file
/// What all curves share: the solution list and two general searches for nearest points.
///
/// Nearest points are sought among the ends, their foot points on the other curve and, for round
/// curves, the points that face it. Where one of the curves is nearest at an end, that is exact;
/// between inner points of two round curves it is a choice of candidates that can miss the nearest
/// pair. Crossings are not looked for. A later candidate wins only when strictly nearer. Constant
/// cost but for contours, which search their elements.
#include "gmkernel/GmCurve.h"

#include <cmath>
#include <limits>

#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmRect.h"
#include "kernel/curves/VerifiedCast.h"

GmCurve::GmCurve() {
    m_eType = eGmCurve;
}

GmCurve::GmCurve(GmCurve const& other)
    : GmBase(other), boost::equality_comparable<GmCurve>(other), m_ptSol(other.m_ptSol) {}

GmCurve::~GmCurve() = default;

GmCurve& GmCurve::operator=(GmCurve const& other) {
    Copy(other);
    return *this;
}

void GmCurve::Copy(GmCurve const& other) {
    if (this == &other) return;
    m_eType = other.m_eType;
    CopyCurvePart(other);
}

void GmCurve::CopyCurvePart(GmCurve const& other) {
    m_bCreationOK = other.m_bCreationOK;
    CopyPtSol(other);
}

void GmCurve::CopyPtSol(GmCurve const& other) const {
    if (this != &other) m_ptSol = other.m_ptSol;
}

GmRect GmCurve::BoundingRect() const {
    return GmRect();
}

void GmCurve::Undefine() {
    GmBase::Undefine();
}

int GmCurve::Intersection(GmCurve const* other) const {
    if (other == nullptr) {
        m_ptSol.clear();
    } else {
        ::Intersection(*this, *other, m_ptSol);
    }
    return static_cast<int>(m_ptSol.size());
}

GmPoint GmCurve::GetSolution(unsigned int i) const {
    return i < m_ptSol.size() ? m_ptSol[i] : GmPoint(0.0, 0.0, 0.0);
}

std::vector<GmPoint> const& GmCurve::GetPtSol() const {
    return m_ptSol;
}

bool GmCurve::Trim(GmCurve* /*next*/) {
    return false;
}
GmCurve* GmCurve::Concat(GmCurve const& /*next*/, int /*mode*/) {
    return nullptr;
}
bool GmCurve::Concat(GmCurve const& /*next*/) {
    return false;
}
void GmCurve::Invert() {}

double GmCurve::DistSP(GmPoint const& /*p*/) const {
    return std::numeric_limits<double>::max();
}

GmPoint GmCurve::MinDist(double& d, GmPoint const& p, bool bPreferSP) const {
    const GmPoint start = SP();
    GmPoint best = start;
    if (start.CreationOK()) d = start.Dist2(p);

    const auto offer = [&](GmPoint const& candidate) {
        if (candidate.CreationOK()) CheckDist(d, best, candidate, p);
    };
    offer(NP(p));
    if (!bPreferSP) offer(EP());

    d = std::sqrt(std::fabs(d));
    return best;
}

GmPoint GmCurve::MinDist(double& d, GmCurve const* c, bool bPreferSP) const {
    if (c == nullptr) return GmPoint();
    const GmPoint start = SP();
    GmPoint best = start;
    GmPoint startOfOther;
    GmPoint endOfOther;
    const auto offerFoot = [&](GmPoint const& reference) {
        const GmPoint foot = NP(reference);
        if (foot.CreationOK()) CheckDist(d, best, foot, reference);
    };

    if (start.CreationOK()) {
        startOfOther = c->SP();
        d = startOfOther.CreationOK() ? start.Dist2(startOfOther)
                                      : std::numeric_limits<double>::max();
        CheckDist(d, best, start, c->NP(start));
        if (!bPreferSP) {
            endOfOther = c->EP();
            CheckDist(d, best, start, endOfOther);
        }
    }
    offerFoot(startOfOther);
    if (!bPreferSP) {
        offerFoot(endOfOther);
        const GmPoint end = EP();
        if (end.CreationOK()) {
            CheckDist(d, best, end, startOfOther);
            CheckDist(d, best, end, c->NP(end));
            CheckDist(d, best, end, endOfOther);
        }
    }
    if (GmCircle const* circle = gmkernel_detail::roundPart(*this)) {
        const GmPoint facing = circle->NP(c);
        if (facing.CreationOK()) CheckDist(d, best, facing, c->NP(facing));
    }
    if (GmCircle const* circle = gmkernel_detail::roundPart(*c)) {
        const GmPoint facing = circle->NP(this);
        if (facing.CreationOK()) offerFoot(facing);
    }
    d = std::sqrt(std::fabs(d));
    return best;
}

bool GmCurve::In(GmPoint const& /*p*/) {
    return false;
}
bool GmCurve::Out(GmPoint const& /*p*/) {
    return false;
}
void GmCurve::SetSP(GmPoint const& /*p*/) {}
void GmCurve::SetEP(GmPoint const& /*p*/) {}
GmPoint GmCurve::SP() const {
    return GmPoint();
}
GmPoint GmCurve::EP() const {
    return GmPoint();
}
GmDir GmCurve::TangSP() const {
    return GmDir();
}
GmDir GmCurve::TangEP() const {
    return GmDir();
}
double GmCurve::Length() const {
    return 0.0;
}

// Pure, with an empty body that derived classes may use.
void GmCurve::Transform(GmMatrix const& /*m*/) {}

bool GmCurve::operator==(GmCurve const& other) const {
    return this == &other || m_ptSol == other.m_ptSol;
}

void GmCurve::CheckDist(double& d, GmPoint& best, GmPoint const& p, GmPoint const& q) const {
    if (!q.CreationOK()) return;
    const double candidate = p.Dist2(q);
    if (candidate < d || !best.CreationOK()) {
        d = candidate;
        best = p;
    }
}

less_than_curve::less_than_curve(GmCurve const* curve) : m_pCurve(curve) {}

bool less_than_curve::operator()(GmPoint const& a, GmPoint const& b) const {
    return m_pCurve->DistSP(a) < m_pCurve->DistSP(b);
}

point_is_element::point_is_element(GmCurve const* curve) : m_pCurve(curve) {}

bool point_is_element::operator()(GmPoint p) const {
    return m_pCurve->Element(p);
}
