// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Outcome.h"
#include "region/offset/OffsetSource.h"
#include "region/offset/RawParallels.h"
#include "region/offset/RunChoice.h"
#include "region/offset/Strips.h"
#include "region/overlay/OverlayScratch.h"

namespace gmregion {

/// Working memory of offsets.
struct OffsetScratch {
    OffsetSource source;
    RawParallels raw;
    RunChoice choice;
    Strips strips;
};

/// The offset of the source in a scratch with round joins and ends, by raw parallels and distances.
/// @param origins of the elements of the source
/// @param trims see RawParallels::make
/// @return whether there is a result that passed its check; else the outcome says what failed
bool roundOffset(OverlayScratch& scratch, OffsetScratch& offsets, const OriginSource& origins,
                 double distance, double tolerance, bool trims, Outcome& outcome);

/// The same with any joins and ends, as a union of strips.
bool stripOffset(OverlayScratch& scratch, OffsetScratch& offsets, const OriginSource& origins,
                 double distance, double tolerance, const OffsetOptions& options, Outcome& outcome);

}  // namespace gmregion
