// SPDX-License-Identifier: MIT
/// @file
/// Finding near points by cells, sorted instead of hashed.
///
/// Cells are twice as wide as the reach, so that points within it lie in the same cell or in two
/// that touch, whatever the rounding. The rows of a column follow each other in the order, so a
/// look into three columns finds all. Coordinates so large that a cell cannot be told from the next
/// one are told apart by more than the reach anyway.
#include "kernel/contour/offset/StartCells.h"

#include <algorithm>
#include <cmath>
#include <tuple>

namespace gmkernel_detail {

StartCells::StartCells(double reach) : m_width(2.0 * reach) {}

void StartCells::add(GmPoint const& start, std::size_t number) {
    if (!std::isfinite(start.X()) || !std::isfinite(start.Y())) return;
    m_entries.push_back({cellOf(start.X()), cellOf(start.Y()), number});
}

void StartCells::order() {
    std::sort(m_entries.begin(), m_entries.end(), comesBefore);
}

void StartCells::collectNear(GmPoint const& p, std::vector<std::size_t>& numbers) const {
    numbers.clear();
    if (!std::isfinite(p.X()) || !std::isfinite(p.Y())) return;
    const double row = cellOf(p.Y());
    for (const double step : {-1.0, 0.0, 1.0}) {
        const double column = cellOf(p.X()) + step;
        const Entry lowest{column, row - 1.0, 0};
        auto entry = std::lower_bound(m_entries.begin(), m_entries.end(), lowest, comesBefore);
        for (; entry != m_entries.end() && entry->column == column && entry->row <= row + 1.0;
             ++entry) {
            numbers.push_back(entry->number);
        }
    }
    std::sort(numbers.begin(), numbers.end());
    // Far out, a step of one cell may lead to the same cell again.
    numbers.erase(std::unique(numbers.begin(), numbers.end()), numbers.end());
}

bool StartCells::comesBefore(Entry const& a, Entry const& b) {
    return std::tie(a.column, a.row, a.number) < std::tie(b.column, b.row, b.number);
}

double StartCells::cellOf(double coordinate) const {
    const double cell = std::floor(coordinate / m_width);
    return std::isfinite(cell) ? cell : coordinate;
}

}  // namespace gmkernel_detail
