// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "part/model/Path.h"

namespace gmmachining {

enum class MoveKind {
    kRapid,   ///< at full speed, up or at the safe height
    kPlunge,  ///< straight down into the material
    kLead,    ///< towards a cut or off it, through waste
    kCut      ///< along an offset
};

/// One move of the tool's centre: along a path at the height z, or straight up or down to z when
/// the path has no elements.
struct Move {
    MoveKind kind;
    gmpart::Path path;
    double z;
    std::size_t contour;  ///< index of the contour that it serves
};

/// The moves of a whole job, each from where the one before ends. The surface of the material is at
/// z = 0. The first move goes up to the safe height, the second to a point from wherever the tool
/// stands, which counts as the origin.
using Toolpath = std::vector<Move>;

/// Length of all moves of a kind, up and down included.
double travel(const Toolpath& moves, MoveKind kind);

}  // namespace gmmachining
