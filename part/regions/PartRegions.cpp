// SPDX-License-Identifier: MIT
#include "part/regions/PartRegions.h"

#include <algorithm>
#include <map>

#include "gmregion/CleanUp.h"

#include "part/regions/ContourRegions.h"

namespace gmpart {

using gmregion::FillRule;
using gmregion::Loop;
using gmregion::Origin;
using gmregion::Outcome;
using gmregion::Paths;
using gmregion::RegionSet;

PartRegions::PartRegions(const std::vector<Path>& contours, std::size_t firstNumber,
                         double tolerance)
    : m_firstNumber(firstNumber),
      m_tolerance(tolerance > 0.0 ? tolerance : partTolerance(contours)),
      m_alone(contourRegions(contours, m_tolerance)),
      m_nesting(nestingOf(contours, m_alone)) {}

std::vector<std::size_t> PartRegions::withoutRegions() const {
    std::vector<std::size_t> found;
    for (std::size_t i = 0; i < m_alone.size(); ++i) {
        if (m_alone[i].empty()) found.push_back(i);
    }
    return found;
}

Outcome PartRegions::part() const {
    Paths heap;
    for (std::size_t i = 0; i < m_alone.size(); ++i) {
        const bool isHole = m_nesting.depths[i] % 2 != 0;
        addLoops(heap, m_alone[i], static_cast<std::int64_t>(i + m_firstNumber), isHole);
    }
    return cleanUp(heap, {FillRule::kPositive, m_tolerance});
}

Outcome PartRegions::filled(const std::vector<std::size_t>& contours) const {
    Paths heap;
    for (const std::size_t i : contours)
        addLoops(heap, m_alone[i], static_cast<std::int64_t>(i + m_firstNumber), false);
    return cleanUp(heap, {FillRule::kPositive, m_tolerance});
}

LoopSources sourcesOf(const RegionSet& set, std::size_t loop) {
    std::map<std::size_t, double> lengths;
    const Loop& range = set.loops()[loop];
    for (std::size_t i = range.first; i < range.last; ++i) {
        for (const Origin& origin : set.origins(i))
            lengths[static_cast<std::size_t>(origin.path)] += length(set.elements()[i]);
    }
    LoopSources sources;
    double most = -1.0;
    for (const auto& [contour, along] : lengths) {
        sources.contours.push_back(contour);
        if (along > most) sources.main = contour;
        most = std::max(most, along);
    }
    return sources;
}

}  // namespace gmpart
