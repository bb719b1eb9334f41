// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <cstddef>
#include <vector>

#include "kernel/curves/CurveBox.h"

namespace gmkernel_detail {

/// Boxes in a row, for finding those that overlap another one without a look at all of them.
///
/// Level upon level, every eight neighbours have a box about them, so that whole stretches of the
/// row are passed over. That is quick where neighbours in the row are neighbours in the plane, as
/// along a contour. The row grows at its end only.
class BoxLevels {
public:
    std::size_t size() const { return m_levels.empty() ? 0 : m_levels.front().size(); }
    CurveBox const& operator[](std::size_t index) const { return m_levels.front()[index]; }

    void append(CurveBox const& box);
    /// Lets a box of the row hold another one, too.
    void include(std::size_t index, CurveBox const& box);
    /// Puts another box in the place of one of the row.
    void replace(std::size_t index, CurveBox const& box);
    void clear() { m_levels.clear(); }

    /// Calls visit(index) for the boxes from `first` on that overlap a box, in the order of the
    /// row, until it answers true; answers whether it did. Boxes may be changed meanwhile, the row
    /// may not grow.
    template <class Visit>
    bool visitUntil(CurveBox const& box, std::size_t first, Visit const& visit) const {
        if (m_levels.empty()) return false;
        const std::size_t top = m_levels.size() - 1;
        return visitRange(top, first >> (top * kBits), m_levels[top].size(), box, first, visit);
    }

private:
    static constexpr std::size_t kBits = 3;  ///< two to that power have a box about them

    template <class Visit>
    bool visitRange(std::size_t level, std::size_t begin, std::size_t end, CurveBox const& box,
                    std::size_t first, Visit const& visit) const {
        CurveBox const* const boxes = m_levels[level].data();
        for (std::size_t i = begin; i < end; ++i) {
            if (!box.overlaps(boxes[i])) continue;
            if (level == 0 ? visit(i) : visitUnder(level, i, box, first, visit)) return true;
        }
        return false;
    }

    template <class Visit>
    bool visitUnder(std::size_t level, std::size_t index, CurveBox const& box, std::size_t first,
                    Visit const& visit) const {
        const std::size_t below = level - 1;
        const std::size_t begin = std::max(index << kBits, first >> (below * kBits));
        const std::size_t end = std::min((index + 1) << kBits, m_levels[below].size());
        return visitRange(below, begin, end, box, first, visit);
    }

    /// The box about the boxes under one of a level above the row.
    CurveBox boxAbout(std::size_t level, std::size_t index) const;

    std::vector<std::vector<CurveBox>> m_levels;  ///< the row, then what stands over it
};

}  // namespace gmkernel_detail
