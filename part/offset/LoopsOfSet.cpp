// SPDX-License-Identifier: MIT
#include "part/offset/LoopsOfSet.h"

#include <utility>

#include "part/regions/ContourRegions.h"
#include "part/regions/PartRegions.h"

namespace gmpart {

using gmregion::Outcome;
using gmregion::RegionSet;

void appendLoops(const Outcome& result, std::size_t pass, const std::vector<Path>& contours,
                 PartOffsets& offsets) {
    const RegionSet& set = result.regions;
    for (std::size_t loop = 0; loop < set.loops().size(); ++loop) {
        LoopSources sources = sourcesOf(set, loop);
        Path path = loopPath(set, loop);
        path.layer = contours[sources.main].layer;
        offsets.paths.push_back({pass, std::move(path), std::move(sources.contours), sources.main});
    }
    std::vector<gmregion::Point>& marginal = offsets.marginal[pass];
    marginal.insert(marginal.end(), result.marginal.begin(), result.marginal.end());
}

}  // namespace gmpart
