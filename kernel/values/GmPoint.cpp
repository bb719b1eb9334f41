// SPDX-License-Identifier: MIT
#include "gmkernel/GmPoint.h"

#include <cmath>

#include "gmkernel/GmDir.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"

GmPoint::GmPoint() {
    m_eType = eGmPoint;
}

GmPoint::GmPoint(double x, double y) : GmPoint(x, y, 0.0) {}

GmPoint::GmPoint(double x, double y, double z) : GmVec(x, y, z) {
    m_eType = eGmPoint;
}

GmPoint::GmPoint(GmVec const& v) : GmVec(v) {
    m_eType = eGmPoint;
}

GmPoint::GmPoint(GmPoint const& p) : GmVec(p) {
    m_eType = eGmPoint;
}

GmPoint::GmPoint(GmPoint const& a, GmPoint const& b) : GmPoint() {
    if (a.CreationOK() && b.CreationOK()) GmVec::operator=((a + b) / 2.0);
}

GmPoint::GmPoint(GmPoint const& a, GmPoint const& b, GmPoint const& c) : GmPoint() {
    if (a.CreationOK() && b.CreationOK() && c.CreationOK()) GmVec::operator=(((a + b) + c) / 3.0);
}

GmPoint::~GmPoint() = default;

GmPoint* GmPoint::Clone() const {
    return new GmPoint(*this);
}

GmRect GmPoint::BoundingRect() const {
    return GmRect(*this, *this);
}

std::string GmPoint::GetTraceString() const {
    return "point " + GetRawTraceString();
}

GmPoint& GmPoint::operator=(GmPoint const& p) {
    GmVec::operator=(p);
    return *this;
}

double GmPoint::Dist(GmPoint const& p) const {
    return std::sqrt(Dist2(p));
}

double GmPoint::Dist2(GmPoint const& p) const {
    const double dx = p.m_dX - m_dX;
    const double dy = p.m_dY - m_dY;
    const double dz = p.m_dZ - m_dZ;
    return (dy * dy + dx * dx) + dz * dz;
}

GmDir GmPoint::Dir(GmPoint const& p) const {
    return GmDir(*this, p);
}

double GmPoint::DirDist(GmPoint const& p, GmDir const& d) const {
    const double dist = Dist(p);
    return Dir(p) == d ? dist : -dist;
}

double GmPoint::AngDist(GmPoint const& p, GmPoint const& c, GmBase::eRotDir rot) const {
    const double angle = (*this - c).DAngle(p - c, rot);
    return rot == eRotCW ? -angle : angle;
}

double GmPoint::AngDist(GmPoint const& p, GmPoint const& c) const {
    return std::fabs((*this - c).DAngle(p - c));
}

GmPoint GmPoint::Mean(GmPoint const& p) const {
    return GmPoint(*this, p);
}

GmPoint GmPoint::Mean(GmPoint const& p, GmPoint const& q) const {
    return GmPoint(*this, p, q);
}

void GmPoint::Translation(GmVec const& v) {
    m_dX += v.X();
    m_dY += v.Y();
    m_dZ += v.Z();
}

void GmPoint::Transform(GmMatrix const& m) {
    *this = GmPoint(m * *this);
}
