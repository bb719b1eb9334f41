// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <optional>

#include "region/plane/Carrier.h"

namespace gmregion {

/// Up to two points, in the order of a computation that does not depend on where the origin is.
class CrossingPoints {
public:
    void add(Vec2 p) { m_points[m_count++] = p; }
    std::size_t size() const { return m_count; }
    const Vec2* begin() const { return m_points.data(); }
    const Vec2* end() const { return m_points.data() + m_count; }

private:
    std::array<Vec2, 2> m_points{};
    std::size_t m_count = 0;
};

/// The points in which two carriers cross. None where they are parallel, concentric or the same, or
/// where they touch by no more than rounding lets them. Each is right to some units in the last
/// place of its distance from the points by which the carriers are given, divided by the sine of
/// the angle between them. Cost: constant.
CrossingPoints crossings(const Carrier& a, const Carrier& b);

/// The point between two carriers that do not cross, or hardly do, where they come nearest to each
/// other; nothing for two lines and for concentric circles. Cost: constant.
std::optional<Vec2> nearestApproach(const Carrier& a, const Carrier& b);

/// Where a point of an element's carrier lies along the element: 0 at the start, 1 at the end,
/// growing between them; below 0 and above 1 beside the ends, for the rest of a circle, too. The
/// element turns by half a turn at the most.
double placeOn(const Element& e, Vec2 p);

/// Whether that place is from 0 to 1. Cost: less than that of the place.
bool spans(const Element& e, Vec2 p);

/// The points in which two elements cross, ends included exactly: a crossing beside an end, by
/// rounding, may be missing. Whoever needs it looks at the ends as well.
CrossingPoints crossings(const Element& a, const Element& b);

}  // namespace gmregion
