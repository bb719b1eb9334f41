#pragma once

#include <string>

#include "OffsetDrawing.h"

namespace gmpath {

/// The drawing as an SVG picture with y upwards: a group for every source contour with its number,
/// the source dark, every pass in a colour of its own. Arcs are true arcs. Results of
/// offsets with a fault are dashed. Strokes keep their width however the picture is scaled. A dot
/// marks the start of every contour, an arrow its direction.
std::string svgOf(const OffsetDrawing& drawing);

/// The course of a path as SVG path data, with y turned downwards as the picture needs it.
std::string svgPathData(const Path& path);

}  // namespace gmpath
