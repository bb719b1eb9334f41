// SPDX-License-Identifier: MIT
/// @file
/// Vectors, their angles and quadrants.
#include "gmkernel/GmVec.h"

#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/GmRect.h"
#include "kernel/values/Angles.h"
#include "kernel/values/TraceText.h"

using gmkernel_detail::plain;

namespace {

bool nearZero(double component) {
    return std::fabs(component) < GmBase::m_scdPrec;
}

}  // namespace

GmVec::GmVec() : m_dX(0.0), m_dY(0.0), m_dZ(0.0) {
    m_eType = eGmVec;
}

GmVec::GmVec(double x, double y, double z) : m_dX(x), m_dY(y), m_dZ(z) {
    m_eType = eGmVec;
    m_bCreationOK = true;
}

GmVec::GmVec(GmVec const& v)
    : GmBase(v),
      boost::totally_ordered<GmVec, boost::additive<GmVec, boost::multiplicative<GmVec, double>>>(
          v),
      m_dX(v.m_dX),
      m_dY(v.m_dY),
      m_dZ(v.m_dZ) {
    m_eType = eGmVec;
}

GmVec::GmVec(GmPoint const& a, GmPoint const& b) : GmVec() {
    if (!a.CreationOK() || !b.CreationOK()) return;
    m_dX = b.m_dX - a.m_dX;
    m_dY = b.m_dY - a.m_dY;
    m_dZ = b.m_dZ - a.m_dZ;
    m_bCreationOK = true;
}

GmVec::GmVec(GmDir const& d) : m_dX(d.X()), m_dY(d.Y()), m_dZ(d.Z()) {
    m_eType = eGmVec;
    m_bCreationOK = d.CreationOK();
}

GmVec::~GmVec() = default;

GmVec* GmVec::Clone() const {
    return new GmVec(*this);
}

GmRect GmVec::BoundingRect() const {
    return GmRect();
}

void GmVec::Undefine() {
    GmBase::Undefine();
    m_dX = m_dY = m_dZ = 0.0;
}

void GmVec::Normalize(GmBase::eRotDir rot) {
    const double x = m_dX;
    if (rot == eRotCCW) {
        m_dX = -m_dY;
        m_dY = x;
    } else {
        m_dX = m_dY;
        m_dY = -x;
    }
}

void GmVec::Invert() {
    m_dX = -m_dX;
    m_dY = -m_dY;
    m_dZ = -m_dZ;
}

double GmVec::k() const {
    return m_dX == 0.0 ? 0.0 : m_dY / m_dX;
}

double GmVec::Length() const {
    return std::sqrt(*this * *this);
}

double GmVec::Norm() const {
    return *this * *this;
}

GmAngle GmVec::Angle(GmVec const& w) const {
    return GmAngle(gmkernel_detail::degreesBetween(plain(*this), plain(w)), false);
}

GmAngle GmVec::Angle() const {
    return GmAngle(RAngle(), true);
}

double GmVec::DAngle(GmVec const& w, GmBase::eRotDir rot) const {
    return gmkernel_detail::degreesBetween(plain(*this), plain(w), rot);
}

double GmVec::DAngle(GmVec const& w) const {
    return Angle(w).Degree();
}

double GmVec::DAngle() const {
    return gmkernel_detail::polarDegreesOfTangent(plain(*this));
}

double GmVec::RAngle(GmVec const& w, GmBase::eRotDir rot) const {
    return gmkernel_detail::radiansOf(DAngle(w, rot));
}

double GmVec::RAngle(GmVec const& w) const {
    return Angle(w).Radiant();
}

double GmVec::RAngle() const {
    return gmkernel_detail::polarRadians(plain(*this));
}

void GmVec::Rotate(GmAngle const& a) {
    // A positive angle about the downward axis turns the x-y plane counter-clockwise.
    GmMatrix m;
    m.Rotate(GmVec(0.0, 0.0, -1.0), a.Degree());
    Transform(m);
}

std::string GmVec::GetTraceString() const {
    return "vec " + GetRawTraceString();
}

GmVec& GmVec::operator=(GmVec const& v) {
    m_dX = v.m_dX;
    m_dY = v.m_dY;
    m_dZ = v.m_dZ;
    m_bCreationOK = v.m_bCreationOK;
    return *this;
}

double GmVec::operator[](int i) const {
    switch (i) {
        case 0:
            return m_dX;
        case 1:
            return m_dY;
        case 2:
            return m_dZ;
        default:
            return 0.0;
    }
}

