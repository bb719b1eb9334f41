// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <map>

#include "gmregion/Outcome.h"
#include "tests/fuzz/Complaints.h"
#include "tests/fuzz/FuzzCase.h"

namespace gmregion::fuzz {

/// How many elements the paths have, by the numbers of the paths.
using PathSizes = std::map<std::int64_t, std::size_t>;
PathSizes pathSizes(const std::array<Heap, 2>& heaps);

/// The order of lengths that areas may be off by one tolerance of: once along the boundary, and a
/// little for what vanishes.
double slackOf(const RegionSet& set);

/// Whether no vertex is near an element that it does not belong to, all elements are long, and
/// loops do not touch. Cost: quadratic.
bool isRoomy(const RegionSet& set);

/// Whether both hold the same, bit by bit.
bool isSame(const RegionSet& a, const RegionSet& b);

/// What every outcome must hold: a result or a refusal with an empty set.
void checkOutcome(const Outcome& outcome, bool answered, Complaints& complaints);

/// What every set must hold: numbers are finite, loops close bit by bit and have their sense, each
/// outline stands before its holes, origins name elements that there are, and what lies on the left
/// of every element is covered.
void checkSet(const RegionSet& set, const PathSizes& sizes, Complaints& complaints);

}  // namespace gmregion::fuzz
