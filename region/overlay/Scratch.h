// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/link/Fans.h"
#include "region/link/Loops.h"
#include "region/link/SetWriter.h"
#include "region/link/Windings.h"
#include "region/nodes/Arrangement.h"

namespace gmregion {

/// What a workspace holds.
struct Scratch {
    Arrangement arrangement;
    Fans fans;
    Windings windings;
    Loops loops;
    SetWriter writer;
    std::vector<Origin> origins;
};

}  // namespace gmregion
