// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/Paths.h"
#include "gmregion/Questions.h"
#include "gmregion/RegionSet.h"
#include "gmregion/Workspace.h"
#include "tests/builds/ResultBits.h"

namespace gmregion {

/// What all operations work on; any number of threads may read one of these.
struct Sources {
    Paths heap;                       ///< loops that cross themselves and each other
    Paths open;                       ///< open paths of many short elements
    std::vector<RegionSet> sets;      ///< parts with holes
    std::vector<Locator> locators;    ///< of the sets
    std::vector<TangentPoint> curve;  ///< with tangents that are right
};

/// Sources that are the same from every compiler: their numbers come from a generator of whole
/// numbers and from basic arithmetic alone.
Sources makeSources(unsigned seed);

/// Calls every operation and every question of the library, and adds all that they answer.
void callAll(const Sources& sources, Workspace& workspace, ResultBits& bits);

}  // namespace gmregion
