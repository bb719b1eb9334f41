// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "drawing/SkipReport.h"
#include "drawing/dxf/Drawing.h"
#include "part/model/Placement.h"

namespace gmdrawing {

/// The paths of a drawing with all blocks placed.
struct ExpandedDrawing {
    std::vector<gmpart::Path> paths;
    SkipReport skipped;
};

/// Places everything the drawing holds, blocks within blocks included. Paths on layer "0" of a
/// block take the layer of the reference that places it.
///
/// References to unknown blocks, to a block from within itself, and with a scale that is not
/// uniform are counted as unusable; so are paths that come to lie beyond 1e9 units. Throws
/// InputError when the blocks multiply beyond two million paths and placed blocks, and counts
/// blocks nested deeper than 64 as unusable.
ExpandedDrawing expandBlocks(const Drawing& drawing, const gmpart::Placement& placement);

}  // namespace gmdrawing
