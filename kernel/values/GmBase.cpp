// SPDX-License-Identifier: MIT
#include "gmkernel/GmBase.h"

// Literals, so that the values stand before any initialisation code of another file runs.
const double GmBase::m_scdPrec = 1e-4;
const double GmBase::m_scdPrecAng = 0.01;
const double GmBase::m_scdPrecAngRad = 1.7453292519943296e-4;
const double GmBase::m_scdPrecCalc = 1e-7;
const double GmBase::m_scdPrecSqr = 1e-8;

GmBase::GmBase() : m_bCreationOK(false), m_eType(eGmNoType) {}

GmBase::GmBase(GmBase const& other)
    : boost::equality_comparable<GmBase>(other),
      m_bCreationOK(other.m_bCreationOK),
      m_eType(other.m_eType) {}

GmBase::~GmBase() = default;

void GmBase::Undefine() {
    m_bCreationOK = false;
}

GmBase& GmBase::operator=(GmBase const& other) {
    m_eType = other.m_eType;
    m_bCreationOK = other.m_bCreationOK;
    return *this;
}

bool GmBase::operator==(GmBase const& other) const {
    return m_eType == other.m_eType;
}

GmBase::eGmTypes GmBase::GetType() const {
    return m_eType;
}

bool GmBase::CreationOK() const {
    return m_bCreationOK;
}

bool GmBase::IsVec() const {
    return m_eType == eGmVec;
}

bool GmBase::IsDir() const {
    return m_eType == eGmDir;
}

bool GmBase::IsAngle() const {
    return m_eType == eGmAngle;
}

bool GmBase::IsPoint() const {
    return m_eType == eGmPoint;
}

bool GmBase::IsRect() const {
    return m_eType == eGmRect;
}

bool GmBase::IsLine() const {
    return m_eType == eGmLine;
}

bool GmBase::IsCircle() const {
    return m_eType == eGmCircle;
}

bool GmBase::IsStretch() const {
    return m_eType == eGmStretch;
}

bool GmBase::IsBeam() const {
    return m_eType == eGmBeam;
}

bool GmBase::IsArc() const {
    return m_eType == eGmArc;
}

bool GmBase::IsHelix() const {
    return m_eType == eGmHelix;
}

bool GmBase::IsContour() const {
    return m_eType == eGmContour;
}

bool GmBase::IsCurve() const {
    return m_eType >= eGmCurve;
}
