// SPDX-License-Identifier: MIT
#include "drawing/curves/PathCollector.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <utility>

#include "drawing/InputError.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Box;
using gmregion::Element;
using gmregion::Vec2;

namespace {

/// Past this many steps a drawing that places blocks in blocks is taken for a mistake.
constexpr std::size_t kMaxPlaced = 2'000'000;

/// Coordinates beyond this leave too few digits for the kernel's tolerance.
constexpr double kLargestCoordinate = 1e9;

bool isWithin(Vec2 p) {
    return std::abs(p.x) <= kLargestCoordinate && std::abs(p.y) <= kLargestCoordinate;
}

bool isWithin(const Path& path) {
    return std::all_of(path.elements.begin(), path.elements.end(), [](const Element& e) {
        return isWithin(e.sp) && isWithin(e.ep) && isWithin(halvingPoint(e));
    });
}

}  // namespace

void PathCollector::add(const Shape& shape, const Placement& placement, const std::string& layer) {
    countPlaced();
    if (leavesOut(shape.kind, layer)) return;
    std::optional<Path> placed = placedPath(shape, placement, m_tolerance);
    if (!placed) return skip(shape.kind, layer, "has no fit within the tolerance");
    if (!isWithin(*placed)) return skip(shape.kind, layer, "beyond the largest coordinate");
    placed->layer = layer;
    m_result.paths.push_back(std::move(*placed));
    ++m_result.report.used[shape.kind];
}

void PathCollector::skip(const std::string& kind, const std::string& layer,
                         const std::string& reason, std::size_t count) {
    if (!leavesOut(kind, layer, count)) m_result.report.unusable[{kind, layer, reason}] += count;
}

void PathCollector::addPlace(const SkippedPlace& place, const Placement& placement,
                             const std::string& layer) {
    if (!m_layers.reasonAgainst(layer).empty()) return;
    Box box;
    const Vec2 low = place.box.low;
    const Vec2 high = place.box.high;
    if (!place.box.isEmpty()) {
        for (const Vec2 corner : {low, high, Vec2{low.x, high.y}, Vec2{high.x, low.y}})
            box.include(placement.apply(corner));
    }
    m_result.report.places.push_back({place.kind, layer, box});
}

void PathCollector::leaveOut(const std::string& kind, const std::string& layer,
                             const std::string& reason) {
    ++m_result.report.leftOut[{kind, layer, reason}];
}

bool PathCollector::leavesOut(const std::string& kind, const std::string& layer,
                              std::size_t count) {
    const std::string reason = m_layers.reasonAgainst(layer);
    if (!reason.empty()) m_result.report.leftOut[{kind, layer, reason}] += count;
    return !reason.empty();
}

void PathCollector::countPlaced() {
    if (++m_placed <= kMaxPlaced) return;
    throw InputError("the blocks of the drawing place more than " + std::to_string(kMaxPlaced) +
                     " parts");
}

}  // namespace gmdrawing
