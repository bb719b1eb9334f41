// SPDX-License-Identifier: MIT
#pragma once

#include "drawing/curves/PathCollector.h"
#include "drawing/dxf/Drawing.h"

namespace gmdrawing {

/// How a drawing is taken apart.
struct ExpansionRules {
    Placement placement;           ///< of the whole
    double curveTolerance = 0.01;  ///< of arcs for other curves, in units of the result
    LayerChoice layers;
};

/// Places everything the drawing holds, blocks within blocks included. Paths on layer "0" of a
/// block take the layer of the reference that places it.
///
/// References to unknown blocks, to a block from within itself, and with a scale of 0 are counted
/// as unusable; so are curves of which there is no fit, and paths that come to lie beyond 1e9
/// units. What lies on layers that are not wanted is left out and counted; so is all of a block
/// that is placed on a frozen layer. Throws InputError when the blocks multiply beyond two million
/// paths and placed blocks, and counts blocks nested deeper than 64 as unusable.
PlacedPaths expandBlocks(const Drawing& drawing, const ExpansionRules& rules);

}  // namespace gmdrawing
