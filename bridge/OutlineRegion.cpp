// SPDX-License-Identifier: MIT
/// @file
/// The side of a contour.
///
/// Points that a contour runs round counter-clockwise more often than clockwise lie on its left,
/// the others that it runs round on its right. If only one of both kinds covers something, the
/// contour has an inside and an outside, however often it crosses itself. Drawings have crossings
/// as small as their rounding, so something is what a disc of the kernel's tolerance fits into.
/// Areas decide that for nearly all contours; only what has area on both sides is offset.

#include "bridge/OutlineRegion.h"

#include "gmbridge/Curves.h"
#include "gmregion/Boolean.h"
#include "gmregion/Offset.h"
#include "gmregion/Questions.h"

namespace gmbridge {

using gmregion::FillRule;
using gmregion::Outcome;
using gmregion::PathView;
using gmregion::RegionSet;
using gmregion::Workspace;

namespace {

/// The area of the smallest disc that counts.
double smallestArea() {
    constexpr double kPi = 3.14159265358979323846;
    return kPi * GmBase::m_scdPrec * GmBase::m_scdPrec;
}

bool hasRoom(const RegionSet& set, Workspace& workspace) {
    Outcome inner;
    const bool answered = gmregion::offset(set, -GmBase::m_scdPrec, {}, workspace, inner);
    return !answered || !inner.regions.empty();
}

}  // namespace

Outcome cleanedUp(const PathView& path, FillRule rule, Workspace& workspace) {
    gmregion::Paths alone;
    alone.add(path.first, path.last, path.closed, path.id);
    Outcome outcome;
    gmregion::cleanUp(alone, {rule, 0.0}, workspace, outcome);
    return outcome;
}

Refusal refusalOf(const gmregion::Refusal& refusal, std::size_t contour) {
    if (!refusal) return {};
    return {Reason::kRegions, contour, 0, kernelPoint(refusal.at), refusal.reason};
}

OutlineRegion outlineRegion(const PathView& outline, Workspace& workspace) {
    Outcome all = cleanedUp(outline, FillRule::kNonZero, workspace);
    if (all.refusal) return {{}, GmBase::eRotNone, refusalOf(all.refusal, 0)};
    Outcome left = cleanedUp(outline, FillRule::kPositive, workspace);
    if (left.refusal) return {{}, GmBase::eRotNone, refusalOf(left.refusal, 0)};

    const double areaOfLeft = gmregion::area(left.regions);
    bool hasLeft = areaOfLeft >= smallestArea();
    bool hasRight = gmregion::area(all.regions) - areaOfLeft >= smallestArea();
    if (hasLeft && !hasRight) return {std::move(left.regions), GmBase::eRotCCW, {}};

    Outcome right;
    gmregion::combine(all.regions, left.regions, gmregion::Combination::kDifference, workspace,
                      right);
    if (right.refusal) return {{}, GmBase::eRotNone, refusalOf(right.refusal, 0)};
    if (hasLeft) {
        hasLeft = hasRoom(left.regions, workspace);
        hasRight = hasRoom(right.regions, workspace);
    }
    if (hasLeft == hasRight) return {{}, GmBase::eRotNone, {Reason::kNoSide}};
    if (hasLeft) return {std::move(left.regions), GmBase::eRotCCW, {}};
    return {std::move(right.regions), GmBase::eRotCW, {}};
}

}  // namespace gmbridge
