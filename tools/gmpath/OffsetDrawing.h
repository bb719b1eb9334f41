#pragma once

#include <vector>

#include "OffsetJob.h"

namespace gmpath {

/// A part and its offsets, as the writers put them into a file.
struct OffsetDrawing {
    const std::vector<Path>& contours;           ///< at least one
    const std::vector<ContourOffsets>& offsets;  ///< one entry a contour
    const std::vector<double>& distances;        ///< one entry a pass
};

}  // namespace gmpath
