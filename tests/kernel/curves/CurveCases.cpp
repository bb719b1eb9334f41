// SPDX-License-Identifier: MIT
#include "tests/kernel/curves/CurveCases.h"

#include <algorithm>
#include <cmath>
#include <sstream>

namespace cases {

namespace {

/// Without the noise of the last digits and the sign of zero.
double rounded(double v) {
    return std::round(v * 1e9) / 1e9 + 0.0;
}

double gridValue(int from, int to) {
    return *rc::gen::inRange(from, to + 1) / 4.0;
}

double polarAngle(GmPoint const& m, GmPoint const& p) {
    return std::atan2(p.Y() - m.Y(), p.X() - m.X());
}

/// The turn from one angle to another in a sense, in [0, 2 pi).
double turn(double from, double to, GmBase::eRotDir rot) {
    double const t = std::fmod(rot == CW ? from - to : to - from, 2 * M_PI);
    return t < 0 ? t + 2 * M_PI : t;
}

double startAngle(GmArc const& arc) {
    return polarAngle(arc.M(), arc.SP());
}

double sweep(GmArc const& arc) {
    return turn(startAngle(arc), polarAngle(arc.M(), arc.EP()), arc.Dir());
}

}  // namespace

std::string Text(GmPoint const& p) {
    if (!p.CreationOK()) return "none";
    std::ostringstream text;
    text.precision(9);
    text << rounded(p.X()) << "," << rounded(p.Y());
    if (rounded(p.Z()) != 0) text << "," << rounded(p.Z());
    return text.str();
}

std::string Text(GmDir const& d) {
    return Text(GmPoint(GmVec(d)));
}

std::string TextOf(std::vector<GmPoint> const& points) {
    std::string text;
    for (GmPoint const& p : points)
        text += (text.empty() ? "" : " ") + Text(p);
    return text;
}

GmStretch Stretch(double x1, double y1, double x2, double y2) {
    return GmStretch(GmPoint(x1, y1), GmPoint(x2, y2));
}

GmCircle Circle(double x, double y, double r) {
    return GmCircle(GmPoint(x, y), r, true);
}

GmArc Arc(double x, double y, double r, double start, double end, GmBase::eRotDir rot) {
    return GmArc(GmPoint(x, y), r, start * M_PI / 180, end * M_PI / 180, rot);
}

std::vector<GmBase::eGmTypes> const& Kinds() {
    static std::vector<GmBase::eGmTypes> const kinds = {
        GmBase::eGmLine, GmBase::eGmBeam, GmBase::eGmStretch, GmBase::eGmCircle, GmBase::eGmArc};
    return kinds;
}

std::string PairName(GmBase::eGmTypes first, GmBase::eGmTypes second) {
    return "type tags " + std::to_string(first) + ", " + std::to_string(second);
}

GmPoint AnyGridPoint() {
    double const x = gridValue(-32, 32);
    return GmPoint(x, gridValue(-32, 32));
}

GmStretch AnyStretch() {
    GmPoint const p = AnyGridPoint();
    GmPoint q = AnyGridPoint();
    if (p == q) q.X() += 1.0;
    return GmStretch(p, q);
}

GmArc AnyArc() {
    GmPoint const m = AnyGridPoint();
    int const start = *rc::gen::inRange(-12, 13) * 15;
    int const angle = *rc::gen::inRange(1, 24) * 15;
    return Arc(m.X(), m.Y(), gridValue(1, 24), start, start + angle, *rc::gen::element(CW, CCW));
}

double AnyOffset() {
    return gridValue(1, 24) * *rc::gen::element(-1.0, 1.0);
}

std::unique_ptr<GmCurve> AnyCurve(GmBase::eGmTypes kind) {
    if (kind == GmBase::eGmArc) return std::make_unique<GmArc>(AnyArc());
    if (kind == GmBase::eGmCircle) return std::make_unique<GmCircle>(AnyArc());
    GmStretch const stretch = AnyStretch();
    if (kind == GmBase::eGmStretch) return std::make_unique<GmStretch>(stretch);
    if (kind == GmBase::eGmLine) return std::make_unique<GmLine>(stretch);
    return std::make_unique<GmBeam>(stretch.SP(), stretch.Dir());
}

GmPoint Along(GmCurve const& curve, double t) {
    if (!curve.IsCircle() && !curve.IsArc()) {
        auto const& line = static_cast<GmLine const&>(curve);
        double const length = line.IsStretch() ? line.SP().Dist(line.EP()) : 100.0;
        return GmPoint(line.SP() + (line.IsLine() ? t - 0.5 : t) * length * GmVec(line.Dir()));
    }
    double angle = 2 * M_PI * t;
    if (curve.IsArc()) {
        auto const& arc = static_cast<GmArc const&>(curve);
        angle = startAngle(arc) + (arc.Dir() == CW ? -t : t) * sweep(arc);
    }
    auto const& circle = static_cast<GmCircle const&>(curve);
    return GmPoint(circle.M() + circle.R() * GmVec(std::cos(angle), std::sin(angle), 0));
}

double ExactDist(GmCurve const& curve, GmPoint const& p) {
    if (curve.IsCircle() || curve.IsArc()) {
        auto const& circle = static_cast<GmCircle const&>(curve);
        double const toRim = std::fabs(p.Dist(circle.M()) - circle.R());
        if (curve.IsCircle()) return toRim;
        auto const& arc = static_cast<GmArc const&>(curve);
        double const reached = turn(startAngle(arc), polarAngle(arc.M(), p), arc.Dir());
        return reached <= sweep(arc) ? toRim : std::min(p.Dist(arc.SP()), p.Dist(arc.EP()));
    }
    auto const& line = static_cast<GmLine const&>(curve);
    double t = (p - line.SP()) * GmVec(line.Dir());
    if (!line.IsLine()) t = std::max(t, 0.0);
    if (line.IsStretch()) t = std::min(t, line.SP().Dist(line.EP()));
    return p.Dist(GmPoint(line.SP() + t * GmVec(line.Dir())));
}

}  // namespace cases
