// SPDX-License-Identifier: MIT
#pragma once

#include <cmath>
#include <cstdint>
#include <unordered_map>
#include <utility>
#include <vector>

#include "region/model/Vec2.h"

namespace gmregion {

/// Numbered points in square cells, for looking up neighbours within the cell width.
class PointGrid {
public:
    /// `cell` is the cell width, positive; widths below 1e-9 are raised to it.
    explicit PointGrid(double cell) : m_cell(cell < kSmallestCell ? kSmallestCell : cell) {}

    void add(Vec2 p, std::size_t number) { m_cells[{cellOf(p.x), cellOf(p.y)}].push_back(number); }

    /// Calls visit(number) for every point in the cell of p and the eight cells round it: all
    /// points within the cell width of p, and some beyond.
    template <typename Visit>
    void visitNear(Vec2 p, const Visit& visit) const {
        for (std::int64_t dx = -1; dx <= 1; ++dx) {
            for (std::int64_t dy = -1; dy <= 1; ++dy) {
                const auto found = m_cells.find({cellOf(p.x) + dx, cellOf(p.y) + dy});
                if (found == m_cells.end()) continue;
                for (const std::size_t number : found->second)
                    visit(number);
            }
        }
    }

private:
    using Cell = std::pair<std::int64_t, std::int64_t>;

    struct CellHash {
        std::size_t operator()(const Cell& cell) const {
            constexpr std::uint64_t kMix = 0x9E3779B97F4A7C15ULL;  // golden ratio, 64 bits
            const auto x = static_cast<std::uint64_t>(cell.first);
            const auto y = static_cast<std::uint64_t>(cell.second);
            std::uint64_t h = (x * kMix ^ y) * kMix;
            h ^= h >> 32U;
            return static_cast<std::size_t>(h);
        }
    };

    static constexpr double kSmallestCell = 1e-9;

    std::int64_t cellOf(double coordinate) const {
        return static_cast<std::int64_t>(std::floor(coordinate / m_cell));
    }

    double m_cell;
    std::unordered_map<Cell, std::vector<std::size_t>, CellHash> m_cells;
};

}  // namespace gmregion