GmVec GmVec::operator%(GmVec const& w) const {
    return GmVec(m_dY * w.m_dZ - m_dZ * w.m_dY, m_dZ * w.m_dX - m_dX * w.m_dZ,
                 m_dX * w.m_dY - m_dY * w.m_dX);
}

GmVec const& GmVec::operator+=(GmVec const& w) {
    m_dX += w.m_dX;
    m_dY += w.m_dY;
    m_dZ += w.m_dZ;
    return *this;
}

GmVec const& GmVec::operator-=(GmVec const& w) {
    m_dX -= w.m_dX;
    m_dY -= w.m_dY;
    m_dZ -= w.m_dZ;
    return *this;
}

GmVec const& GmVec::operator*=(double f) {
    m_dX *= f;
    m_dY *= f;
    m_dZ *= f;
    return *this;
}

GmVec const& GmVec::operator/=(double f) {
    m_dX /= f;
    m_dY /= f;
    m_dZ /= f;
    return *this;
}

const GmVec GmVec::SkalarMult(double f) const {
    return *this * f;
}

GmVec GmVec::operator-() const {
    return Inverted();
}

bool GmVec::equals(GmVec const& w, double eps) const {
    if (this == &w) return true;
    return GmBase::operator==(w) && std::fabs(m_dX - w.m_dX) < eps &&
           std::fabs(m_dY - w.m_dY) < eps && std::fabs(m_dZ - w.m_dZ) < eps;
}

bool GmVec::operator==(GmVec const& w) const {
    return equals(w, m_scdPrec);
}

bool GmVec::operator<(GmVec const& w) const {
    return Length() < w.Length() - m_scdPrec;
}

void GmVec::Standardize() {
    const double length = Length();
    if (length != 0.0) *this /= length;
}

GmVec GmVec::Standardized() const {
    const double length = Length();
    if (length == 0.0) return GmVec(m_dX, m_dY, m_dZ);
    return GmVec(m_dX / length, m_dY / length, m_dZ / length);
}

GmVec GmVec::Standardized() {
    return static_cast<GmVec const&>(*this).Standardized();
}

GmVec GmVec::Normalized(GmBase::eRotDir rot) const {
    GmVec normal(*this);
    normal.Normalize(rot);
    return normal;
}

GmVec GmVec::Inverted() const {
    GmVec inverse(*this);
    inverse.Invert();
    return inverse;
}

GmVec GmVec::Rotated(GmAngle const& a) const {
    GmVec rotated(*this);
    rotated.Rotate(a);
    return rotated;
}

int GmVec::Quadrant() const {
    if (nearZero(m_dX) || nearZero(m_dY)) return -1;
    if (m_dY > 0.0) return m_dX > 0.0 ? 0 : 1;
    return m_dX < 0.0 ? 2 : 3;
}

// The tolerance acts on the non-positive side of x only: a tiny positive x counts as positive.
int GmVec::Quadrant13() const {
    if (m_dX > 0.0) return m_dY >= 0.0 ? 0 : 3;
    if (m_dX > -m_scdPrec) return m_dY >= 0.0 ? 0 : 2;
    return m_dY > 0.0 ? 1 : 2;
}

int GmVec::Quadrant24() const {
    if (m_dX > 0.0) return m_dY > 0.0 ? 0 : 3;
    if (m_dX > -m_scdPrec) return m_dY >= 0.0 ? 1 : 3;
    return m_dY >= 0.0 ? 1 : 2;
}

void GmVec::Transform(GmMatrix const& m) {
    *this = m * *this;
}

std::string GmVec::GetRawTraceString() const {
    return gmkernel_detail::coordinatesText(m_dX, m_dY, m_dZ);
}

void SetCoordByIndex(GmVec& v, int i, double value) {
    switch (i) {
        case 0:
            v.X(value);
            break;
        case 1:
            v.Y(value);
            break;
        case 2:
            v.Z(value);
            break;
        default:
            break;
    }
}

double& GmVec::X() {
    return m_dX;
}

void GmVec::X(double x) {
    m_dX = x;
}

double GmVec::X() const {
    return m_dX;
}

double& GmVec::Y() {
    return m_dY;
}

void GmVec::Y(double y) {
    m_dY = y;
}

double GmVec::Y() const {
    return m_dY;
}

double& GmVec::Z() {
    return m_dZ;
}

void GmVec::Z(double z) {
    m_dZ = z;
}

double GmVec::Z() const {
    return m_dZ;
}

double GmVec::operator*(GmVec const& w) const {
    return dot(plain(*this), plain(w));
}
