// SPDX-License-Identifier: MIT
/// @file
/// Which pieces of an element's own band need not be intersected.
///
/// The band of a segment has four pieces. Both parallels never meet. Both caps are half circles
/// that turn their backs to each other: where their circles cross, they are not. A cap and a
/// parallel touch at their joint, where nothing is split, since it is an end of both.
///
/// Computed, the tangent point lies a little beside the joint, or it comes out as two points on
/// either side: then the one is on the parallel but before the cap, the other on the cap but beyond
/// the parallel. That holds while the ends of the cap are told apart from other directions. So the
/// bounds below leave out what is bent or tilted by the tolerances themselves: segments whose
/// direction is not quite that of their ends, lines so near to the direction of y that they are
/// taken for vertical, and caps that end so near to the direction of an axis that the angle of a
/// cut beside the joint snaps to the axis while that of the joint does not; and sizes at which
/// rounding comes near to the tolerances.
///
/// One joint counts nevertheless: that of an end cap with the parallel before it. A cut next to it
/// may have the same angle, and then the order of both points decides where the cap is split.
#include "kernel/contour/offset/OwnBand.h"

#include <cmath>

#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// Bounds of what is common, in length units.
constexpr double kShortest = 0.01;
constexpr double kNearest = 0.01;
constexpr double kFarthest = 50.0;
constexpr double kLargestCoordinate = 1e4;

/// What counts as no deviation, in length units.
constexpr double kNone = 1e-11;

/// Directions with a component below this are next to an axis.
constexpr double kNextToAxis = 2e-4;

bool isCommonPlace(Vec3 const& p) {
    return std::fabs(p.x) < kLargestCoordinate && std::fabs(p.y) < kLargestCoordinate;
}

bool isCommon(PlainSegment const& segment) {
    return isCommonPlace(segment.sp) && isCommonPlace(segment.ep) && segment.sp.z == segment.ep.z &&
           distance(segment.sp, segment.ep) > kShortest &&
           distance(segment.ep, footOn(segment, segment.ep)) < kNone;
}

/// Is a segment tilted against an axis by so little that it may be taken for parallel to it?
bool isTilted(PlainSegment const& segment) {
    const auto isNextToAxis = [](double component, double extent) {
        return std::fabs(component) <= kNextToAxis && !(std::fabs(extent) < kNone);
    };
    return isNextToAxis(segment.dir.x, segment.ep.x - segment.sp.x) ||
           isNextToAxis(segment.dir.y, segment.ep.y - segment.sp.y);
}

}  // namespace

bool cutsItself(GmCurve const& element, double d) {
    auto const* const stretch = curveAs<GmStretch>(element);
    if (stretch == nullptr || !(std::fabs(d) > kNearest && std::fabs(d) < kFarthest)) return true;
    const PlainSegment segment = plainOf(*stretch);
    return !isCommon(segment) || isTilted(segment);
}

bool onlyTouch(Piece const& added, Piece const& old) {
    if (old.source() != added.source()) return false;
    return added.role() != PieceRole::kEndCap || old.role() == PieceRole::kStartCap;
}

}  // namespace gmkernel_detail
