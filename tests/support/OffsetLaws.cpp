// SPDX-License-Identifier: MIT
#include "tests/support/OffsetLaws.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <complex>
#include <limits>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

namespace offset_laws {

namespace {

constexpr double kPi = 3.14159265358979323846;
/// How far results may be off, in length units.
constexpr double kAccuracy = 1e-3;
/// By how much a point may be nearer to the source than |d| and still count as being at |d|.
constexpr double kRounding = 1e-7;
constexpr int kSamples = 9;

using Xy = std::complex<double>;
constexpr Xy kQuarterTurn{0, 1};

Xy At(GmPoint const& p) {
    return {p.X(), p.Y()};
}
double Dot(Xy a, Xy b) {
    return a.real() * b.real() + a.imag() * b.imag();
}
double Cross(Xy a, Xy b) {
    return a.real() * b.imag() - a.imag() * b.real();
}
double Turn(Xy a, Xy b) {
    return std::atan2(Cross(a, b), Dot(a, b));
}

GmArc const* AsArc(GmCurve const& curve) {
    return curve.IsArc() ? static_cast<GmArc const*>(&curve) : nullptr;
}

double Sense(GmArc const& arc) {
    return arc.Dir() == GmBase::eRotCW ? -1 : 1;
}

/// The way along the arc from its start to the direction of a point, in [0, 2 pi).
double TurnTo(GmArc const& arc, GmPoint const& p) {
    const Xy m = At(arc.M());
    const double turn = Turn(At(arc.SP()) - m, At(p) - m) * Sense(arc);
    return turn < 0 ? turn + 2 * kPi : turn;
}

double Sweep(GmArc const& arc) {
    return arc.IsFullCircle() ? 2 * kPi : TurnTo(arc, arc.EP());
}

double DistanceOf(GmCurve const& element, GmPoint const& point) {
    const Xy p = At(point);
    const Xy sp = At(element.SP());
    const Xy d = At(element.EP()) - sp;
    const double toEnds = std::min(std::abs(p - sp), std::abs(p - sp - d));
    if (GmArc const* arc = AsArc(element)) {
        if (TurnTo(*arc, point) > Sweep(*arc)) return toEnds;
        return std::min(toEnds, std::fabs(std::abs(p - At(arc->M())) - arc->R()));
    }
    const double t = Dot(p - sp, d) / Dot(d, d);
    return t > 0 && t < 1 ? std::fabs(Cross(d, p - sp)) / std::abs(d) : toEnds;
}

/// Is a point away from the contour inside of it? A ray to the right crosses it an odd number of
/// times; arcs count as many chords.
bool IsInside(std::vector<GmPoint> const& polygon, GmPoint const& p) {
    bool inside = false;
    for (size_t i = 0; i < polygon.size(); ++i) {
        const Xy a = At(polygon[i]) - At(p);
        const Xy b = At(polygon[(i + 1) % polygon.size()]) - At(p);
        const bool passes = (a.imag() > 0) != (b.imag() > 0);
        if (passes && Cross(a, b) * (b - a).imag() > 0) inside = !inside;
    }
    return inside;
}

/// The direction of travel at an end of an element.
Xy Heading(GmCurve const& element, bool bAtEnd) {
    GmArc const* arc = AsArc(element);
    const Xy way = arc != nullptr
                       ? (At(bAtEnd ? arc->EP() : arc->SP()) - At(arc->M())) * kQuarterTurn
                       : At(element.EP()) - At(element.SP());
    return way / std::abs(way) * (arc != nullptr ? Sense(*arc) : 1.0);
}

/// Points of the offset of one element, without its ends, where other pieces take over.
void AddOffset(GmCurve const& element, double d, std::vector<Xy>& points) {
    GmArc const* arc = AsArc(element);
    if (arc != nullptr && arc->R() + d * Sense(*arc) < kAccuracy) return;
    const Xy sp = At(element.SP());
    const Xy beside = sp - d * kQuarterTurn * Heading(element, false);
    for (int k = 1; k < 2 * kSamples; ++k) {
        const double t = k / (2.0 * kSamples);
        if (arc != nullptr) {
            const Xy m = At(arc->M());
            points.push_back(m + (beside - m) * std::polar(1.0, t * Sweep(*arc) * Sense(*arc)));
        } else {
            points.push_back(beside + t * (At(element.EP()) - sp));
        }
    }
}

/// Points of the arc about the joint of two elements, if the corner opens away from the side of d.
void AddCorner(GmCurve const& before, GmCurve const& after, double d, std::vector<Xy>& points) {
    const Xy in = Heading(before, true);
    const double turn = Turn(in, Heading(after, false));
    for (int k = 1; k < kSamples && turn * d > 0; ++k)
        points.push_back(At(before.EP()) -
                         d * kQuarterTurn * in * std::polar(1.0, turn * k / kSamples));
}

int ExpectRightDistance(GmContour const& source, Contours const& results, double d) {
    int checked = 0;
    const std::vector<GmPoint> polygon = shapes::Samples(source, 65);
    const bool insideExpected = d * Area(source) < 0;
    for (GmContour const* result : results) {
        for (GmPoint const& p : shapes::Samples(*result, kSamples)) {
            EXPECT_NEAR(DistanceFrom(source, p), std::fabs(d), kAccuracy) << p.GetTraceString();
            const bool rightSide = !source.IsClosed() || IsInside(polygon, p) == insideExpected;
            EXPECT_TRUE(rightSide) << p.GetTraceString();
            ++checked;
        }
    }
    return checked;
}

int ExpectNothingMissing(GmContour const& source, Contours const& results, double d) {
    std::vector<Xy> points;
    const int n = static_cast<int>(source.ElementCount());
    for (int i = 0; i < n; ++i) {
        AddOffset(*source.GetElement(i), d, points);
        if (i + 1 < n || source.IsClosed())
            AddCorner(*source.GetElement(i), *source.GetElement((i + 1) % n), d, points);
    }
    int checked = 0;
    for (Xy const& xy : points) {
        const GmPoint p(xy.real(), xy.imag());
        if (DistanceFrom(source, p) < std::fabs(d) - kRounding) continue;
        double nearest = std::numeric_limits<double>::max();
        for (GmContour const* result : results)
            nearest = std::min(nearest, DistanceFrom(*result, p));
        EXPECT_LT(nearest, kAccuracy) << "missing at " << p.GetTraceString();
        ++checked;
    }
    return checked;
}

int ExpectChains(GmContour const& source, Contours const& results) {
    int checked = 0;
    for (GmContour const* result : results) {
        const int n = static_cast<int>(result->ElementCount());
        EXPECT_GT(n, 0);
        EXPECT_TRUE(result->IsClosed() || !source.IsClosed());
        for (int i = source.IsClosed() ? 0 : 1; i < n; ++i, ++checked)
            EXPECT_EQ(result->GetElement((i + n - 1) % n)->EP(), result->GetElement(i)->SP()) << i;
    }
    return checked;
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
    for (int i = 0; i < contour.ElementCount(); ++i) {
        GmCurve const& element = *contour.GetElement(i);
        const Xy origin = At(contour.GetElement(0)->SP());
        doubled += Cross(At(element.SP()) - origin, At(element.EP()) - origin);
        if (GmArc const* arc = AsArc(element))
            doubled += Sense(*arc) * arc->R() * arc->R() * (Sweep(*arc) - std::sin(Sweep(*arc)));
    }
    return doubled / 2;
}

Contours Results(GmContour const& source) {
    Contours results;
    for (int i = 0; source.GetSubContour(i) != nullptr; ++i)
        results.push_back(source.GetSubContour(i));
    return results;
}

int ExpectOffsetLaws(GmContour const& source, Contours const& results, double d) {
    return ExpectRightDistance(source, results, d) + ExpectNothingMissing(source, results, d) +
           ExpectChains(source, results);
}

int ExpectOffsetLaws(GmContour const& source, double d) {
    return ExpectOffsetLaws(source, Results(source), d);
}

}  // namespace offset_laws
