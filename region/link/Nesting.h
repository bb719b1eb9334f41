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
    /// @param tolerance loops are farther apart, but where they touch
    /// False when loops do not nest as outlines and holes have to: no outline where something is
    /// covered, no hole where nothing is; `conflict()` is a point of such a loop. Cost: mostly the
    /// number of loops times a logarithm.
    bool find(const std::vector<Element>& elements, const std::vector<Index>& ends,
              const std::vector<double>& areas, double tolerance);

    /// The outline about a hole; an outline itself.
    Index outlineOf(std::size_t loop) const { return m_outlineOf[loop]; }
    Vec2 conflict() const { return m_conflict; }

private:
    /// The first element that a look to the left finds, kNone when there is none.
    struct Sight {
        Index element = kNone;
        double x = -HUGE_VAL;
        bool coveredToEast = false;
    };

    struct Heights {
        double low;
        double high;
        double rise() const { return high - low; }
    };

    void raiseBoxes();
    bool isHole(Index loop) const { return !((*m_areas)[loop] > 0.0); }
    Sight lookLeft(Vec2 from) const;
    bool place(Index loop);
    bool placeFrom(Index loop, Vec2 from);
    Heights heightsOf(Index element) const;
    double lastLeft(const Element& e, Vec2 from) const;
    Vec2 startBeside(Index loop, double share) const;
    bool resolve(Index loop);
    Index outlineAbout(Index loop);

    const std::vector<Element>* m_elements = nullptr;
    const std::vector<Index>* m_ends = nullptr;
    const std::vector<double>* m_areas = nullptr;
    double m_tolerance = 0.0;
    std::vector<Index> m_loopOf;
    std::vector<Index> m_beside;  ///< of each hole, a loop that bounds the same region
    std::vector<Index> m_outlineOf;
    std::vector<int> m_winding;  ///< of each loop about a point
    BoxRow m_boxes;
    Vec2 m_conflict;
};

}  // namespace gmregion
