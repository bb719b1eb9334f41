// SPDX-License-Identifier: MIT
/// @file
/// Angles in degrees, kept in (-180, 180].
///
/// Every operation brings its result back by whole turns. A few are taken off one by one, many by
/// the remainder, since stepping would then take for ever; neither rounds. Comparisons do not wrap
/// around: 180 and -179.999 are far apart.
#include "gmkernel/GmAngle.h"

#include <cmath>

#include "gmkernel/GmDir.h"
#include "gmkernel/GmRect.h"
#include "kernel/values/Angles.h"

GmAngle::GmAngle() : m_dAngle(0.0) {
    m_eType = eGmAngle;
}

GmAngle::GmAngle(GmAngle const& a)
    : GmBase(a),
      boost::totally_ordered<GmAngle,
                             boost::additive<GmAngle, boost::multiplicative<GmAngle, double>>>(a),
      m_dAngle(a.m_dAngle) {
    m_eType = eGmAngle;
}

GmAngle::GmAngle(double value, bool bRadiant) : m_dAngle(bRadiant ? ToDegree(value) : value) {
    m_eType = eGmAngle;
    m_bCreationOK = true;
    Standardize();
}

GmAngle::~GmAngle() = default;

GmAngle* GmAngle::Clone() const {
    return new GmAngle(*this);
}

GmRect GmAngle::BoundingRect() const {
    return GmRect();
}

GmAngle& GmAngle::operator=(GmAngle const& a) {
    GmBase::operator=(a);
    m_dAngle = a.m_dAngle;
    return *this;
}

GmAngle const& GmAngle::operator+=(GmAngle const& a) {
    m_dAngle += a.m_dAngle;
    Standardize();
    return *this;
}

GmAngle const& GmAngle::operator-=(GmAngle const& a) {
    m_dAngle -= a.m_dAngle;
    Standardize();
    return *this;
}

GmAngle const& GmAngle::operator*=(double f) {
    m_dAngle *= f;
    Standardize();
    return *this;
}

GmAngle const& GmAngle::operator/=(double f) {
    m_dAngle /= f;
    Standardize();
    return *this;
}

const GmAngle GmAngle::SkalarMult(double f) const {
    return *this * f;
}

GmAngle GmAngle::operator-() const {
    return GmAngle(-m_dAngle, false);
}

bool GmAngle::operator==(GmAngle const& a) const {
    if (this == &a) return true;
    return std::fabs(m_dAngle - a.m_dAngle) < m_scdPrecAng && GmBase::operator==(a);
}

bool GmAngle::operator<(GmAngle const& a) const {
    return m_dAngle < a.m_dAngle;
}

GmBase::eRotDir GmAngle::Rotation(GmAngle const& other) const {
    const double z = (GmDir(*this) % GmDir(other)).Z();
    if (z > 0.0) return eRotCCW;
    if (z < 0.0) return eRotCW;
    return eRotNone;
}

int GmAngle::QuadrantInt() const {
    if (m_dAngle >= 0.0) {
        if (m_dAngle < 90.0) return 0;
        return m_dAngle < 180.0 ? 1 : 2;
    }
    return m_dAngle < -90.0 ? 2 : 3;
}

GmBase::eQuadrant GmAngle::Quadrant() const {
    return static_cast<eQuadrant>(QuadrantInt() + 1);
}

double GmAngle::ToRadiant(double degrees) const {
    return gmkernel_detail::radiansOf(degrees);
}

double GmAngle::ToDegree(double radians) const {
    return gmkernel_detail::degreesOf(radians);
}

void GmAngle::Standardize() {
    m_dAngle = gmkernel_detail::standardizedDegrees(m_dAngle);
}

double GmAngle::Degree() const {
    return m_dAngle;
}

double GmAngle::Radiant() const {
    return ToRadiant(m_dAngle);
}
