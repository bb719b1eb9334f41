// SPDX-License-Identifier: MIT
#include "Answer.h"

#include <cmath>
#include <cstring>
#include <memory>
#include <ostream>
#include <sstream>

namespace net {

namespace {

std::string Hex(double value) {
    std::ostringstream text;
    text << std::hexfloat << value << std::defaultfloat << " (" << value << ")";
    return text.str();
}

std::string Hex(GmVec const& v) {
    return Hex(v.X()) + ", " + Hex(v.Y()) + ", " + Hex(v.Z()) +
           (v.CreationOK() ? "" : " undefined");
}

}  // namespace

void Answer::Begin(std::string const& family, long index) {
    if (m_pText) *m_pText << family << ' ' << index << std::endl;
}

void Answer::BeginQuestion(char const* name) {
    if (m_pText) *m_pText << "  " << name << std::endl;
    m_pTally = &m_tallies[name];
    m_bFound = false;
}

void Answer::EndQuestion() {
    ++m_pTally->asked;
    if (m_bFound) ++m_pTally->answered;
}

void Answer::ResetHash() {
    m_nHash = kOffsetBasis;
}

void Answer::Mix(void const* bytes, std::size_t count) {
    constexpr std::uint64_t kPrime = 0x100000001B3U;
    unsigned char const* byte = static_cast<unsigned char const*>(bytes);
    for (std::size_t i = 0; i < count; ++i)
        m_nHash = (m_nHash ^ byte[i]) * kPrime;
}

void Answer::MixNumber(double value) {
    constexpr std::uint64_t kNaN = 0x7FF8000000000000U;
    std::uint64_t bits = kNaN;
    if (!std::isnan(value)) std::memcpy(&bits, &value, sizeof bits);
    Mix(&bits, sizeof bits);
}

void Answer::MixPoint(GmVec const& v) {
    const int tag = v.GetType() + (v.CreationOK() ? 0 : -1000);
    Mix(&tag, sizeof tag);
    MixNumber(v.X());
    MixNumber(v.Y());
    MixNumber(v.Z());
}

void Answer::Line(char const* name, std::string const& text) {
    *m_pText << "    " << name << " = " << text << '\n';
}

void Answer::Add(char const* name, double value) {
    MixNumber(value);
    Found(value != 0.0 && std::isfinite(value));
    if (m_pText) Line(name, Hex(value));
}

void Answer::Add(char const* name, bool value) {
    Add(name, value ? 1L : 0L);
}

void Answer::Add(char const* name, long value) {
    Mix(&value, sizeof value);
    Found(value > 0);
    if (m_pText) Line(name, std::to_string(value));
}

void Answer::Add(char const* name, std::string const& text) {
    Mix(text.data(), text.size());
    if (m_pText) Line(name, text);
}

void Answer::Add(char const* name, GmVec const& v) {
    MixPoint(v);
    Found(v.CreationOK());
    if (m_pText) Line(name, Hex(v));
}

void Answer::Add(char const* name, GmDir const& d) {
    MixPoint(GmVec(d));
    Found(d.CreationOK());
    if (m_pText) Line(name, Hex(GmVec(d)));
}

void Answer::Add(char const* name, GmAngle const& a) {
    Add(name, a.Degree());
    Add("defined", a.CreationOK());
}

void Answer::Add(char const* name, GmMatrix const& m) {
    constexpr int kValues = 16;
    for (int i = 0; i < kValues; ++i)
        Add(name, m[i]);
}

void Answer::Add(char const* name, GmCurve const& c) {
    const bool bFoundBefore = m_bFound;
    Add(name, static_cast<long>(c.GetType()));
    Add("created", c.CreationOK());
    AddFields(c);
    const bool bEmpty = c.IsContour() && static_cast<GmContour const&>(c).ElementCount() == 0;
    m_bFound = bFoundBefore || (c.CreationOK() && !bEmpty);
}

void Answer::AddFields(GmCurve const& c) {
    if (c.IsContour()) {
        AddContour(static_cast<GmContour const&>(c));
    } else if (c.IsHelix()) {
        AddHelix(static_cast<GmHelix const&>(c));
    } else if (c.IsRect()) {
        GmRect const& rect = static_cast<GmRect const&>(c);
        Add("left top", rect.LTPoint());
        Add("right bottom", rect.RBPoint());
    } else if (c.IsCircle() || c.IsArc()) {
        AddRound(static_cast<GmCircle const&>(c));
    } else if (c.IsCurve()) {
        AddStraight(static_cast<GmLine const&>(c));
    }
}

void Answer::Add(char const* name, GmCurve const* c) {
    if (c) {
        Add(name, *c);
    } else {
        Add(name, std::string("null"));
    }
}

void Answer::AddOwned(char const* name, GmCurve* c) {
    const std::unique_ptr<GmCurve> owner(c);
    Add(name, static_cast<GmCurve const*>(c));
}

void Answer::AddPoints(char const* name, std::vector<GmPoint> const& points) {
    Add("points", static_cast<long>(points.size()));
    for (GmPoint const& p : points)
        Add(name, p);
}

void Answer::AddSolutions(GmCurve const& c) {
    AddPoints("solution", c.GetPtSol());
}

void Answer::AddSubContours(GmContour const& c) {
    long count = 0;
    for (; GmContour const* sub = c.GetSubContour(static_cast<int>(count)); ++count)
        Add("sub-contour", *sub);
    Add("sub-contours", count);
}

void Answer::AddStraight(GmLine const& line) {
    Add("start", line.SP());
    Add("direction", line.Dir());
    if (line.IsStretch()) Add("end", line.EP());
}

void Answer::AddRound(GmCircle const& circle) {
    Add("centre", circle.M());
    Add("radius", circle.R());
    Add("axis", circle.Axis());
    if (!circle.IsArc()) return;
    GmArc const& arc = static_cast<GmArc const&>(circle);
    Add("start", arc.SP());
    Add("end", arc.EP());
    Add("start angle", arc.SAng());
    Add("end angle", arc.EAng());
    Add("sense", static_cast<long>(arc.Dir()));
}

void Answer::AddHelix(GmHelix const& helix) {
    Add("start", helix.SP());
    Add("end", helix.EP());
    AddRound(helix.GetArc());
}

void Answer::AddContour(GmContour const& contour) {
    Add("closed", contour.IsClosed());
    Add("elements", contour.ElementCount());
    for (int i = 0; i < contour.ElementCount(); ++i) {
        GmContElement const* element = contour.GetContElement(i);
        Add("identifier", element->lId);
        Add("index", element->lIndex);
        Add("inserted", element->bInserted);
        Add("element", static_cast<GmCurve const*>(element->pCurve));
    }
}

}  // namespace net
