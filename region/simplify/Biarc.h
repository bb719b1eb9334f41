// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <optional>

#include "region/simplify/ArcFit.h"

namespace gmregion {

/// Two arcs that meet with a common tangent.
using Biarc = std::array<Element, 2>;

/// Two points and the unit directions of travel there.
struct Ends {
    Vec2 sp;
    Vec2 startDir;
    Vec2 ep;
    Vec2 endDir;
};

/// The biarc whose arcs have equal tangents; nothing where there is none of half turns at the most.
std::optional<Biarc> biarcBetween(const Ends& ends);

/// A biarc from end to end of a run, within the tolerance both ways. It has the directions of
/// tangent joints, and those of the run where its ends are none. Cost: linear in the pieces.
std::optional<std::array<Piece, 2>> fitBiarc(const PieceRun& run);

}  // namespace gmregion
