// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "drawing/curves/Shape.h"

namespace gmdrawing {

/// The subpaths of path data, without kind and layer, as they are drawn: closed where the data
/// close them. Circular arcs are elements, everything else that bends is a curve. Arcs follow the
/// rules of the format: radii that are too small grow, without radii they are lines. Nothing for
/// data that are broken anywhere.
std::optional<std::vector<Shape>> pathShapes(const std::string& data);

/// The placement that a list of transformations stands for; nothing for a broken list and for one
/// that leaves no area.
std::optional<Placement> placementOf(const std::string& transformations);

/// The corners of polylines and polygons; nothing for a broken list.
std::optional<std::vector<gmregion::Vec2>> cornersOf(const std::string& points);

}  // namespace gmdrawing
