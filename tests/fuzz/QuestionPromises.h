// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/RegionSet.h"
#include "tests/fuzz/Complaints.h"

namespace gmregion::fuzz {

/// Whether measures and nesting of a set agree with each other, and what a locator answers about a
/// point, any at all, with windings and distances.
void checkQuestions(const RegionSet& set, Point p, Complaints& complaints);

}  // namespace gmregion::fuzz
