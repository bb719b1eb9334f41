// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/Outcome.h"
#include "region/link/Fans.h"
#include "region/link/Loops.h"
#include "region/link/SetWriter.h"
#include "region/link/Windings.h"
#include "region/nodes/Arrangement.h"
#include "region/overlay/StrandOrder.h"

namespace gmregion {

/// Working memory of laying strands over each other.
struct OverlayScratch {
    StrandOrder order;
    Arrangement arrangement;
    Fans fans;
    Windings windings;
    Loops loops;
    SetWriter writer;
    std::vector<Origin> origins;    ///< of the operands, where they are listed
    std::vector<Index> originEnds;  ///< behind the last origin of each tag
    Outcome loose;                  ///< one that is being consolidated
};

}  // namespace gmregion
