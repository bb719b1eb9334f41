// SPDX-License-Identifier: MIT
#include "gmregion/Boolean.h"

#include <algorithm>

#include "region/operations/Scratch.h"
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
    OverlayScratch& scratch = workspace.begin().overlay;
    const double tolerance = std::max(first.tolerance(), second.tolerance());
    const Index split = static_cast<Index>(first.elements().size());
    OriginSource source;
    source.first = &first;
    source.second = &second;
    source.split = split;
    const auto fill = [&](Strands& strands) {
        takeSet(first, {1, 0}, 0, strands);
        const Index firstOfSecond = static_cast<Index>(strands.elements.size());
        takeSet(second, {0, 1}, split, strands);
        // At a coarser tolerance than its own a set is compared with itself as well.
        return first.tolerance() == second.tolerance() ? firstOfSecond : kNone;
    };
    return overlayInAttempts(scratch, tolerance, fill, source, coveredBy(combination), outcome);
}

Outcome combine(const RegionSet& first, const RegionSet& second, Combination combination) {
    Workspace workspace;
    Outcome outcome;
    combine(first, second, combination, workspace, outcome);
    return outcome;
}

bool uniteAll(const RegionSet* sets, std::size_t count, Workspace& workspace, Outcome& outcome) {
    OverlayScratch& scratch = workspace.begin().overlay;
    scratch.origins.clear();
    scratch.originEnds.clear();
    double tolerance = 0.0;
    for (std::size_t i = 0; i < count; ++i) {
        tolerance = std::max(tolerance, sets[i].tolerance());
        for (std::size_t k = 0; k < sets[i].elements().size(); ++k) {
            const Origins origins = sets[i].origins(k);
            scratch.origins.insert(scratch.origins.end(), origins.begin(), origins.end());
            scratch.originEnds.push_back(static_cast<Index>(scratch.origins.size()));
        }
    }
    OriginSource source;
    source.list = &scratch.origins;
    source.ends = &scratch.originEnds;
    const auto fill = [&](Strands& strands) {
        Index firstTag = 0;
        for (std::size_t i = 0; i < count; ++i) {
            takeSet(sets[i], {1, 0}, firstTag, strands);
            firstTag += static_cast<Index>(sets[i].elements().size());
        }
        return kNone;
    };
    const Covers covers = [](Weight w) { return w.a > 0; };
    return overlayInAttempts(scratch, tolerance, fill, source, covers, outcome);
}

}  // namespace gmregion
