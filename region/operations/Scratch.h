// SPDX-License-Identifier: MIT
#pragma once

#include "region/offset/RoundOffset.h"
#include "region/offset/SideWriter.h"
#include "region/overlay/OverlayScratch.h"

namespace gmregion {

/// What a workspace holds.
struct Scratch {
    OverlayScratch overlay;
    OffsetScratch offset;
    SideWriter sides;
    Strands paths;
    Strands path;     ///< one of them
    Outcome outcome;  ///< of a step between
};

}  // namespace gmregion
