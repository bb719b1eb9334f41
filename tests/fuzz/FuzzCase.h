// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "gmregion/Paths.h"
#include "gmregion/Simplify.h"

namespace gmregion::fuzz {

/// What is cleaned up.
struct Heap {
    Paths paths;
    CleanUpOptions options;
};

/// What is done with heaps and with the sets made so far.
enum class Task : std::uint8_t {
    kCombine,       ///< the four combinations of two sets; goes on with one of them
    kUniteAll,      ///< all sets
    kOffset,        ///< of a set
    kOffsetSeries,  ///< of a set, by once, twice and minus once the length
    kThicken,       ///< the paths of a heap
    kOpened,        ///< a set
    kClosed,        ///< a set
    kQuestions,     ///< to a set, at a point
    kSimplify,      ///< the paths of a heap
    kSimplifyCurve  ///< the vertices of a heap's paths, each with the chord to the next as tangent
};
constexpr std::size_t kTaskCount = 10;

/// One task with all that it may need. Numbers of sets and heaps count round.
struct Step {
    Task task = Task::kCombine;
    std::size_t first = 0;
    std::size_t second = 0;
    double size = 0.0;  ///< distance, half width, radius or tolerance
    Point at;
    OffsetOptions offset;
    SimplifyOptions simplify;
};

/// Two heaps and what is done with them. Heaps hold 48 elements at the most, and there are six
/// steps at the most, so that a case takes milliseconds.
struct FuzzCase {
    std::array<Heap, 2> heaps;
    std::vector<Step> steps;
};

/// Any bytes are a case, and what is near in bytes is near as a case. Most bytes give paths on a
/// small grid, where sides and arcs touch and coincide, and copies that are beside each other by
/// next to nothing; some give doubles as they come, NaN and infinities among them.
FuzzCase decode(const std::uint8_t* data, std::size_t size);

}  // namespace gmregion::fuzz
