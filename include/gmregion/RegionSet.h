// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Element.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace gmregion {

class SetWriter;

/// What an element of a result is to the element that it comes from.
enum class OriginKind : std::uint8_t {
    kElement,   ///< it or a part of it
    kParallel,  ///< its parallel
    kCorner     ///< what joins its parallel, or its end, to the next one
};

/// Where an element of a result comes from.
struct Origin {
    std::int64_t path = 0;      ///< number of the path, as the caller gave it
    std::uint32_t element = 0;  ///< number of the element in its path, from 0
    OriginKind kind = OriginKind::kElement;
};

/// A range of somebody else's origins.
struct Origins {
    const Origin* first = nullptr;
    const Origin* last = nullptr;
    const Origin* begin() const { return first; }
    const Origin* end() const { return last; }
    std::size_t size() const { return static_cast<std::size_t>(last - first); }
};

/// A closed loop of a set: elements of the set in their order, each starting exactly where the one
/// before ends, the first where the last ends.
struct Loop {
    std::uint32_t first = 0;   ///< number of its first element in the set
    std::uint32_t last = 0;    ///< behind its last element
    std::uint32_t region = 0;  ///< number of the region that it bounds
    bool hole = false;
};

/// Regions that are clean: what they cover lies on the left of every element.
///
/// Outlines run counter-clockwise and holes clockwise. No two elements cross; loops may touch in
/// points, never along a length. No element is shorter than the tolerance, none is doubled. Only
/// clean-up and operations make sets, so nothing tests this again. A value: copies are
/// independent. All arrays are flat; references stay good until the set changes.
class RegionSet {
public:
    /// The distance within which points and curves count as the same, in length units. 0 for a set
    /// that no operation has made, which is empty.
    double tolerance() const { return m_tolerance; }

    bool empty() const { return m_loops.empty(); }
    /// Loops stand region by region: each outline, then its holes.
    const std::vector<Loop>& loops() const { return m_loops; }
    /// The elements of all loops, in the order of the loops.
    const std::vector<Element>& elements() const { return m_elements; }
    /// Number of outlines.
    std::size_t regionCount() const { return m_loops.empty() ? 0 : m_loops.back().region + 1U; }
    /// Where the element with that number comes from; several where elements coincided.
    Origins origins(std::size_t element) const {
        const std::size_t first = element == 0 ? 0 : m_originEnds[element - 1];
        return {m_origins.data() + first, m_origins.data() + m_originEnds[element]};
    }

private:
    friend class SetWriter;

    double m_tolerance = 0.0;
    std::vector<Loop> m_loops;
    std::vector<Element> m_elements;
    std::vector<std::uint32_t> m_originEnds;
    std::vector<Origin> m_origins;
};

}  // namespace gmregion
