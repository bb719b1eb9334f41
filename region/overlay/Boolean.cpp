// SPDX-License-Identifier: MIT
#include "gmregion/Boolean.h"

#include <algorithm>

#include "region/overlay/Intake.h"
#include "region/overlay/Overlay.h"

namespace gmregion {

namespace {

Covers coveredBy(Combination combination) {
    switch (combination) {
        case Combination::kIntersection:
            return [](Weight w) { return w.a > 0 && w.b > 0; };
        case Combination::kDifference:
            return [](Weight w) { return w.a > 0 && w.b <= 0; };
        case Combination::kSymmetricDifference:
            return [](Weight w) { return (w.a > 0) != (w.b > 0); };
        default:
            return [](Weight w) { return w.a > 0 || w.b > 0; };
    }
}

}  // namespace

bool combine(const RegionSet& first, const RegionSet& second, Combination combination,
             Workspace& workspace, Outcome& outcome) {
    Scratch& scratch = workspace.scratch();
    const double tolerance = std::max(first.tolerance(), second.tolerance());
    Strands& strands = scratch.arrangement.strands();
    strands.clear();
    const Index split = static_cast<Index>(first.elements().size());
    takeSet(first, {1, 0}, 0, strands);
    const Index firstOfSecond = static_cast<Index>(strands.elements.size());
    takeSet(second, {0, 1}, split, strands);
    if (strands.elements.empty()) {
        beginOutcome(outcome, tolerance);
        return true;
    }
    OriginSource source;
    source.first = &first;
    source.second = &second;
    source.split = split;
    return overlay(scratch, tolerance, firstOfSecond, source, coveredBy(combination), outcome);
}

Outcome combine(const RegionSet& first, const RegionSet& second, Combination combination) {
    Workspace workspace;
    Outcome outcome;
    combine(first, second, combination, workspace, outcome);
    return outcome;
}

bool uniteAll(const RegionSet* sets, std::size_t count, Workspace& workspace, Outcome& outcome) {
    Scratch& scratch = workspace.scratch();
    Strands& strands = scratch.arrangement.strands();
    strands.clear();
    scratch.origins.clear();
    double tolerance = 0.0;
    for (std::size_t i = 0; i < count; ++i) {
        const RegionSet& set = sets[i];
        tolerance = std::max(tolerance, set.tolerance());
        takeSet(set, {1, 0}, static_cast<Index>(scratch.origins.size()), strands);
        for (std::size_t k = 0; k < set.elements().size(); ++k)
            scratch.origins.push_back(*set.origins(k).begin());
    }
    if (strands.elements.empty()) {
        beginOutcome(outcome, tolerance);
        return true;
    }
    OriginSource source;
    source.list = &scratch.origins;
    return overlay(
        scratch, tolerance, kNone, source, [](Weight w) { return w.a > 0; }, outcome);
}

}  // namespace gmregion
