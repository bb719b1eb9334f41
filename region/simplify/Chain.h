// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <vector>

#include "region/model/Element.h"

namespace gmregion {

/// What of an element of the source a piece is.
enum class Part : std::uint8_t {
    kWhole,       ///< the element, or several of them
    kFirstHalf,   ///< half of an element that turns by more than half a turn
    kSecondHalf,  ///< the other half
    kShare        ///< something made to stand for a part of it, or for parts of several
};

/// An element of the chain that is simplified; it turns by half a turn at the most.
struct Piece {
    Element e;
    Vec2 startDir;            ///< unit direction of travel at the start
    Vec2 endDir;              ///< and at the end
    double slack = 0;         ///< how far it may be from what the caller gave, in length units
    std::uint32_t first = 0;  ///< number of the first element of the source that it stands for
    std::uint32_t last = 0;   ///< and of the last one
    Part part = Part::kWhole;
    double wholeBulge = 0;  ///< of the element that this is a half of
};

/// A piece with its directions.
Piece pieceOf(const Element& e, std::uint32_t source);

/// How a chain goes on at a vertex.
enum class JointKind : std::uint8_t {
    kCorner,  ///< it stays: an end, or a jump of the direction
    kKink,    ///< it may vanish, and a result may jump there
    kTangent  ///< it may vanish; a result that keeps it has the direction of the joint
};

/// Directions at a kink are those of the chain over some tolerances, before and behind it; at a
/// tangent joint both are the same; at a corner they are not set.
struct Joint {
    JointKind kind = JointKind::kCorner;
    Vec2 dirBefore;
    Vec2 dirBehind;
};

/// A path on its way to a simpler one. Each piece starts exactly where the one before ends.
struct Chain {
    std::vector<Piece> pieces;
    std::vector<Joint> joints;  ///< one more than pieces; number i stands before piece i
    bool closed = false;

    void clear() {
        pieces.clear();
        joints.clear();
        closed = false;
    }
};

/// The limits that a chain is simplified under.
struct Limits {
    double tolerance = 0;  ///< in length units
    double corner = 0;     ///< tangent of half the angle
    double smooth = 0;     ///< tangent of half the angle
    /// How far arcs may be off the direction of tangent joints, tangent of half the angle.
    double bend = 0;
    double rounding = 0;      ///< distance that counts as none, in length units
    bool slackCounts = true;  ///< whether the slack of pieces goes off the tolerance
};

}  // namespace gmregion
