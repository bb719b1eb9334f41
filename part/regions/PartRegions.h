// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "gmregion/Outcome.h"

#include "part/model/Path.h"
#include "part/regions/Nesting.h"

namespace gmpart {

/// The contours of a drawing as regions: each by itself, and all together as a part with holes.
///
/// Origins have the numbers of contours as those of their paths.
class PartRegions {
public:
    /// @param contours of the drawing
    /// @param firstNumber the number of the first of them in origins
    /// @param tolerance as for gmregion::cleanUp(); 0 for partTolerance()
    explicit PartRegions(const std::vector<Path>& contours, std::size_t firstNumber = 0,
                         double tolerance = 0.0);

    double tolerance() const { return m_tolerance; }
    const Nesting& nesting() const { return m_nesting; }
    /// What each contour runs round; empty for open ones and those that enclose nothing.
    const std::vector<gmregion::RegionSet>& alone() const { return m_alone; }

    /// The numbers, in this drawing, of contours that are open or enclose nothing.
    std::vector<std::size_t> withoutRegions() const;

    /// The part: what contours of even depth run round, without what those of odd depth do.
    /// Contours that cross are siblings, and where these overlap they count as one.
    gmregion::Outcome part() const;
    /// What some of the contours run round, together.
    gmregion::Outcome filled(const std::vector<std::size_t>& contours) const;

private:
    std::size_t m_firstNumber;
    double m_tolerance;
    std::vector<gmregion::RegionSet> m_alone;
    Nesting m_nesting;
};

/// The numbers of the contours that elements of a loop come from, rising; and the one that most of
/// its length comes from, parallels and corners included.
struct LoopSources {
    std::vector<std::size_t> contours;
    std::size_t main = 0;
};
LoopSources sourcesOf(const gmregion::RegionSet& set, std::size_t loop);

}  // namespace gmpart
