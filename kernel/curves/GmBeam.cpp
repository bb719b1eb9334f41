// SPDX-License-Identifier: MIT
#include "gmkernel/GmBeam.h"

GmBeam::GmBeam() {
    m_eType = eGmBeam;
}

GmBeam::GmBeam(GmBeam const& beam) : GmLine(beam), boost::equality_comparable<GmBeam>(beam) {
    m_eType = eGmBeam;
}

GmBeam::GmBeam(GmPoint const& p1, GmPoint const& p2) : GmLine(p1, p2) {
    m_eType = eGmBeam;
}

GmBeam::GmBeam(GmPoint const& p, GmDir const& dir) : GmBeam() {
    if (p.CreationOK() && dir.CreationOK()) Define(p, dir);
}

GmBeam::GmBeam(GmBeam const& beam, double d) : GmBeam() {
    Define(GmPoint(beam.SP() + d * GmVec(beam.Normal())), beam.m_Dir);
    m_bCreationOK = beam.m_bCreationOK;
}

GmBeam::~GmBeam() = default;

GmBeam& GmBeam::operator=(GmBeam const& beam) {
    GmLine::operator=(beam);
    return *this;
}

GmBeam* GmBeam::Clone() const {
    return new GmBeam(*this);
}

void GmBeam::Invert() {
    m_Dir.Invert();
}

bool GmBeam::Element(GmPoint const& p, double eps) const {
    const GmPoint foot = GmLine::MinDist(p, false);
    const bool near = foot.Dist(p) < eps;
    return near && (foot == m_SP || GmDir(SP(), foot) == m_Dir);
}

GmPoint GmBeam::MinDist(GmPoint const& p, bool /*bPreferSP*/) const {
    const GmPoint foot = GmLine::MinDist(p, false);
    return Element(foot) ? foot : m_SP;
}

void GmBeam::SetSP(GmPoint const& p) {
    m_SP = p;
}

GmDir GmBeam::TangSP() const {
    return m_Dir;
}

GmBeam GmBeam::Inverted() const {
    return GmBeam(SP(), m_Dir.Inverted());
}

bool GmBeam::operator==(GmBeam const& beam) const {
    if (this == &beam) return true;
    return Element(beam.SP()) && m_Dir == beam.m_Dir && GmBase::operator==(beam);
}
