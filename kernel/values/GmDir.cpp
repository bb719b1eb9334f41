// SPDX-License-Identifier: MIT
#include "gmkernel/GmDir.h"

#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/GmRect.h"

GmDir::GmDir() {
    m_eType = eGmDir;
}

GmDir::GmDir(double x, double y) : GmDir(x, y, 0.0) {}

GmDir::GmDir(double x, double y, double z) : GmDir(GmVec(x, y, z)) {}

GmDir::GmDir(GmVec const& v) : m_vec(v) {
    m_eType = eGmDir;
    m_bCreationOK = v.CreationOK();
    m_vec.Standardize();
}

GmDir::GmDir(GmDir const& d)
    : GmBase(d),
      boost::equality_comparable<GmDir,
                                 boost::equality_comparable<GmDir, GmVec, boost::addable<GmDir>>>(
          d),
      m_vec(d.m_vec) {
    m_eType = eGmDir;
    m_bCreationOK = m_vec.CreationOK();
}

GmDir::GmDir(GmPoint const& a, GmPoint const& b) : GmDir(GmVec(a, b)) {}

GmDir::GmDir(GmAngle const& a) : GmDir() {
    if (!a.CreationOK()) return;
    const double r = a.Radiant();
    m_vec = GmVec(std::cos(r), std::sin(r), 0.0);
    m_bCreationOK = true;
}

GmDir::~GmDir() = default;

GmDir* GmDir::Clone() const {
    return new GmDir(*this);
}

GmRect GmDir::BoundingRect() const {
    return m_vec.BoundingRect();
}

void GmDir::Undefine() {
    GmBase::Undefine();
    m_vec = GmVec();
}

double GmDir::X() const {
    return m_vec.X();
}

void GmDir::X(double x) {
    m_vec.X(x);
    m_vec.Standardize();
}

double GmDir::Y() const {
    return m_vec.Y();
}

void GmDir::Y(double y) {
    m_vec.Y(y);
    m_vec.Standardize();
}

double GmDir::Z() const {
    return m_vec.Z();
}

void GmDir::Z(double z) {
    m_vec.Z(z);
    m_vec.Standardize();
}

double GmDir::k() const {
    return m_vec.k();
}

void GmDir::Normalize(GmBase::eRotDir rot) {
    m_vec.Normalize(rot);
}

void GmDir::Invert() {
    m_vec.Invert();
}

void GmDir::Rotate(GmAngle const& a) {
    m_vec.Rotate(a);
}

GmAngle GmDir::Angle(GmDir const& d) const {
    return m_vec.Angle(d.m_vec);
}

GmAngle GmDir::Angle() const {
    return m_vec.Angle();
}

double GmDir::DAngle(GmDir const& d, GmBase::eRotDir rot) const {
    return m_vec.DAngle(d.m_vec, rot);
}

double GmDir::DAngle(GmDir const& d) const {
    return m_vec.DAngle(d.m_vec);
}

double GmDir::DAngle() const {
    return m_vec.DAngle();
}

double GmDir::RAngle(GmDir const& d, GmBase::eRotDir rot) const {
    return m_vec.RAngle(d.m_vec, rot);
}

double GmDir::RAngle(GmDir const& d) const {
    return m_vec.RAngle(d.m_vec);
}

double GmDir::RAngle() const {
    return m_vec.RAngle();
}

GmDir& GmDir::operator=(GmDir const& d) {
    GmBase::operator=(d);
    m_vec = d.m_vec;
    return *this;
}

bool GmDir::operator==(GmDir const& d) const {
    if (this == &d) return true;
    return GmBase::operator==(d) && m_vec.equals(d.m_vec, m_scdPrec / 100.0);
}

bool GmDir::operator==(GmVec const& v) const {
    return *this == GmDir(v);
}

GmDir const& GmDir::operator+=(GmDir const& d) {
    m_vec += d.m_vec;
    m_vec.Standardize();
    return *this;
}

const GmDir GmDir::operator%(GmDir const& d) const {
    return GmDir(m_vec % d.m_vec);
}

GmDir GmDir::Sym(GmDir const& d) const {
    return GmDir(X() + d.X(), Y() + d.Y(), Z() + d.Z());
}

GmDir GmDir::operator-() const {
    return GmDir(m_vec.Inverted());
}

GmDir GmDir::Inverted() const {
    return GmDir(m_vec.Inverted());
}

GmDir GmDir::Normalized(GmBase::eRotDir rot) const {
    return GmDir(m_vec.Normalized(rot));
}

GmDir GmDir::Rotated(GmAngle const& a) const {
    return GmDir(m_vec.Rotated(a));
}

int GmDir::Quadrant() const {
    return m_vec.Quadrant();
}

int GmDir::Quadrant13() const {
    return m_vec.Quadrant13();
}

int GmDir::Quadrant24() const {
    return m_vec.Quadrant24();
}

std::string GmDir::GetTraceString() const {
    return "dir " + m_vec.GetRawTraceString();
}

bool GmParallelDir(GmDir const& a, GmDir const& b) {
    return a == b || a == b.Inverted();
}
