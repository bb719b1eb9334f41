// SPDX-License-Identifier: MIT
#include "gmkernel/GmRect.h"

#include <algorithm>
#include <cmath>

#include "gmkernel/GmLine.h"

namespace {

/// By how much rectangles may miss each other and still intersect, in length units.
constexpr double kOverlapTolerance = 1e-6;

/// The reference point, undefined for a value that names none.
GmPoint referencePoint(GmRect const& r, eGmRefPoint ref) {
    const double w = r.Width();
    const double h = r.Height();
    const GmPoint lt = r.LTPoint();
    const GmPoint rb = r.RBPoint();
    switch (ref) {
        case eRefCenter:
            return r.Center();
        case eRefTop:
            return lt + GmVec(w / 2.0, 0.0, 0.0);
        case eRefTopRight:
            return lt + GmVec(w, 0.0, 0.0);
        case eRefRight:
            return rb + GmVec(0.0, h / 2.0, 0.0);
        case eRefBottomRight:
            return rb;
        case eRefBottom:
            return rb - GmVec(w / 2.0, 0.0, 0.0);
        case eRefBottomLeft:
            return rb - GmVec(w, 0.0, 0.0);
        case eRefLeft:
            return lt - GmVec(0.0, h / 2.0, 0.0);
        case eRefTopLeft:
            return lt;
    }
    return GmPoint();
}

bool isReferencePoint(eGmRefPoint ref) {
    return ref >= eRefCenter && ref <= eRefTopLeft;
}

}  // namespace

GmRect::GmRect() {
    m_eType = eGmRect;
}

GmRect::GmRect(GmPoint const& a, GmPoint const& b) {
    Init(a, b);
}

GmRect::GmRect(double x1, double y1, double x2, double y2) {
    Init(GmPoint(x1, y1), GmPoint(x2, y2));
}

GmRect::GmRect(GmPoint const& p, double w, double h) {
    Init(p, GmPoint(p.X() + w, p.Y() + h));
}

GmRect::GmRect(GmRect const& r, double d) : GmRect() {
    if (!r.CreationOK()) return;
    Init(GmPoint(r.Left() - d, r.Top() + d), GmPoint(r.Right() + d, r.Bottom() - d));
}

GmRect::GmRect(GmRect const& r)
    : GmCurve(r), boost::totally_ordered<GmRect>(r), m_ptLT(r.m_ptLT), m_ptRB(r.m_ptRB) {
    m_eType = eGmRect;
}

GmRect::~GmRect() = default;

GmRect* GmRect::Clone() const {
    return new GmRect(*this);
}

GmRect GmRect::BoundingRect() const {
    return *this;
}

void GmRect::Init(GmPoint const& a, GmPoint const& b) {
    m_eType = eGmRect;
    if (!a.CreationOK() || !b.CreationOK()) {
        GmRect::Undefine();
        return;
    }
    m_ptLT = GmPoint(std::min(a.X(), b.X()), std::max(a.Y(), b.Y()));
    m_ptRB = GmPoint(std::max(a.X(), b.X()), std::min(a.Y(), b.Y()));
    m_bCreationOK = true;
}

void GmRect::Undefine() {
    GmCurve::Undefine();
    m_ptLT = GmPoint();
    m_ptRB = GmPoint();
}

bool GmRect::Element(GmPoint const& p, double t) const {
    const double x = p.X();
    const double y = p.Y();
    if (std::fabs(x - Right()) < t || std::fabs(x - Left()) < t) {
        return Bottom() <= y && y <= Top();
    }
    if (std::fabs(y - Top()) < t || std::fabs(y - Bottom()) < t) {
        return Left() <= x && x <= Right();
    }
    return false;
}

bool GmRect::Element(GmPoint const& p) const {
    return Element(p, m_scdPrec);
}

double GmRect::Dist(GmPoint const&) const {
    return 0.0;
}

GmPoint GmRect::MinDist(GmPoint const&, bool) const {
    return GmPoint();
}

bool GmRect::In(GmPoint const& p) {
    return Left() < p.X() && p.X() < Right() && Bottom() < p.Y() && p.Y() < Top();
}

bool GmRect::Out(GmPoint const& p) {
    return p.X() < Left() || p.X() > Right() || p.Y() < Bottom() || p.Y() > Top();
}

GmPoint GmRect::NP(GmPoint const&) const {
    return GmPoint();
}

GmLine GmRect::Tangent(GmPoint const&) const {
    return GmLine();
}

GmCurve* GmRect::GetParallel(double d) const {
    return new GmRect(*this, d);
}

void GmRect::Translation(GmVec const& v) {
    Move(v);
}

void GmRect::Transform(GmMatrix const&) {}

std::string GmRect::GetTraceString() const {
    return std::string();
}

GmRect& GmRect::operator=(GmRect const& r) {
    GmBase::operator=(r);
    m_ptLT = r.m_ptLT;
    m_ptRB = r.m_ptRB;
    return *this;
}

bool GmRect::operator==(GmRect const& r) const {
    if (this == &r) return true;
    return m_ptLT == r.m_ptLT && m_ptRB == r.m_ptRB;
}

