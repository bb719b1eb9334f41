// SPDX-License-Identifier: MIT
#pragma once

#include "region/offset/RoundOffset.h"
#include "region/overlay/OverlayScratch.h"

namespace gmregion {

/// What a workspace holds.
struct Scratch {
    OverlayScratch overlay;
    OffsetScratch offset;
};

}  // namespace gmregion
