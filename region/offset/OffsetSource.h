// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/RegionSet.h"
#include "region/nodes/Strands.h"
#include "region/plane/Carrier.h"
#include "region/search/BoxRow.h"

namespace gmregion {

/// An element of what is offset, with what every distance needs of it.
struct SourceElement : Element {
    Vec2 startNormal;        ///< of length 1, to the left
    Vec2 endNormal;          ///< the same at the end
    double curvature = 0.0;  ///< positive counter-clockwise
    Index owner = 0;         ///< its number in the set, or its origin's in a list

    Carrier carrier() const { return {sp, startNormal, curvature}; }
};

/// What is offset: loops of elements that turn by half a turn at the most, and their boxes.
class OffsetSource {
public:
    void take(const RegionSet& set);
    /// Takes paths: of an open one, there and back, of a closed one each way for itself. Owners are
    /// the tags of the elements.
    void take(const Strands& paths);

    const std::vector<SourceElement>& elements() const { return m_elements; }
    /// Behind the last element of each loop.
    const std::vector<Index>& loopEnds() const { return m_loopEnds; }

    /// Whether a loop runs along an open path and back.
    bool isThereAndBack(std::size_t loop) const { return m_isThereAndBack[loop] != 0; }
    /// The area that the loops enclose, and no less than the length along them.
    double area() const { return m_area; }
    double length() const { return m_length; }
    /// The box about all elements.
    Box bounds() const { return m_boxes.bounds(); }

    /// The distance from a point to the nearest element, if that is below a limit; else the limit.
    /// The search ends at the first element that is nearer than what is near enough, and begins at
    /// a guess, which becomes that element. Cost: logarithmic, and the elements about as near.
    double distanceBelow(Vec2 p, double limit, double nearEnough, Index& guess) const;

private:
    void clear();
    void append(const Element& e, Index owner);
    void endLoop(bool isThereAndBack);
    void finish();

    std::vector<SourceElement> m_elements;
    std::vector<Index> m_loopEnds;
    std::vector<std::uint8_t> m_isThereAndBack;
    BoxRow m_boxes;
    double m_area = 0.0;
    double m_length = 0.0;
};

}  // namespace gmregion