bool GmRect::operator<(GmRect const& r) const {
    return Width() < r.Width() && Height() < r.Height();
}

double GmRect::Width() const {
    return std::fabs(Right() - Left());
}

double GmRect::Height() const {
    return std::fabs(Bottom() - Top());
}

double GmRect::MinDim() const {
    return std::min(Width(), Height());
}

double GmRect::MaxDim() const {
    return std::max(Width(), Height());
}

double GmRect::Diagonal() const {
    return m_ptLT.Dist(m_ptRB);
}

GmPoint GmRect::Center() const {
    return (m_ptLT + m_ptRB) / 2.0;
}

GmPoint GmRect::PMin() const {
    return GmPoint(std::min(Left(), Right()), std::min(Top(), Bottom()));
}

GmPoint GmRect::PMax() const {
    return GmPoint(std::max(Left(), Right()), std::max(Top(), Bottom()));
}

GmRect GmRect::And(GmRect const& r) const {
    if (!CreationOK() || !r.CreationOK()) return GmRect();
    const double left = std::max(Left(), r.Left());
    const double right = std::min(Right(), r.Right());
    const double bottom = std::max(Bottom(), r.Bottom());
    const double top = std::min(Top(), r.Top());
    if (right - left <= -kOverlapTolerance || top - bottom <= -kOverlapTolerance) return GmRect();
    return GmRect(GmPoint(left, top), GmPoint(right, bottom));
}

GmRect GmRect::Or(GmRect const& r) const {
    if (!CreationOK()) return r;
    if (!r.CreationOK()) return *this;
    return GmRect(GmPoint(std::min(Left(), r.Left()), std::max(Top(), r.Top())),
                  GmPoint(std::max(Right(), r.Right()), std::min(Bottom(), r.Bottom())));
}

void GmRect::Include(GmPoint const& p) {
    if (!p.CreationOK()) return;
    if (!CreationOK()) {
        m_ptLT = p;
        m_ptRB = p;
        m_bCreationOK = true;
        return;
    }
    if (p.X() < Left()) Left(p.X());
    if (p.Y() > Top()) Top(p.Y());
    if (p.X() > Right()) Right(p.X());
    if (p.Y() < Bottom()) Bottom(p.Y());
}

void GmRect::Stretch(GmPoint const& p, double f) {
    // Both images first: p may be one of the corners.
    const GmPoint lt = p + (m_ptLT - p) * f;
    const GmPoint rb = p + (m_ptRB - p) * f;
    m_ptLT = lt;
    m_ptRB = rb;
}

void GmRect::Shrink(GmPoint const& p, double f) {
    Stretch(p, 1.0 / f);
}

void GmRect::Stretch(eGmRefPoint ref, double f) {
    if (isReferencePoint(ref)) Stretch(referencePoint(*this, ref), f);
}

void GmRect::Shrink(eGmRefPoint ref, double f) {
    Stretch(ref, 1.0 / f);
}

void GmRect::StretchX(eGmRefPoint ref, double f) {
    const double growth = (f - 1.0) * Width();
    switch (ref) {
        case eRefCenter:
        case eRefTop:
        case eRefBottom:
            Left(Left() - growth / 2.0);
            Right(Right() + growth / 2.0);
            break;
        case eRefTopRight:
        case eRefRight:
        case eRefBottomRight:
            Left(Left() - growth);
            break;
        case eRefBottomLeft:
        case eRefLeft:
        case eRefTopLeft:
            Right(Right() + growth);
            break;
    }
}

void GmRect::StretchY(eGmRefPoint ref, double f) {
    const double growth = (f - 1.0) * Height();
    switch (ref) {
        case eRefCenter:
        case eRefRight:
        case eRefLeft:
            Top(Top() + growth / 2.0);
            Bottom(Bottom() - growth / 2.0);
            break;
        case eRefTop:
        case eRefTopRight:
        case eRefTopLeft:
            Bottom(Bottom() - growth);
            break;
        case eRefBottomRight:
        case eRefBottom:
        case eRefBottomLeft:
            Top(Top() + growth);
            break;
    }
}

void GmRect::Move(GmVec const& v) {
    m_ptLT.Translation(v);
    m_ptRB.Translation(v);
}

double GmRect::Left() const {
    return m_ptLT.X();
}

double GmRect::Right() const {
    return m_ptRB.X();
}

double GmRect::Top() const {
    return m_ptLT.Y();
}

double GmRect::Bottom() const {
    return m_ptRB.Y();
}

void GmRect::Left(double x) {
    m_ptLT.X(x);
}

void GmRect::Right(double x) {
    m_ptRB.X(x);
}

void GmRect::Top(double y) {
    m_ptLT.Y(y);
}

void GmRect::Bottom(double y) {
    m_ptRB.Y(y);
}

GmPoint& GmRect::LTPoint() {
    return m_ptLT;
}

GmPoint& GmRect::RBPoint() {
    return m_ptRB;
}

GmPoint GmRect::LTPoint() const {
    return m_ptLT;
}

GmPoint GmRect::RBPoint() const {
    return m_ptRB;
}
