#include "curves/CurveCases.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace cases {

namespace {

double constexpr window = 100.0;

double gridValue(int from, int to) {
    return *rc::gen::inRange(from, to + 1) / 4.0;
}

double polarAngle(GmPoint const& m, GmPoint const& p) {
    return std::atan2(p.Y() - m.Y(), p.X() - m.X());
}

/// The turn from one angle to another in the sense of the arc, in [0, 2 pi).
double turn(double from, double to, GmBase::eRotDir rot) {
    double const t = std::fmod(rot == GmBase::eRotCW ? from - to : to - from, 2 * M_PI);
    return t < 0 ? t + 2 * M_PI : t;
}

double sweep(GmArc const& arc) {
    if (arc.SP().Dist(arc.EP()) < 1e-7) return 2 * M_PI;
    return turn(polarAngle(arc.M(), arc.SP()), polarAngle(arc.M(), arc.EP()), arc.Dir());
}

double distToArc(GmArc const& arc, GmPoint const& p) {
    double const start = polarAngle(arc.M(), arc.SP());
    if (turn(start, polarAngle(arc.M(), p), arc.Dir()) <= sweep(arc)) {
        return std::fabs(p.Dist(arc.M()) - arc.R());
    }
    return std::min(p.Dist(arc.SP()), p.Dist(arc.EP()));
}

double distToStraight(GmLine const& line, GmPoint const& p) {
    GmVec const dir(line.Dir());
    double t = (p - line.SP()) * dir;
    if (!line.IsLine()) t = std::max(t, 0.0);
    if (line.IsStretch()) t = std::min(t, line.SP().Dist(line.EP()));
    return p.Dist(GmPoint(line.SP() + t * dir));
}

}  // namespace

std::vector<GmBase::eGmTypes> const& Kinds() {
    static std::vector<GmBase::eGmTypes> const kinds = {
        GmBase::eGmLine, GmBase::eGmBeam, GmBase::eGmStretch, GmBase::eGmCircle, GmBase::eGmArc};
    return kinds;
}

char const* NameOf(GmBase::eGmTypes kind) {
    switch (kind) {
        case GmBase::eGmLine:
            return "line";
        case GmBase::eGmBeam:
            return "beam";
        case GmBase::eGmStretch:
            return "stretch";
        case GmBase::eGmCircle:
            return "circle";
        default:
            return "arc";
    }
}

::testing::AssertionResult IsAt(GmPoint const& p, double x, double y, double z, double eps) {
    bool const there = p.CreationOK() && p.equals(GmPoint(x, y, z), eps);
    return (there ? ::testing::AssertionSuccess() : ::testing::AssertionFailure())
           << (p.CreationOK() ? "" : "undefined ") << p.GetTraceString();
}

::testing::AssertionResult Points(GmDir const& d, double x, double y) {
    return IsAt(GmPoint(GmVec(d)), x, y);
}

GmPoint AnyGridPoint() {
    double const x = gridValue(-32, 32);
    double const y = gridValue(-32, 32);
    return GmPoint(x, y);
}

GmLine AnyLine() {
    return GmLine(AnyStretch());
}

GmStretch AnyStretch() {
    GmPoint const p = AnyGridPoint();
    GmPoint q = AnyGridPoint();
    if (p == q) q.X() += 1.0;
    return GmStretch(p, q);
}

GmCircle AnyCircle() {
    GmPoint const m = AnyGridPoint();
    return GmCircle(m, gridValue(1, 24), true);
}

GmArc AnyArc() {
    double constexpr step = M_PI / 12;
    int const start = *rc::gen::inRange(-12, 13);
    int const steps = *rc::gen::inRange(1, 24);
    GmCircle const circle = AnyCircle();
    return GmArc(circle, start * step, (start + steps) * step, AnySense());
}

GmBase::eRotDir AnySense() {
    return *rc::gen::element(GmBase::eRotCW, GmBase::eRotCCW);
}

double AnyOffset() {
    return gridValue(1, 24) * *rc::gen::element(-1.0, 1.0);
}

std::unique_ptr<GmCurve> AnyCurve(GmBase::eGmTypes kind) {
    switch (kind) {
        case GmBase::eGmLine:
            return std::make_unique<GmLine>(AnyLine());
        case GmBase::eGmBeam: {
            GmLine const line = AnyLine();
            return std::make_unique<GmBeam>(line.SP(), line.Dir());
        }
        case GmBase::eGmStretch:
            return std::make_unique<GmStretch>(AnyStretch());
        case GmBase::eGmCircle:
            return std::make_unique<GmCircle>(AnyCircle());
        default:
            return std::make_unique<GmArc>(AnyArc());
    }
}

GmPoint Along(GmCurve const& curve, double t) {
    if (curve.IsCircle() || curve.IsArc()) {
        auto const& circle = static_cast<GmCircle const&>(curve);
        double angle = 2 * M_PI * t;
        if (curve.IsArc()) {
            auto const& arc = static_cast<GmArc const&>(curve);
            double const travelled = t * sweep(arc);
            angle = polarAngle(arc.M(), arc.SP()) +
                    (arc.Dir() == GmBase::eRotCW ? -travelled : travelled);
        }
        return GmPoint(circle.M() + circle.R() * GmVec(std::cos(angle), std::sin(angle), 0));
    }
    auto const& line = static_cast<GmLine const&>(curve);
    double const length = line.IsStretch() ? line.SP().Dist(line.EP()) : window;
    return GmPoint(line.SP() + (line.IsLine() ? t - 0.5 : t) * length * GmVec(line.Dir()));
}

double ExactDist(GmCurve const& curve, GmPoint const& p) {
    if (curve.IsArc()) return distToArc(static_cast<GmArc const&>(curve), p);
    if (curve.IsCircle()) {
        auto const& circle = static_cast<GmCircle const&>(curve);
        return std::fabs(p.Dist(circle.M()) - circle.R());
    }
    return distToStraight(static_cast<GmLine const&>(curve), p);
}

Sampled SampledDist(GmCurve const& sampled, GmCurve const& other) {
    int constexpr n = 500;
    double nearest = std::numeric_limits<double>::max();
    for (int i = 0; i <= n; ++i) {
        nearest = std::min(nearest, ExactDist(other, Along(sampled, i / double(n))));
    }
    bool const unbounded = sampled.IsLine() || sampled.IsBeam();
    return {nearest, (unbounded ? window : sampled.Length()) / n};
}

}  // namespace cases
