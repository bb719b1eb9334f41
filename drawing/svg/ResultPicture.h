// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "drawing/ResultDrawing.h"

namespace gmdrawing {

/// The drawing as an SVG picture with y upwards: a group for every source contour with its number,
/// the source dark, every pass in a colour of its own. Arcs are true arcs. Doubtful results are
/// dashed. Strokes keep their width however the picture is scaled. A dot marks the start of every
/// contour, an arrow its direction.
std::string svgOf(const ResultDrawing& drawing);

}  // namespace gmdrawing
