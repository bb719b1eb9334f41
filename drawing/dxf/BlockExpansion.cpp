// SPDX-License-Identifier: MIT
/// @file
/// Placing blocks within blocks.
///
/// References are followed depth first, each with the placement of all that hold it; a block that
/// places itself is noticed by the row of open blocks. Since few lines can place a block millions
/// of times, what is placed is counted, blocks as well as paths, and too much ends the expansion.

#include "drawing/dxf/BlockExpansion.h"

#include <algorithm>

#include "drawing/dxf/BlockPlacement.h"

namespace gmdrawing {

namespace {

/// Blocks nested deeper than this are taken for a mistake.
constexpr std::size_t kMaxDepth = 64;

class Expansion {
public:
    Expansion(const Drawing& drawing, const ExpansionRules& rules)
        : m_drawing(drawing), m_rules(rules), m_collector(rules.curveTolerance, rules.layers) {}

    PlacedPaths run() {
        expand(m_drawing.model, m_rules.placement, "0");
        return m_collector.take();
    }

private:
    void expand(const Block& block, const Placement& placement, const std::string& layer) {
        for (const auto& [kind, count] : block.report.unusable)
            m_collector.skip(kind.kind, placedLayer(kind.layer, layer), kind.reason, count);
        for (const SkippedPlace& place : block.report.places)
            m_collector.addPlace(place, placement, placedLayer(place.layer, layer));
        for (const Shape& shape : block.shapes)
            m_collector.add(shape, placement, placedLayer(shape.layer, layer));
        for (const BlockReference& reference : block.references)
            expandReference(reference, placement, placedLayer(reference.layer, layer));
    }

    void expandReference(const BlockReference& reference, const Placement& placement,
                         const std::string& layer) {
        const auto found = m_drawing.blocks.find(reference.block);
        if (found == m_drawing.blocks.end()) {
            return skip(layer, "block is not defined");
        }
        const bool recursive =
            std::find(m_open.begin(), m_open.end(), &found->second) != m_open.end();
        if (recursive) return skip(layer, "block places itself");
        if (m_rules.layers.isFrozen(layer) && m_collector.leavesOut("INSERT", layer)) return;
        if (m_open.size() >= kMaxDepth) return skip(layer, "nested too deeply");
        if (!blockPlacement(reference, {}, 0, 0)) return skip(layer, "its scale is 0");
        m_open.push_back(&found->second);
        expandCells(reference, found->second, placement, layer);
        m_open.pop_back();
    }

    void expandCells(const BlockReference& reference, const Block& block,
                     const Placement& placement, const std::string& layer) {
        for (int row = 0; row < reference.rows; ++row) {
            for (int column = 0; column < reference.columns; ++column) {
                m_collector.countPlaced();
                const auto cell = blockPlacement(reference, block.base, column, row);
                expand(block, placement.after(*cell), layer);
            }
        }
    }

    void skip(const std::string& layer, const char* reason) {
        m_collector.skip("INSERT", layer, reason);
        m_collector.addPlace({"INSERT", layer, {}}, {}, layer);
    }

    static std::string placedLayer(const std::string& own, const std::string& ofReference) {
        return own == "0" ? ofReference : own;
    }

    const Drawing& m_drawing;
    const ExpansionRules& m_rules;
    std::vector<const Block*> m_open;  ///< blocks being placed, outermost first
    PathCollector m_collector;
};

}  // namespace

PlacedPaths expandBlocks(const Drawing& drawing, const ExpansionRules& rules) {
    return Expansion(drawing, rules).run();
}

}  // namespace gmdrawing
