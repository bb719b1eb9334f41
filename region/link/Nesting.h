// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/model/Element.h"
#include "region/model/Index.h"
#include "region/search/BoxRow.h"

namespace gmregion {

/// Which loop lies in which.
class Nesting {
public:
    /// @param elements of all loops, one after the other
    /// @param ends of each loop, behind its last element
    /// @param areas of each loop, positive for outlines, negative for holes
    /// False when loops do not nest as outlines and holes have to: no outline where something is
    /// covered, no hole where nothing is; `conflict()` is a point of such a loop.
    bool find(const std::vector<Element>& elements, const std::vector<Index>& ends,
              const std::vector<double>& areas);

    /// The outline about a hole; an outline itself.
    Index outlineOf(std::size_t loop) const { return m_outlineOf[loop]; }
    Vec2 conflict() const { return m_conflict; }

private:
    bool place(std::size_t loop);
    void castFrom(std::size_t loop);

    const std::vector<Element>* m_elements = nullptr;
    const std::vector<Index>* m_ends = nullptr;
    const std::vector<double>* m_areas = nullptr;
    std::vector<Index> m_loopOf;
    std::vector<Index> m_outlineOf;
    std::vector<int> m_winding;    ///< of each loop about the point in hand
    std::vector<Index> m_touched;  ///< loops whose elements the ray passed
    BoxRow m_boxes;
    double m_farLeft = 0.0;
    Vec2 m_conflict;
};

}  // namespace gmregion
