// SPDX-License-Identifier: MIT
#pragma once

#include "region/offset/RoundOffset.h"
#include "region/offset/SideWriter.h"
#include "region/overlay/OverlayScratch.h"
#include "region/verify/OffsetVerifier.h"

namespace gmregion {

/// Working memory of checks.
struct VerifyScratch {
    OffsetVerifier offset;
    std::vector<Index> sourceEnds;
    std::vector<Index> resultEnds;
};

/// What a workspace holds.
struct Scratch {
    OverlayScratch overlay;
    OffsetScratch offset;
    VerifyScratch verify;
    SideWriter sides;
    Strands paths;
    Strands path;     ///< one of them
    Outcome outcome;  ///< of a step between
};

}  // namespace gmregion
