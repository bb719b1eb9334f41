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
