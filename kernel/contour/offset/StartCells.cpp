// SPDX-License-Identifier: MIT
/// @file
/// Finding near points by cells, sorted instead of hashed.
///
/// Cells are far wider than the reach, so that what is within it mostly lies in one cell. The rows
/// of a column follow each other in the order, so a look into the columns that the reach touches
/// finds all. Sums round monotonously, which keeps this true where the reach is less than a digit
/// of the coordinates.
#include "kernel/contour/offset/StartCells.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <tuple>

namespace gmkernel_detail {

namespace {

/// The width of a cell, in reaches.
constexpr double kReaches = 64.0;

}  // namespace

StartCells::StartCells(double reach) : m_reach(reach), m_width(kReaches * reach) {}

void StartCells::add(Vec3 const& start, std::size_t number) {
    if (!std::isfinite(start.x) || !std::isfinite(start.y)) return;
    m_entries.push_back({cellOf(start.x), cellOf(start.y), number});
}

void StartCells::order() {
    std::sort(m_entries.begin(), m_entries.end(), comesBefore);
}

void StartCells::collectNear(Vec3 const& p, std::vector<std::size_t>& numbers) const {
    numbers.clear();
    if (!std::isfinite(p.x) || !std::isfinite(p.y)) return;
    const double lowestRow = cellOf(p.y - m_reach);
    const double highestRow = cellOf(p.y + m_reach);
    const std::array<double, 3> columns{cellOf(p.x - m_reach), cellOf(p.x), cellOf(p.x + m_reach)};
    for (std::size_t i = 0; i < columns.size(); ++i) {
        if (i > 0 && columns[i] == columns[i - 1]) continue;
        const Entry lowest{columns[i], lowestRow, 0};
        auto entry = std::lower_bound(m_entries.begin(), m_entries.end(), lowest, comesBefore);
        for (; entry != m_entries.end() && entry->column == columns[i] && entry->row <= highestRow;
             ++entry) {
            numbers.push_back(entry->number);
        }
    }
    std::sort(numbers.begin(), numbers.end());
}

bool StartCells::comesBefore(Entry const& a, Entry const& b) {
    return std::tie(a.column, a.row, a.number) < std::tie(b.column, b.row, b.number);
}

double StartCells::cellOf(double coordinate) const {
    const double cell = std::floor(coordinate / m_width);
    return std::isfinite(cell) ? cell : coordinate;
}

}  // namespace gmkernel_detail
