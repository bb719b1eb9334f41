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

namespace gmkernel_detail {

namespace {

/// Distances nearer to the threshold are not decided: in length units, and of the coordinates'
/// size.
constexpr double kSlack = 1e-9;
constexpr double kRelativeSlack = 1e-13;

/// Shorter segments are not looked at.
constexpr double kShortest = 1e-2;

double size(PlanePoint p) {
    return std::fabs(p.x) + std::fabs(p.y);
}

}  // namespace

double heightOf(PlainCurve const& curve) {
    constexpr double kNone = std::numeric_limits<double>::quiet_NaN();
    const double z = startOf(curve).z;
    if (!(z == endOf(curve).z)) return kNone;
    auto const* const arc = std::get_if<PlainArc>(&curve);
    return arc == nullptr || z == arc->m.z ? z : kNone;
}

QuickDistance::QuickDistance(GmCurve const& element) {
    const std::optional<PlainCurve> curve = plainCurveOf(element);
    if (!curve) return;
    m_z = heightOf(*curve);
    m_sp = planePoint(startOf(*curve));
    m_ep = planePoint(endOf(*curve));
    m_size = size(m_sp) + size(m_ep);
    std::visit([this](auto const& c) { take(c); }, *curve);
}

void QuickDistance::take(PlainSegment const& segment) {
    constexpr double kSameDirection = 1e-7;
    const PlanePoint chord = m_ep - m_sp;
    m_direction = planePoint(segment.dir);
    m_length = length(chord);
    const bool along = dot(chord, m_direction) > 0.0 &&
                       std::fabs(cross(chord, m_direction)) < kSameDirection * m_length;
    if (m_length > kShortest && segment.dir.z == 0.0 && along) m_kind = Kind::kSegment;
}

void QuickDistance::take(PlainArc const& arc) {
    m_centre = planePoint(arc.m);
    m_radius = arc.r;
    m_size += size(m_centre) + m_radius;
    m_sweep = QuickSweep(arc);
    m_kind = Kind::kArc;
}

std::optional<bool> QuickDistance::isNearer(QuickPoint const& point, double threshold) const {
    const PlanePoint p = point.p;
    if (m_kind == Kind::kUnknown) return std::nullopt;
    const std::optional<double> distance = m_kind == Kind::kArc ? toArc(point) : toSegment(p);
    if (!distance) return std::nullopt;
    const double slack = point.error + kSlack + kRelativeSlack * (m_size + size(p));
    if (*distance < threshold - slack) return true;
    if (*distance > threshold + slack) return false;
    return std::nullopt;
}

std::optional<double> QuickDistance::toSegment(PlanePoint p) const {
    const PlanePoint fromStart = p - m_sp;
    const double along = dot(fromStart, m_direction);
    if (along > kEndMargin && along < m_length - kEndMargin) {
        return std::fabs(cross(fromStart, m_direction));
    }
    if (along < -kEndMargin || along > m_length + kEndMargin) return toEnds(p);
    return std::nullopt;
}

std::optional<double> QuickDistance::toArc(QuickPoint const& point) const {
    // An error of the point must not turn its direction by more than a part of the margins there.
    constexpr double kLargestTurn = 1e-5;
    const PlanePoint p = point.p;
    const PlanePoint radial = p - m_centre;
    const double fromCentre = length(radial);
    if (!(fromCentre > kEndMargin && point.error < kLargestTurn * fromCentre)) return std::nullopt;
    const PlanePoint direction{radial.x / fromCentre, radial.y / fromCentre};
    if (isBesideEnd({m_centre.x + m_radius * direction.x, m_centre.y + m_radius * direction.y})) {
        return std::nullopt;
    }
    const std::optional<bool> swept = m_sweep.passes(direction);
    if (!swept) return std::nullopt;
    return *swept ? std::fabs(fromCentre - m_radius) : toEnds(p);
}

bool QuickDistance::isBesideEnd(PlanePoint p) const {
    return size(p - m_sp) < kEndMargin || size(p - m_ep) < kEndMargin;
}

double QuickDistance::toEnds(PlanePoint p) const {
    return std::min(length(p - m_sp), length(p - m_ep));
}

}  // namespace gmkernel_detail
