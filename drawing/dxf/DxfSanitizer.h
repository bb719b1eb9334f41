// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <string>
#include <vector>

#include "drawing/ReadReport.h"
#include "drawing/dxf/DxfGroups.h"

namespace gmdrawing {

/// A drawing cut down to what contours are made of.
struct SanitizedDrawing {
    /// DXF text with the usable entities and blocks only: known kinds, sound numbers, right counts.
    std::string text;
    /// Entities left out, by the block that holds them; the drawing itself goes by the empty name.
    std::map<std::string, SkipCounts> skipped;
    /// Of these what may belong to an outline, by block as well.
    std::map<std::string, std::vector<SkippedPlace>> places;
    double lowest = 0.0;   ///< least height of a usable entity
    double highest = 0.0;  ///< largest height of a usable entity
};

/// Sorts the entities of the drawing and its blocks into usable and unusable ones.
///
/// Unusable are entities of other kinds, entities whose numbers are missing, no numbers, not finite
/// or beyond 1e9, entities of the paper space, hidden ones, and meshes. What is left cannot upset
/// the DXF library, which trusts the counts and numbers in its input.
SanitizedDrawing sanitizedDrawing(const std::vector<DxfGroup>& groups);

}  // namespace gmdrawing
