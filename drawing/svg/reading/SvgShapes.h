// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <pugixml.hpp>
#include <string_view>
#include <vector>

#include "drawing/curves/Shape.h"

namespace gmdrawing {

/// Whether elements of this name draw something that can be used.
bool isSvgShape(std::string_view name);

/// What an element of such a name draws, without its transformation and layer; none where it has no
/// size, and nothing where one of its attributes is broken.
std::optional<std::vector<Shape>> svgShapes(const pugi::xml_node& element, std::string_view name);

}  // namespace gmdrawing
