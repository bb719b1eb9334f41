// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>

#include "region/simplify/Chain.h"

namespace gmregion {

/// A run of pieces of a chain: those from `from` on to the one before `to`. Tolerances are those of
/// the limits less the slack of each piece.
struct PieceRun {
    const Chain& chain;
    const Limits& limits;
    std::size_t from;
    std::size_t to;

    std::size_t size() const { return to - from; }
    const Piece& first() const { return chain.pieces[from]; }
    const Piece& last() const { return chain.pieces[to - 1]; }
    const Joint& before() const { return chain.joints[from]; }
    const Joint& behind() const { return chain.joints[to]; }
    double toleranceOf(std::size_t piece) const {
        return limits.slackCounts ? limits.tolerance - chain.pieces[piece].slack : limits.tolerance;
    }
};

/// One segment or arc, half a turn at the most, from end to end of a run, which is within the
/// tolerance both ways and has the directions of tangent joints; nothing when none was found. The
/// circle or line of pieces that lie on one is found exactly. Cost: linear in the pieces.
std::optional<Piece> fitArc(const PieceRun& run);

/// Whether an element from end to end of the run is within the tolerance of it both ways.
bool isNear(const PieceRun& run, const Piece& arc);

/// A piece of that form standing for the run.
Piece standIn(const PieceRun& run, const Element& e);

}  // namespace gmregion
