// SPDX-License-Identifier: MIT
/// @file
/// Which vertices of a chain are corners, which are tangent.
///
/// A jump of the direction between two short elements says little where they are as short as the
/// noise. So a corner has to show from one and from four tolerances away, too: noise of up to half
/// the tolerance turns a chord of four by a quarter at the most, on both sides together by less
/// than the default angle of corners.
#include "region/simplify/Joints.h"

#include <algorithm>

#include "region/simplify/Directions.h"

namespace gmregion {

namespace {

/// Over how many tolerances directions are taken, where those of the pieces show noise; corners
/// have to show from each of them.
constexpr double kReaches[] = {1.0, 4.0};
/// A jump up to this share of that of corners is no noise.
constexpr double kCleanShare = 0.5;
/// The longest walk for that, in pieces.
constexpr std::size_t kLongestWalk = 64;

const Piece* pieceFrom(const Chain& chain, std::size_t joint, std::size_t steps, bool forward) {
    const std::size_t count = chain.pieces.size();
    if (steps >= std::min(count, kLongestWalk)) return nullptr;
    if (forward) {
        const std::size_t index = joint + steps;
        if (!chain.closed && index >= count) return nullptr;
        return &chain.pieces[index % count];
    }
    if (!chain.closed && steps >= joint) return nullptr;
    return &chain.pieces[(joint + count - 1 - steps) % count];
}

/// The direction of travel between a joint and the first vertex, before or behind it, that is at
/// least `reach` away; that of the piece there where it is that long itself.
Vec2 directionOver(const Chain& chain, std::size_t joint, bool forward, double reach) {
    const std::size_t count = chain.pieces.size();
    const Piece& near = chain.pieces[(forward ? joint : joint + count - 1) % count];
    const Vec2 at = forward ? near.e.sp : near.e.ep;
    const Vec2 dir = forward ? near.startDir : near.endDir;
    Vec2 way;
    std::size_t steps = 0;
    while (const Piece* next = pieceFrom(chain, joint, steps++, forward)) {
        way = forward ? next->e.ep - at : at - next->e.sp;
        if (dot(way, way) < reach * reach) continue;
        if (steps == 1) return dir;
        break;
    }
    const double length = lengthOf(way);
    return length > 0.0 ? (1.0 / length) * way : dir;
}

Joint jointAt(const Chain& chain, std::size_t index, const Limits& limits) {
    const std::size_t count = chain.pieces.size();
    const Piece& before = chain.pieces[(index + count - 1) % count];
    const Piece& behind = chain.pieces[index % count];
    const bool isSmooth = !jumpsBy(before.endDir, behind.startDir, limits.smooth);
    if (isSmooth && (isArc(before.e) || isArc(behind.e))) {
        const Vec2 sum = before.endDir + behind.startDir;
        const Vec2 dir = (1.0 / lengthOf(sum)) * sum;
        return {JointKind::kTangent, dir, dir};
    }
    Joint joint{JointKind::kKink, before.endDir, behind.startDir};
    for (const double reach : kReaches) {
        if (!jumpsBy(joint.dirBefore, joint.dirBehind, kCleanShare * limits.corner)) return joint;
        joint.dirBefore = directionOver(chain, index, false, reach * limits.tolerance);
        joint.dirBehind = directionOver(chain, index, true, reach * limits.tolerance);
    }
    const bool isCorner = jumpsBy(before.endDir, behind.startDir, limits.corner) &&
                          jumpsBy(joint.dirBefore, joint.dirBehind, limits.corner);
    if (isCorner) joint.kind = JointKind::kCorner;
    return joint;
}

}  // namespace

void setJoints(Chain& chain, const Limits& limits) {
    const std::size_t count = chain.pieces.size();
    chain.joints.assign(count + 1, {});
    for (std::size_t i = chain.closed ? 0 : 1; i < count; ++i)
        chain.joints[i] = jointAt(chain, i, limits);
    if (chain.closed && count > 0) chain.joints[count] = chain.joints[0];
}

void turnTo(Chain& chain, std::size_t first) {
    const auto by = static_cast<std::ptrdiff_t>(first);
    std::rotate(chain.pieces.begin(), chain.pieces.begin() + by, chain.pieces.end());
    chain.joints.pop_back();
    std::rotate(chain.joints.begin(), chain.joints.begin() + by, chain.joints.end());
    chain.joints.push_back(chain.joints.front());
}

std::size_t firstCorner(const Chain& chain) {
    std::size_t i = 0;
    while (i < chain.pieces.size() && chain.joints[i].kind != JointKind::kCorner)
        ++i;
    return i;
}

}  // namespace gmregion
