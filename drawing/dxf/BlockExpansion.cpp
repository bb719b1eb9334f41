// SPDX-License-Identifier: MIT
/// @file
/// Placing blocks within blocks.
///
/// References are followed depth first, each with the placement of all that hold it; a block that
/// places itself is noticed by the row of open blocks. Since few lines can place a block millions
/// of times, what is placed is counted, blocks as well as paths, and too much ends the expansion.

#include "drawing/dxf/BlockExpansion.h"

#include <algorithm>
#include <cmath>

#include "drawing/InputError.h"
#include "drawing/dxf/BlockPlacement.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Element;
using gmregion::Vec2;

namespace {

/// Blocks placed in blocks multiply; past this many steps the drawing is taken for a mistake.
constexpr std::size_t kMaxPlaced = 2'000'000;

/// Blocks nested deeper than this are taken for a mistake.
constexpr std::size_t kMaxDepth = 64;

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

class Expansion {
public:
    Expansion(const Drawing& drawing, const ExpansionRules& rules)
        : m_drawing(drawing), m_rules(rules) {}

    ExpandedDrawing run() {
        expand(m_drawing.model, m_rules.placement, "0");
        return std::move(m_result);
    }

private:
    void expand(const Block& block, const Placement& placement, const std::string& layer) {
        for (const auto& [kind, count] : block.report.unusable)
            skip(kind.kind, placedLayer(kind.layer, layer), kind.reason, count);
        for (const Shape& shape : block.shapes)
            add(shape, placement, layer);
        for (const BlockReference& reference : block.references)
            expandReference(reference, placement, placedLayer(reference.layer, layer));
    }

    void add(const Shape& shape, const Placement& placement, const std::string& outerLayer) {
        countPlaced();
        const std::string layer = placedLayer(shape.layer, outerLayer);
        if (leavesOut(shape.kind, layer, 1)) return;
        std::optional<Path> placed = placedPath(shape, placement, m_rules.curveTolerance);
        if (!placed) return skip(shape.kind, layer, "has no fit within the tolerance", 1);
        if (!isWithin(*placed)) return skip(shape.kind, layer, "beyond the largest coordinate", 1);
        placed->layer = layer;
        m_result.paths.push_back(std::move(*placed));
        ++m_result.report.used[shape.kind];
    }

    bool leavesOut(const std::string& kind, const std::string& layer, std::size_t count) {
        const std::string reason = m_rules.layers.reasonAgainst(layer);
        if (!reason.empty()) m_result.report.leftOut[{kind, layer, reason}] += count;
        return !reason.empty();
    }

    void expandReference(const BlockReference& reference, const Placement& placement,
                         const std::string& layer) {
        const auto found = m_drawing.blocks.find(reference.block);
        if (found == m_drawing.blocks.end()) {
            return skip("INSERT", layer, "block is not defined", 1);
        }
        const bool recursive =
            std::find(m_open.begin(), m_open.end(), &found->second) != m_open.end();
        if (recursive) return skip("INSERT", layer, "block places itself", 1);
        if (m_rules.layers.isFrozen(layer) && leavesOut("INSERT", layer, 1)) return;
        if (m_open.size() >= kMaxDepth) return skip("INSERT", layer, "nested too deeply", 1);
        if (!blockPlacement(reference, {}, 0, 0)) return skip("INSERT", layer, "its scale is 0", 1);
        m_open.push_back(&found->second);
        expandCells(reference, found->second, placement, layer);
        m_open.pop_back();
    }

    void expandCells(const BlockReference& reference, const Block& block,
                     const Placement& placement, const std::string& layer) {
        for (int row = 0; row < reference.rows; ++row) {
            for (int column = 0; column < reference.columns; ++column) {
                countPlaced();
                const auto cell = blockPlacement(reference, block.base, column, row);
                expand(block, placement.after(*cell), layer);
            }
        }
    }

    static std::string placedLayer(const std::string& own, const std::string& ofReference) {
        return own == "0" ? ofReference : own;
    }

    void skip(const std::string& kind, const std::string& layer, const std::string& reason,
              std::size_t count) {
        if (!leavesOut(kind, layer, count))
            m_result.report.unusable[{kind, layer, reason}] += count;
    }

    void countPlaced() {
        if (++m_placed <= kMaxPlaced) return;
        throw InputError("the blocks of the drawing place more than " + std::to_string(kMaxPlaced) +
                         " parts");
    }

    const Drawing& m_drawing;
    const ExpansionRules& m_rules;
    std::vector<const Block*> m_open;  ///< blocks being placed, outermost first
    std::size_t m_placed = 0;
    ExpandedDrawing m_result;
};

}  // namespace

ExpandedDrawing expandBlocks(const Drawing& drawing, const ExpansionRules& rules) {
    return Expansion(drawing, rules).run();
}

}  // namespace gmdrawing
