// SPDX-License-Identifier: MIT
/// @file
/// One arc for a run of pieces.
///
/// The arcs over the chord of the run are one family, by their bulge. Vertices and middles of the
/// pieces narrow the bulge to an interval; in it lies the arc that passes the vertices best, the
/// straight line where the run is of segments, or the arc that a tangent joint asks for. Each is
/// only proposed: Corridor decides.
#include "region/simplify/ArcFit.h"

#include <algorithm>
#include <cmath>

#include "region/plane/ElementWinding.h"
#include "region/simplify/BulgeRange.h"
#include "region/simplify/Corridor.h"
#include "region/simplify/Directions.h"

namespace gmregion {

namespace {

/// By how much arcs may be off the direction of the chain at a kink, as a share of the angle of
/// corners: from a joint two arcs start, and what is between them shall be no corner.
constexpr double kKinkShare = 0.5;
/// The range of bulges is for this share of the tolerance, so that its ends may pass the test.
constexpr double kRangeShare = 1.0 - 1.0 / 256.0;

/// The bulges that vertices and middles allow; false once there are none.
bool narrow(const PieceRun& run, BulgeRange& range, bool& straight) {
    straight = true;
    for (std::size_t i = run.from; i < run.to; ++i) {
        const Piece& piece = run.chain.pieces[i];
        const double t = kRangeShare * run.toleranceOf(i);
        const Vec2 m = middleOf(piece.e);
        range.keepNear(m, t);
        if (isArc(piece.e)) {
            straight = false;
            range.weigh(m);
        }
        if (i + 1 < run.to) {
            range.keepNear(piece.e.ep, std::min(t, kRangeShare * run.toleranceOf(i + 1)));
            range.weigh(piece.e.ep);
        }
        if (range.isEmpty()) return false;
    }
    return true;
}

bool suits(const Joint& joint, Vec2 wanted, Vec2 dir, const Limits& limits) {
    if (joint.kind == JointKind::kCorner) return true;
    const bool isTangent = joint.kind == JointKind::kTangent;
    return !jumpsBy(wanted, dir, isTangent ? limits.bend : kKinkShare * limits.corner);
}

bool suitsJoints(const PieceRun& run, const Piece& arc) {
    return suits(run.before(), run.before().dirBehind, arc.startDir, run.limits) &&
           suits(run.behind(), run.behind().dirBefore, arc.endDir, run.limits);
}

/// The arc of a bulge, if it will do.
std::optional<Piece> proposed(const PieceRun& run, double bulge) {
    const double b = std::max(-1.0, std::min(1.0, bulge));
    const Piece arc = standIn(run, {run.first().e.sp, run.last().e.ep, b});
    if (!suitsJoints(run, arc) || !isNear(run, arc)) return std::nullopt;
    return arc;
}

}  // namespace

Piece standIn(const PieceRun& run, const Element& e) {
    Piece piece = pieceOf(e, run.first().first);
    piece.last = run.last().last;
    piece.part = Part::kShare;
    for (std::size_t i = run.from; i < run.to; ++i)
        piece.slack = std::max(piece.slack, run.chain.pieces[i].slack);
    // Where slack does not go off the tolerance, the tolerance adds to it.
    if (!run.limits.slackCounts) piece.slack += run.limits.tolerance;
    return piece;
}

bool isNear(const PieceRun& run, const Piece& arc) {
    const Corridor corridor(arc);
    for (std::size_t i = run.from; i < run.to; ++i) {
        if (!corridor.holds(run.chain.pieces[i], run.toleranceOf(i))) return false;
    }
    return true;
}

std::optional<Piece> fitArc(const PieceRun& run) {
    const Vec2 sp = run.first().e.sp;
    const Vec2 ep = run.last().e.ep;
    if (sp == ep) return std::nullopt;
    BulgeRange range(sp, ep);
    bool straight = false;
    if (!narrow(run, range, straight)) return std::nullopt;
    if (straight && range.holds(0.0)) {
        if (auto line = proposed(run, 0.0)) return line;
    }
    if (auto arc = proposed(run, range.best())) return arc;
    const bool leaves = run.before().kind == JointKind::kTangent;
    const bool reaches = run.behind().kind == JointKind::kTangent;
    if (leaves && !reaches) return proposed(run, bulgeLeaving(run.before().dirBehind, ep - sp));
    if (reaches && !leaves) return proposed(run, bulgeReaching(ep - sp, run.behind().dirBefore));
    if (leaves) return std::nullopt;
    return proposed(run, range.middle());
}

}  // namespace gmregion
