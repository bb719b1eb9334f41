// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

#include "gmregion/RegionSet.h"
#include "gmregion/export.h"

namespace gmregion {

/// Loops of a set that follow each other, by their numbers. What lies beyond the loops of the set
/// does not count, so that no range is an error.
struct LoopRange {
    std::size_t first = 0;
    std::size_t last = 0;  ///< behind the last one

    bool empty() const { return first >= last; }
    std::size_t size() const { return empty() ? 0 : last - first; }
};

/// All loops of a set.
GMREGION_EXPORT LoopRange loopsOf(const RegionSet& set);
/// The loops of a region, its outline first, then its holes; an empty range for a number that no
/// region has. Cost: logarithmic.
GMREGION_EXPORT LoopRange loopsOf(const RegionSet& set, std::size_t region);
/// A loop alone.
inline LoopRange loopAlone(std::size_t loop) {
    return {loop, loop + 1};
}

/// The area of regions, in squared length units. A hole on its own has a negative one; what has no
/// loops has none. Sums run about a point of the loops, so that they are as good far from the
/// origin as near it. Cost, as of all measures here: the number of elements.
GMREGION_EXPORT double area(const RegionSet& set, LoopRange loops);
/// The length of outlines and holes, in length units.
GMREGION_EXPORT double perimeter(const RegionSet& set, LoopRange loops);
/// The centre of gravity of the area, of a hole on its own that of the hole; nothing without area.
GMREGION_EXPORT std::optional<Point> centroid(const RegionSet& set, LoopRange loops);

/// A box with sides along the axes.
struct Bounds {
    Point low;
    Point high;
};
/// The smallest box about loops, arcs up to their extreme points; nothing without loops.
GMREGION_EXPORT std::optional<Bounds> bounds(const RegionSet& set, LoopRange loops);

inline double area(const RegionSet& set) {
    return area(set, loopsOf(set));
}
inline double perimeter(const RegionSet& set) {
    return perimeter(set, loopsOf(set));
}
inline std::optional<Point> centroid(const RegionSet& set) {
    return centroid(set, loopsOf(set));
}
inline std::optional<Bounds> bounds(const RegionSet& set) {
    return bounds(set, loopsOf(set));
}

/// Where a point is with regard to a set.
enum class Place : std::uint8_t {
    kOutside,
    kInside,
    kOnBoundary  ///< within the distance asked for
};

/// The point of a boundary that is nearest to another point.
struct BoundaryPoint {
    Point at;
    double distance = 0.0;    ///< in length units, never negative
    std::size_t element = 0;  ///< number of the element in the set
    std::size_t loop = 0;     ///< number of its loop
};

/// Answers where points are with regard to one set.
///
/// Borrows the set, which must stay as it is for as long as the locator is asked. Any number of
/// threads may ask at the same time. A point is of no use when a coordinate is not finite or above
/// 1e100: it is outside, and nothing is nearest to it. To be made: linear in the number of
/// elements.
class GMREGION_EXPORT Locator {
public:
    explicit Locator(const RegionSet& set);
    ~Locator();
    Locator(Locator&& other) noexcept;
    Locator& operator=(Locator&& other) noexcept;
    Locator(const Locator&) = delete;
    Locator& operator=(const Locator&) = delete;

    /// Where a point is: on the boundary when that is as near as `within` or nearer, else by how
    /// often the loops run round it. With a `within` below 0, or NaN, nothing is on the boundary,
    /// and every point is told to one side of it: of the sides of an element the one that its
    /// carrier says, however near. Cost: logarithmic, and the elements at the height of the point
    /// on its left.
    Place where(Point p, double within) const;
    /// The same within the tolerance of the set.
    Place where(Point p) const;

    /// The nearest point of the boundary, of several equally near ones that of the lowest element;
    /// nothing for an empty set. Cost: logarithmic, and the elements about as near.
    std::optional<BoundaryPoint> nearest(Point p) const;
    /// The distance from the boundary, positive inside, negative outside; nothing for an empty set.
    std::optional<double> signedDistance(Point p) const;

    /// The number of the region that covers a point, boundaries told to one side as in where();
    /// nothing outside. Cost: that of where().
    std::optional<std::size_t> regionAt(Point p) const;

    /// The number of the loop directly about another one: of a hole its outline, of an outline the
    /// hole of another region that it stands in. Nothing for an outline in no other, and for a
    /// number that no loop has. Cost: that of where(), and the elements of the loop.
    std::optional<std::size_t> loopAbout(std::size_t loop) const;
    /// The numbers of the regions that stand in the holes of a region, not in those of others
    /// within; rising. Cost: that of loopAbout() for every outline.
    std::vector<std::size_t> regionsIn(std::size_t region) const;

private:
    struct GMREGION_NO_EXPORT Store;
    std::unique_ptr<Store> m_store;
};

}  // namespace gmregion
