// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <variant>
#include <vector>

#include "drawing/curves/Bezier.h"

namespace gmdrawing {

/// A line or an arc, or a piece of another curve.
using Stroke = std::variant<gmregion::Element, Bezier>;

/// An entity as it is drawn: strokes that follow each other.
struct Shape {
    std::string kind;  ///< of the entity, as the drawing calls it
    std::string layer;
    bool closed = false;  ///< the last stroke ends where the first starts
    std::vector<Stroke> strokes = {};
};

/// The shape as a path where `placement` takes it. Lines and arcs stay what they are under a
/// similarity, arcs become ellipses under other maps; ellipses and other curves become arcs and
/// segments within the tolerance, in units of the result. Nothing where no fit exists (`fitted`).
std::optional<gmpart::Path> placedPath(const Shape& shape, const Placement& placement,
                                       double tolerance);

}  // namespace gmdrawing
