// SPDX-License-Identifier: MIT
/// @file
/// Strands along a curve that fills the plane.
///
/// Going from strand to strand, row by row or along a curve of Hilbert's, takes a way of about the
/// root of their number times the size of the drawing; in a shuffled order it takes about their
/// number times that size. So the length of the way tells whether it is worth sorting.
#include "region/overlay/StrandOrder.h"

#include <algorithm>
#include <cmath>

#include "region/model/Box.h"

namespace gmregion {

namespace {

/// In sizes of the drawing times the root of the number of strands: a way no longer serves.
constexpr double kLongWay = 4.0;
constexpr std::uint32_t kCells = 1U << 16;  ///< in a row of the curve's grid

/// The place of a cell along Hilbert's curve.
std::uint64_t alongHilbert(std::uint32_t x, std::uint32_t y) {
    std::uint64_t place = 0;
    for (std::uint32_t side = kCells / 2; side > 0; side /= 2) {
        const bool isRight = (x & side) != 0;
        const bool isUpper = (y & side) != 0;
        place += std::uint64_t{side} * side * ((isRight ? 3U : 0U) ^ (isUpper ? 1U : 0U));
        if (isUpper) continue;
        if (isRight) {
            x = kCells - 1 - x;
            y = kCells - 1 - y;
        }
        std::swap(x, y);
    }
    return place;
}

std::uint32_t cellOf(double share) {
    const double cell = std::min(std::max(share * kCells, 0.0), kCells - 1.0);
    return static_cast<std::uint32_t>(cell);
}

Vec2 centreOf(const Strands& strands, Index strand) {
    const Strand& s = strands.strands[strand];
    Box box;
    for (Index i = s.first; i < s.last; ++i)
        box.include(strands.elements[i].sp);
    box.include(strands.elements[s.last - 1].ep);
    return 0.5 * (box.low + box.high);
}

bool isLongWay(const std::vector<Vec2>& stops, Vec2 size) {
    double way = 0.0;
    for (std::size_t i = 1; i < stops.size(); ++i)
        way += std::fabs(stops[i].x - stops[i - 1].x) + std::fabs(stops[i].y - stops[i - 1].y);
    return way > kLongWay * std::sqrt(static_cast<double>(stops.size())) * (size.x + size.y);
}

}  // namespace

void StrandOrder::improve(Strands& strands, Index split) {
    const auto& all = strands.strands;
    const auto isOfFirst = [split](const Strand& s) { return s.first < split; };
    const Index middle =
        static_cast<Index>(std::partition_point(all.begin(), all.end(), isOfFirst) - all.begin());
    const Index count = static_cast<Index>(all.size());
    m_places.clear();
    place(strands, 0, middle);
    const bool isFirstMoved = !m_places.empty();
    place(strands, middle, count);
    if (!isFirstMoved && m_places.empty()) return;
    m_ordered.clear();
    const auto append = [&](Index strand) {
        const Strand& s = all[strand];
        m_ordered.elements.insert(m_ordered.elements.end(), strands.elements.begin() + s.first,
                                  strands.elements.begin() + s.last);
        m_ordered.endStrand(s.closed, s.weight);
    };
    if (!isFirstMoved) {
        for (Index strand = 0; strand < middle; ++strand)
            append(strand);
    }
    for (const Place& p : m_places)
        append(p.strand);
    for (Index strand = static_cast<Index>(m_ordered.strands.size()); strand < count; ++strand)
        append(strand);
    std::swap(strands, m_ordered);
}

/// Appends the places of a range of strands in their new order; nothing when the old one serves.
void StrandOrder::place(const Strands& strands, Index first, Index last) {
    m_centres.clear();
    Box box;
    for (Index strand = first; strand < last; ++strand) {
        m_centres.push_back(centreOf(strands, strand));
        box.include(m_centres.back());
    }
    const Vec2 size = box.size();
    if (!isLongWay(m_centres, size)) return;
    const double side = std::max(size.x, size.y);
    const std::size_t before = m_places.size();
    for (Index strand = first; strand < last; ++strand) {
        const Vec2 at = m_centres[strand - first] - box.low;
        m_places.push_back({alongHilbert(cellOf(at.x / side), cellOf(at.y / side)), strand});
    }
    std::sort(m_places.begin() + static_cast<std::ptrdiff_t>(before), m_places.end(),
              [](const Place& p, const Place& q) {
                  return p.key != q.key ? p.key < q.key : p.strand < q.strand;
              });
}

}  // namespace gmregion
