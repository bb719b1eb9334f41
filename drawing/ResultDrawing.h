// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "part/model/Path.h"

namespace gmdrawing {

/// A path that came of a source contour.
struct ResultPath {
    std::size_t pass;  ///< index of the pass
    gmpart::Path path;
    bool doubtful = false;  ///< there is a fault in what it belongs to
};

/// Names of a pass in drawings.
struct PassName {
    std::string legend;
    std::string layer;  ///< empty for results that stay on the layers of their paths
};

/// Source contours and what came of them, as the writers put them into a file.
struct ResultDrawing {
    std::vector<gmpart::Path> contours;            ///< at least one
    std::vector<std::vector<ResultPath>> results;  ///< one entry a contour
    std::vector<PassName> passes;
    /// One entry a contour, of letters and digits; without entries contours are numbered from 1.
    std::vector<std::string> labels = {};
    /// The results take the place of the sources: pictures show them over the sources, other
    /// drawings without them.
    bool replacesSources = false;
    /// Of the coordinates, by the numbers of drawings; 0 where nobody said.
    int units = 0;
};

}  // namespace gmdrawing
