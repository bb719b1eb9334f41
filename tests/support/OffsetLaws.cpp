#include "support/OffsetLaws.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <sstream>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "support/Contours.h"

namespace offset_laws {

namespace {

constexpr double kPi = 3.14159265358979323846;
/// How far results may be off, in length units.
constexpr double kAccuracy = 1e-3;
/// By how much a point may be nearer to the source than |d| and still count as being at |d|.
constexpr double kRounding = 1e-7;
constexpr int kSamples = 9;

struct Xy {
    double x;
    double y;
};

Xy At(GmPoint const& p) {
    return {p.X(), p.Y()};
}
Xy operator-(Xy a, Xy b) {
    return {a.x - b.x, a.y - b.y};
}
double Dot(Xy a, Xy b) {
    return a.x * b.x + a.y * b.y;
}
double Cross(Xy a, Xy b) {
    return a.x * b.y - a.y * b.x;
}
double Norm(Xy a) {
    return std::hypot(a.x, a.y);
}

GmArc const* AsArc(GmCurve const& curve) {
    return curve.IsArc() ? static_cast<GmArc const*>(&curve) : nullptr;
}

/// The turn from direction `a` to direction `b` in the sense of an arc, in [0, 2 pi).
double Turn(Xy a, Xy b, GmBase::eRotDir rot) {
    const double turn = std::atan2(Cross(a, b), Dot(a, b)) * (rot == GmBase::eRotCW ? -1 : 1);
    return turn < 0 ? turn + 2 * kPi : turn;
}

double Sweep(GmArc const& arc) {
    const Xy m = At(arc.M());
    const double sweep = Turn(At(arc.SP()) - m, At(arc.EP()) - m, arc.Dir());
    return arc.IsFullCircle() ? 2 * kPi : sweep;
}

double DistanceOf(GmCurve const& element, GmPoint const& point) {
    const Xy p = At(point);
    const Xy sp = At(element.SP());
    const Xy ep = At(element.EP());
    const double toEnds = std::min(Norm(p - sp), Norm(p - ep));
    if (GmArc const* arc = AsArc(element)) {
        const Xy m = At(arc->M());
        const bool beside = Turn(sp - m, p - m, arc->Dir()) <= Sweep(*arc);
        return beside ? std::min(toEnds, std::fabs(Norm(p - m) - arc->R())) : toEnds;
    }
    const Xy d = ep - sp;
    const double t = Dot(p - sp, d) / Dot(d, d);
    return t > 0 && t < 1 ? std::fabs(Cross(d, p - sp)) / Norm(d) : toEnds;
}

/// Is a point away from the contour inside of it? A ray to the right crosses it an odd number of
/// times; arcs count as many chords.
bool IsInside(std::vector<GmPoint> const& polygon, GmPoint const& p) {
    bool inside = false;
    for (size_t i = 0; i < polygon.size(); ++i) {
        const Xy a = At(polygon[i]) - At(p);
        const Xy b = At(polygon[(i + 1) % polygon.size()]) - At(p);
        if ((a.y > 0) != (b.y > 0) && Cross(a, b) * (b.y - a.y) > 0) inside = !inside;
    }
    return inside;
}

std::string Say(char const* what, GmPoint const& p, double value) {
    std::ostringstream text;
    text.precision(10);
    text << what << " at (" << p.X() << ", " << p.Y() << "): " << value;
    return text.str();
}

/// The direction of travel at an end of an element.
Xy Heading(GmCurve const& element, bool bAtEnd) {
    const Xy p = At(bAtEnd ? element.EP() : element.SP());
    if (GmArc const* arc = AsArc(element)) {
        const Xy r = p - At(arc->M());
        const double sign = (arc->Dir() == GmBase::eRotCW ? -1 : 1) / Norm(r);
        return {-r.y * sign, r.x * sign};
    }
    const Xy d = At(element.EP()) - At(element.SP());
    return {d.x / Norm(d), d.y / Norm(d)};
}

/// Points of the offset of one element, without its ends, where other pieces take over.
void AddOffset(GmCurve const& element, double d, std::vector<GmPoint>& points) {
    for (int k = 1; k < 2 * kSamples; ++k) {
        const double t = k / (2.0 * kSamples);
        if (GmArc const* arc = AsArc(element)) {
            const double sense = arc->Dir() == GmBase::eRotCW ? -1 : 1;
            const double r = arc->R() + d * sense;
            if (r < kAccuracy) return;
            const Xy start = At(arc->SP()) - At(arc->M());
            const double angle = std::atan2(start.y, start.x) + t * Sweep(*arc) * sense;
            points.emplace_back(arc->M().X() + r * std::cos(angle),
                                arc->M().Y() + r * std::sin(angle));
        } else {
            const Xy u = Heading(element, false);
            const Xy way = At(element.EP()) - At(element.SP());
            points.emplace_back(element.SP().X() + t * way.x + d * u.y,
                                element.SP().Y() + t * way.y - d * u.x);
        }
    }
}

/// Points of the arc about the joint of two elements, if the corner opens away from the side of d.
void AddCorner(GmCurve const& before, GmCurve const& after, double d,
               std::vector<GmPoint>& points) {
    const Xy in = Heading(before, true);
    const Xy out = Heading(after, false);
    const double turn = std::atan2(Cross(in, out), Dot(in, out));
    if (turn * d <= 0) return;
    const double start = std::atan2(-in.x * d, in.y * d);
    for (int k = 1; k < kSamples; ++k) {
        const double angle = start + turn * k / kSamples;
        points.emplace_back(before.EP().X() + std::fabs(d) * std::cos(angle),
                            before.EP().Y() + std::fabs(d) * std::sin(angle));
    }
}

double DistanceFromResults(GmContour const& source, GmPoint const& p) {
    double nearest = std::numeric_limits<double>::max();
    for (GmContour const* result : Results(source))
        nearest = std::min(nearest, DistanceFrom(*result, p));
    return nearest;
}

}  // namespace

double DistanceFrom(GmContour const& contour, GmPoint const& p) {
    double nearest = std::numeric_limits<double>::max();
    for (int i = 0; i < contour.ElementCount(); ++i)
        nearest = std::min(nearest, DistanceOf(*contour.GetElement(i), p));
    return nearest;
}

double Area(GmContour const& contour) {
    double doubled = 0;
    if (contour.ElementCount() == 0) return 0;
    const Xy origin = At(contour.GetElement(0)->SP());
    for (int i = 0; i < contour.ElementCount(); ++i) {
        GmCurve const& element = *contour.GetElement(i);
        doubled += Cross(At(element.SP()) - origin, At(element.EP()) - origin);
        if (GmArc const* arc = AsArc(element)) {
            const double sense = arc->Dir() == GmBase::eRotCW ? -1 : 1;
            doubled += sense * arc->R() * arc->R() * (Sweep(*arc) - std::sin(Sweep(*arc)));
        }
    }
    return doubled / 2;
}

std::vector<GmContour const*> Results(GmContour const& source) {
    std::vector<GmContour const*> results;
    for (int i = 0; source.GetSubContour(i) != nullptr; ++i)
        results.push_back(source.GetSubContour(i));
    return results;
}

Verdict KeepsDistance(GmContour const& source, double d) {
    Verdict verdict;
    const std::vector<GmPoint> polygon = shapes::Samples(source, 65);
    const bool insideExpected = d * Area(source) < 0;
    for (GmContour const* result : Results(source)) {
        for (GmPoint const& p : shapes::Samples(*result, kSamples)) {
            ++verdict.checked;
            const double off = DistanceFrom(source, p) - std::fabs(d);
            if (!(std::fabs(off) < kAccuracy)) verdict.fault = Say("off the distance", p, off);
            if (source.IsClosed() && IsInside(polygon, p) != insideExpected)
                verdict.fault = Say("on the wrong side", p, d);
            if (!verdict.Holds()) return verdict;
        }
    }
    return verdict;
}

Verdict MissesNothing(GmContour const& source, double d) {
    std::vector<GmPoint> points;
    const int n = static_cast<int>(source.ElementCount());
    for (int i = 0; i < n; ++i) {
        AddOffset(*source.GetElement(i), d, points);
        if (i + 1 < n || source.IsClosed())
            AddCorner(*source.GetElement(i), *source.GetElement((i + 1) % n), d, points);
    }
    Verdict verdict;
    for (GmPoint const& p : points) {
        if (DistanceFrom(source, p) < std::fabs(d) - kRounding) continue;
        ++verdict.checked;
        const double off = DistanceFromResults(source, p);
        if (off < kAccuracy) continue;
        verdict.fault = Say("missing", p, off);
        return verdict;
    }
    return verdict;
}

Verdict IsChained(GmContour const& source) {
    Verdict verdict;
    for (GmContour const* result : Results(source)) {
        ++verdict.checked;
        const int n = static_cast<int>(result->ElementCount());
        if (n == 0) {
            verdict.fault = "a result without elements";
            return verdict;
        }
        const GmPoint start = result->GetElement(0)->SP();
        for (int i = 1; i < n; ++i) {
            const GmPoint joint = result->GetElement(i)->SP();
            if (result->GetElement(i - 1)->EP() != joint) verdict.fault = Say("gap", joint, i);
        }
        const bool meets = result->GetElement(n - 1)->EP() == start;
        if (source.IsClosed() && !(result->IsClosed() && meets))
            verdict.fault = Say("open", start, n);
    }
    return verdict;
}

}  // namespace offset_laws
