// SPDX-License-Identifier: MIT
/// @file
/// Is a point nearer to an element than a threshold? An answer without angles, where it is sure.
///
/// The distance is computed by the textbook: to the line or the circle where the foot lies on the
/// element, else to the nearer end. Whether it does is told by signs of products instead of angles.
/// That differs from the exact function by rounding, and where the foot is so near to an end that a
/// tolerance decides. Both are kept out by margins far wider than they can be: there, and where the
/// distance comes near to the threshold, the answer is left to the exact function. So the decision
/// is always that of the exact function. Constant cost.
#include "kernel/contour/offset/QuickDistance.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// Distances nearer to the threshold are not decided: in length units, and of the coordinates'
/// size.
constexpr double kSlack = 1e-9;
constexpr double kRelativeSlack = 1e-13;

/// Feet nearer to an end are not decided: ten times the tolerance within which points are equal.
constexpr double kEndMargin = 1e-3;

/// The same for directions, beside what kEndMargin is on the circle. Directions next to an axis are
/// taken for the axis by the exact function, within a tenth of this.
constexpr double kDirectionMargin = 2e-3;

/// Shorter segments and radii are not looked at.
constexpr double kShortest = 1e-2;

/// The exact halving point takes the sweep from an arc cosine, which loses digits beside half and
/// full circles; beyond this cosine of the sweep the quick point would be better than it.
constexpr double kLargestCosine = 0.999;

constexpr double kLargestRadius = 1e6;

double dot(PlanePoint a, PlanePoint b) {
    return a.x * b.x + a.y * b.y;
}

double cross(PlanePoint a, PlanePoint b) {
    return a.x * b.y - a.y * b.x;
}

PlanePoint operator-(PlanePoint a, PlanePoint b) {
    return {a.x - b.x, a.y - b.y};
}

double length(PlanePoint v) {
    return std::sqrt(dot(v, v));
}

double size(PlanePoint p) {
    return std::fabs(p.x) + std::fabs(p.y);
}

PlanePoint planePoint(GmPoint const& p) {
    return {p.X(), p.Y()};
}

PlanePoint directionAt(double radians) {
    return {std::cos(radians), std::sin(radians)};
}

/// Is the one direction next to the other, on a circle of this radius?
bool isNextTo(PlanePoint a, PlanePoint b, double radius) {
    return dot(a, b) > 0.0 && std::fabs(cross(a, b)) < kDirectionMargin + kEndMargin / radius;
}

}  // namespace

double heightOf(GmCurve const& curve) {
    constexpr double kNone = std::numeric_limits<double>::quiet_NaN();
    const double z = curve.SP().Z();
    if (!(z == curve.EP().Z())) return kNone;
    auto const* const arc = curveAs<GmArc>(curve);
    return arc == nullptr || z == arc->M().Z() ? z : kNone;
}

QuickDistance::QuickDistance(GmCurve const& element) {
    if (!isSegmentOrArc(element)) return;
    m_z = heightOf(element);
    m_sp = planePoint(element.SP());
    m_ep = planePoint(element.EP());
    m_size = size(m_sp) + size(m_ep);
    if (element.IsArc()) {
        takeArc(element);
    } else {
        takeSegment(element);
    }
}

void QuickDistance::takeSegment(GmCurve const& element) {
    constexpr double kSameDirection = 1e-7;
    const GmDir dir = element.TangSP();
    const PlanePoint chord = m_ep - m_sp;
    m_first = {dir.X(), dir.Y()};
    m_length = length(chord);
    const bool along =
        dot(chord, m_first) > 0.0 && std::fabs(cross(chord, m_first)) < kSameDirection * m_length;
    if (m_length > kShortest && dir.Z() == 0.0 && along) m_kind = Kind::kSegment;
}

