// SPDX-License-Identifier: MIT
#include "region/link/Nesting.h"

#include <algorithm>
#include <cmath>

#include "region/model/Box.h"
#include "region/plane/ElementBox.h"
#include "region/plane/ElementWinding.h"

namespace gmregion {

bool Nesting::find(const std::vector<Element>& elements, const std::vector<Index>& ends,
                   const std::vector<double>& areas) {
    m_elements = &elements;
    m_ends = &ends;
    m_areas = &areas;
    m_outlineOf.resize(ends.size());
    if (ends.size() == 1 && areas[0] > 0.0) {
        m_outlineOf[0] = 0;
        return true;
    }
    m_loopOf.resize(elements.size());
    m_winding.assign(ends.size(), 0);
    m_farLeft = 0.0;
    m_boxes.begin(elements.size());
    for (std::size_t loop = 0, i = 0; loop < ends.size(); ++loop) {
        for (; i < ends[loop]; ++i) {
            m_loopOf[i] = static_cast<Index>(loop);
            const Box box = boxAbout(elements[i]);
            m_farLeft = std::min(m_farLeft, box.low.x);
            m_boxes.add(box);
        }
    }
    m_boxes.finish();
    for (std::size_t loop = 0; loop < ends.size(); ++loop) {
        if (!place(loop)) return false;
    }
    return true;
}

bool Nesting::place(std::size_t loop) {
    castFrom(loop);
    int covered = 0;
    Index outline = kNone;
    for (const Index other : m_touched) {
        covered += m_winding[other];
        const bool isAbout = m_winding[other] > 0;
        if (isAbout && (outline == kNone || (*m_areas)[other] < (*m_areas)[outline]))
            outline = other;
        m_winding[other] = 0;
    }
    const bool isHole = !((*m_areas)[loop] > 0.0);
    m_outlineOf[loop] = isHole ? outline : static_cast<Index>(loop);
    return covered == (isHole ? 1 : 0);
}

/// How often every other loop runs round a point of a loop.
void Nesting::castFrom(std::size_t loop) {
    const std::size_t first = loop == 0 ? 0 : (*m_ends)[loop - 1];
    const Element* own = m_elements->data() + first;
    double longest = -1.0;
    for (std::size_t i = first; i < (*m_ends)[loop]; ++i) {
        const Element& e = (*m_elements)[i];
        const double squared = dot(e.ep - e.sp, e.ep - e.sp);
        if (!(squared > longest)) continue;
        longest = squared;
        own = &e;
    }
    const Vec2 p = middleOf(*own);
    m_conflict = p;
    m_touched.clear();
    m_boxes.visitOverlapping({{m_farLeft, p.y}, p}, [&](std::size_t i) {
        const Index other = m_loopOf[i];
        if (other == loop) return;
        const int winding = windingOf((*m_elements)[i], p);
        if (winding == 0) return;
        m_winding[other] += winding;
        if (std::find(m_touched.begin(), m_touched.end(), other) == m_touched.end())
            m_touched.push_back(other);
    });
}

}  // namespace gmregion
