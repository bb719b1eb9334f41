// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "drawing/LayerChoice.h"
#include "drawing/ReadReport.h"
#include "drawing/curves/Shape.h"

namespace gmdrawing {

/// The paths of a drawing with everything in its place.
struct PlacedPaths {
    std::vector<gmpart::Path> paths;
    ReadReport report;
};

/// Takes up what a drawing holds, shape by shape, and counts what has to be left out.
class PathCollector {
public:
    /// @param curveTolerance of arcs for other curves, in units of the result
    /// @param layers which are wanted; must live as long as this
    PathCollector(double curveTolerance, const LayerChoice& layers)
        : m_tolerance(curveTolerance), m_layers(layers) {}

    /// Takes a shape up where `placement` takes it. Curves of which there is no fit, and shapes
    /// that come to lie beyond 1e9 units, are counted as unusable. Throws InputError as countPlaced
    /// does.
    void add(const Shape& shape, const Placement& placement, const std::string& layer);

    /// Counts what cannot be used; on layers that are not wanted it is left out. Where it lies is
    /// told by addPlace.
    void skip(const std::string& kind, const std::string& layer, const std::string& reason,
              std::size_t count = 1);

    /// Takes up where something lies that cannot be used, unless its layer is not wanted.
    void addPlace(const SkippedPlace& place, const Placement& placement, const std::string& layer);

    /// Counts what is not wanted for another reason than its layer.
    void leaveOut(const std::string& kind, const std::string& layer, const std::string& reason);

    /// Whether the layer is not wanted; then the entities are counted.
    bool leavesOut(const std::string& kind, const std::string& layer, std::size_t count = 1);

    /// Counts something that was placed, a shape or what holds shapes. Throws InputError beyond two
    /// million: few lines can place a shape millions of times.
    void countPlaced();

    PlacedPaths take() { return std::move(m_result); }

private:
    double m_tolerance;
    const LayerChoice& m_layers;
    std::size_t m_placed = 0;
    PlacedPaths m_result;
};

}  // namespace gmdrawing
