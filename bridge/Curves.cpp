// SPDX-License-Identifier: MIT
/// @file
/// Single curves of the kernel as elements, and back.
///
/// The kernel holds an arc by centre, radius and ends, which need not fit each other to the last
/// digit, and counts angles in degrees, which lose digits on flat arcs. So the sweep is taken from
/// the directions of the ends, by an arc tangent that is good for all angles, and the ends are
/// taken as they are.

#include "gmbridge/Curves.h"

#include <cmath>

#include "bridge/ArcCentre.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace gmbridge {

using gmregion::Element;
using gmregion::Point;

namespace {

constexpr double kPi = 3.14159265358979323846;

/// Arcs that turn by more come in halves, so that ends stay apart in comparison to the radius.
constexpr double kLargestSweep = 300.0 / 180.0 * kPi;

/// The rounding of a far centre and of what is computed with it, in parts of the radius.
constexpr double kRounding = 8.881784197001252e-16;  // a 2^-50th

bool isFinite(Point p) {
    return std::isfinite(p.x) && std::isfinite(p.y);
}

/// The sweep from one point to another about a centre, in radians, positive in the sense given;
/// above 0, and up to a full turn where both points are the same.
double sweepAbout(Point m, Point from, Point to, double sense) {
    const Point a{from.x - m.x, from.y - m.y};
    const Point b{to.x - m.x, to.y - m.y};
    const double angle = sense * std::atan2(a.x * b.y - a.y * b.x, a.x * b.x + a.y * b.y);
    return angle > 0.0 ? angle : angle + 2.0 * kPi;
}

void appendArc(Point sp, Point ep, double sweep, std::vector<Element>& elements) {
    elements.push_back({sp, ep, std::tan(0.25 * sweep)});
}

/// The point of an arc halfway between its ends.
Point halvingPoint(Point m, double r, Point sp, double sweep) {
    const double start = std::atan2(sp.y - m.y, sp.x - m.x);
    const double angle = start + 0.5 * sweep;
    return {m.x + r * std::cos(angle), m.y + r * std::sin(angle)};
}

bool appendKernelArc(const GmArc& arc, std::vector<Element>& elements) {
    const Point m = planePoint(arc.M());
    const Point sp = planePoint(arc.SP());
    const Point ep = planePoint(arc.EP());
    if (arc.Dir() == GmBase::eRotNone || !isFinite(m) || !std::isfinite(arc.R())) return false;
    const double sense = arc.Dir() == GmBase::eRotCW ? -1.0 : 1.0;
    const double sweep = arc.IsFullCircle() ? 2.0 * kPi : sweepAbout(m, sp, ep, sense);
    if (sweep <= kLargestSweep) {
        appendArc(sp, ep, sense * sweep, elements);
        return true;
    }
    const Point middle = halvingPoint(m, arc.R(), sp, sense * sweep);
    appendArc(sp, middle, sense * 0.5 * sweep, elements);
    appendArc(middle, ep, sense * 0.5 * sweep, elements);
    return true;
}

}  // namespace

Point planePoint(const GmPoint& p) {
    return {p.X(), p.Y()};
}

GmPoint kernelPoint(Point p) {
    return {p.x, p.y};
}

bool appendElements(const GmCurve& curve, std::vector<Element>& elements) {
    const Point sp = planePoint(curve.SP());
    const Point ep = planePoint(curve.EP());
    if (!curve.CreationOK() || !isFinite(sp) || !isFinite(ep)) return false;
    // A tag may have been copied from a curve of another class, so it is no proof alone.
    const auto* arc = curve.IsArc() ? dynamic_cast<const GmArc*>(&curve) : nullptr;
    if (arc) return appendKernelArc(*arc, elements);
    if (!curve.IsStretch() || !dynamic_cast<const GmStretch*>(&curve)) return false;
    elements.push_back({sp, ep});
    return true;
}

std::unique_ptr<GmCurve> curveOf(const Element& e) {
    const GmPoint sp = kernelPoint(e.sp);
    const GmPoint ep = kernelPoint(e.ep);
    // With l the length of the chord the arc leaves it by b l / 2, and has the radius
    // (1 + b^2) l / (4 b).
    const double squaredBulge = e.bulge * e.bulge;
    const bool isFlat = squaredBulge <= 0.5 * kRounding * (1.0 + squaredBulge);
    if (isFlat || e.sp == e.ep) return std::make_unique<GmStretch>(sp, ep);
    const auto rot = e.bulge > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW;
    return std::make_unique<GmArc>(sp, ep, kernelPoint(centreOf(e)), rot);
}

}  // namespace gmbridge
