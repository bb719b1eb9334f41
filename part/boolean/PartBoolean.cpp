// SPDX-License-Identifier: MIT
#include "part/boolean/PartBoolean.h"

#include <utility>

#include "part/regions/PartRegions.h"

namespace gmpart {

using gmregion::Combination;
using gmregion::Outcome;
using gmregion::Verdict;

namespace {

void append(Verdict& all, const Verdict& found) {
    all.count += found.count;
    all.faults.insert(all.faults.end(), found.faults.begin(), found.faults.end());
}

}  // namespace

PartCombination combineParts(const std::vector<const std::vector<Path>*>& parts,
                             Combination combination) {
    PartCombination combined;
    for (std::size_t i = 0; i < parts.size(); ++i) {
        const PartRegions regions(*parts[i], combined.hasRegions.size());
        for (const gmregion::RegionSet& alone : regions.alone())
            combined.hasRegions.push_back(!alone.empty());
        Outcome part = regions.part();
        combined.regionsBefore += part.regions.regionCount();
        if (i == 0 || part.refusal) {
            combined.result = std::move(part);
        } else {
            Outcome next = combine(combined.result.regions, part.regions, combination);
            if (!next.refusal) {
                append(combined.verdict, verifyBoolean(combined.result.regions, part.regions,
                                                       combination, next.regions));
            }
            combined.result = std::move(next);
        }
        if (combined.result.refusal) break;
    }
    return combined;
}

}  // namespace gmpart