void QuickDistance::takeArc(GmCurve const& element) {
    auto const& arc = static_cast<GmArc const&>(element);
    m_centre = planePoint(arc.M());
    m_radius = arc.R();
    m_size += size(m_centre) + m_radius;
    m_full = arc.SP() == arc.EP();
    m_first = directionAt(arc.SAng());
    m_second = directionAt(arc.EAng());
    if (arc.Dir() == GmBase::eRotCW) std::swap(m_first, m_second);
    const bool hasSense = arc.Dir() == GmBase::eRotCW || arc.Dir() == GmBase::eRotCCW;
    const bool hasSweep = m_full || !isNextTo(m_first, m_second, m_radius);
    if (hasSense && hasSweep && m_radius > kShortest && m_radius < kLargestRadius) {
        m_kind = Kind::kArc;
    }
}

std::optional<bool> QuickDistance::isNearer(PlanePoint p, double threshold) const {
    if (m_kind == Kind::kUnknown) return std::nullopt;
    const std::optional<double> distance = m_kind == Kind::kArc ? toArc(p) : toSegment(p);
    if (!distance) return std::nullopt;
    const double slack = kSlack + kRelativeSlack * (m_size + size(p));
    if (*distance < threshold - slack) return true;
    if (*distance > threshold + slack) return false;
    return std::nullopt;
}

std::optional<double> QuickDistance::toSegment(PlanePoint p) const {
    const PlanePoint fromStart = p - m_sp;
    const double along = dot(fromStart, m_first);
    if (along > kEndMargin && along < m_length - kEndMargin) {
        return std::fabs(cross(fromStart, m_first));
    }
    if (along < -kEndMargin || along > m_length + kEndMargin) return toEnds(p);
    return std::nullopt;
}

std::optional<double> QuickDistance::toArc(PlanePoint p) const {
    const PlanePoint radial = p - m_centre;
    const double fromCentre = length(radial);
    if (!(fromCentre > kEndMargin)) return std::nullopt;
    const PlanePoint direction{radial.x / fromCentre, radial.y / fromCentre};
    if (isBesideEnd({m_centre.x + m_radius * direction.x, m_centre.y + m_radius * direction.y})) {
        return std::nullopt;
    }
    const std::optional<bool> swept = sweeps(direction);
    if (!swept) return std::nullopt;
    return *swept ? std::fabs(fromCentre - m_radius) : toEnds(p);
}

/// Does the sweep pass over a direction? Nothing next to its ends.
std::optional<bool> QuickDistance::sweeps(PlanePoint direction) const {
    if (m_full) return true;
    if (isNextTo(direction, m_first, m_radius) || isNextTo(direction, m_second, m_radius)) {
        return std::nullopt;
    }
    const bool afterFirst = cross(m_first, direction) > 0.0;
    const bool beforeSecond = cross(direction, m_second) > 0.0;
    const bool wide = cross(m_first, m_second) < 0.0;
    return wide ? afterFirst || beforeSecond : afterFirst && beforeSecond;
}

bool QuickDistance::isBesideEnd(PlanePoint p) const {
    return size(p - m_sp) < kEndMargin || size(p - m_ep) < kEndMargin;
}

double QuickDistance::toEnds(PlanePoint p) const {
    return std::min(length(p - m_sp), length(p - m_ep));
}

std::optional<PlanePoint> quickHalvingPoint(GmCurve const& curve) {
    auto const* const arc = curveAs<GmArc>(curve);
    if (arc == nullptr) return std::nullopt;
    // Ends of a sweep are symmetric to the direction of its middle, so their difference is square
    // to it, and the turn from the middle to the difference has the sense of the arc.
    const double sense = arc->Dir() == GmBase::eRotCW ? -1.0 : 1.0;
    const PlanePoint start = directionAt(arc->SAng());
    const PlanePoint end = directionAt(arc->EAng());
    if (!(std::fabs(dot(start, end)) < kLargestCosine)) return std::nullopt;
    const PlanePoint across = start - end;
    const double scale = sense * arc->R() / length(across);
    return PlanePoint{arc->M().X() - scale * across.y, arc->M().Y() + scale * across.x};
}

}  // namespace gmkernel_detail
