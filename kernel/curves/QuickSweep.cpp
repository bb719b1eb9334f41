// SPDX-License-Identifier: MIT
/// @file
/// Sweeps by signs of products instead of angles.
///
/// A direction lies in a sweep of less than half a turn when it is to the left of the one end and
/// to the right of the other; in a wider one when either holds. That differs from the order of the
/// stored angles by rounding, and next to the axes, where angles snap. Both are kept out by a
/// margin about the ends that is far wider. Constant cost, with sines and cosines for the
/// directions of a new arc alone.
#include "kernel/curves/QuickSweep.h"

#include <algorithm>
#include <cmath>

#include "kernel/values/Angles.h"

namespace gmkernel_detail {

namespace {

/// Beside kEndMargin on the circle, a margin for directions: those next to an axis are taken for
/// the axis, within a fifth of this.
constexpr double kDirectionMargin = 5e-4;

/// By how much the directions of two ways to a halving point may differ, in radians, several times
/// over: by the rounding of angles, and by what the arc cosine that the exact point takes the sweep
/// from loses beside half and full circles.
constexpr double kAngleRounding = 2e-14;
constexpr double kCosineRounding = 4e-15;
constexpr double kLargestCosineLoss = 5e-8;

/// Sweeps whose ends are nearer to each other have no quick halving point (on the unit circle).
constexpr double kClosestEnds = 1e-4;

/// Sweeps of other radii are not decided, in length units.
constexpr double kSmallestRadius = 1e-2;
constexpr double kLargestRadius = 1e6;

/// The direction of the angle that is stored for a moved end: that of the end itself, unless the
/// angle snapped to an axis.
PlanePoint directionOfEnd(PlainArc const& arc, Vec3 const& end, double degrees) {
    const Vec3 radial = standardized(end - arc.m);
    const bool snaps =
        std::fabs(radial.x) < GmBase::m_scdPrec || std::fabs(radial.y) < GmBase::m_scdPrec;
    return planePoint(snaps || radial.z != 0.0 ? directionAt(degrees) : radial);
}

bool isDecidable(PlainArc const& arc) {
    const bool hasSense = arc.sense == GmBase::eRotCW || arc.sense == GmBase::eRotCCW;
    return hasSense && arc.r > kSmallestRadius && arc.r < kLargestRadius;
}

}  // namespace

QuickSweep::QuickSweep(PlainArc const& arc)
    : m_start(planePoint(directionAt(arc.startDegrees))),
      m_end(planePoint(directionAt(arc.endDegrees))) {
    classify(arc);
}

void QuickSweep::startMoved(PlainArc const& arc) {
    m_start = directionOfEnd(arc, arc.sp, arc.startDegrees);
    classify(arc);
}

void QuickSweep::endMoved(PlainArc const& arc) {
    m_end = directionOfEnd(arc, arc.ep, arc.endDegrees);
    classify(arc);
}

void QuickSweep::classify(PlainArc const& arc) {
    m_clockwise = arc.sense == GmBase::eRotCW;
    m_margin = kDirectionMargin + kEndMargin / arc.r;
    const bool full = isSamePoint(arc.sp, arc.ep);
    if (!isDecidable(arc) || (!full && isNextTo(m_start, m_end))) {
        m_kind = Kind::kUnknown;
    } else if (full) {
        m_kind = Kind::kFull;
    } else {
        const double turn = cross(m_start, m_end);
        m_kind = (m_clockwise ? turn > 0.0 : turn < 0.0) ? Kind::kWide : Kind::kNarrow;
    }
}

bool QuickSweep::isNextTo(PlanePoint a, PlanePoint b) const {
    return dot(a, b) > 0.0 && std::fabs(cross(a, b)) < m_margin;
}

std::optional<bool> QuickSweep::passes(PlanePoint direction) const {
    if (m_kind == Kind::kFull) return true;
    if (m_kind == Kind::kUnknown || isNextTo(direction, m_start) || isNextTo(direction, m_end)) {
        return std::nullopt;
    }
    const double fromStart = cross(m_start, direction);
    const double toEnd = cross(direction, m_end);
    const bool afterStart = m_clockwise ? fromStart < 0.0 : fromStart > 0.0;
    const bool beforeEnd = m_clockwise ? toEnd < 0.0 : toEnd > 0.0;
    return m_kind == Kind::kWide ? afterStart || beforeEnd : afterStart && beforeEnd;
}

std::optional<QuickPoint> QuickSweep::halvingPoint(PlainArc const& arc) const {
    // Ends of a sweep are symmetric to the direction of its middle, so their difference is square
    // to it, and the turn from the middle to the difference has the sense of the arc.
    const PlanePoint across = m_start - m_end;
    const double width = length(across);
    if (!(width > kClosestEnds)) return std::nullopt;
    const double scale = (m_clockwise ? -arc.r : arc.r) / width;
    const double loss =
        std::min(kLargestCosineLoss, kCosineRounding / std::fabs(cross(m_start, m_end)));
    return QuickPoint{{arc.m.x - scale * across.y, arc.m.y + scale * across.x},
                      arc.r * (kAngleRounding + loss)};
}

}  // namespace gmkernel_detail
