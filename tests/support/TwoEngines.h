// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>

#include "gmregion/Verify.h"

#include "part/model/Path.h"

namespace engines {

/// What both engines make of one contour.
struct Comparison {
    bool suits = true;         ///< the contour does not cross itself; others are not asked
    bool kernelHolds = false;  ///< the kernel's offset is sound; only then is it compared
    std::string kernelFault;   ///< else what is wrong with it
    bool agree = false;        ///< in the number of loops, in area and in length
    std::string difference;    ///< else in what they do not
};

/// Offsets a closed contour that does not cross itself by both engines, and compares the results
/// where the kernel's one stands the check. Loops as thin as that check passes over do not count.
/// @param distance positive outward
Comparison compare(const gmpart::Path& contour, double distance);

/// Sums of comparisons.
struct Tally {
    std::size_t asked = 0;
    std::size_t compared = 0;
    std::size_t differ = 0;

    void add(const Comparison& found);
};

/// A closed contour of up to so many segments and arcs about the origin, about 100 wide; few
/// of them cross themselves. The same for the same seed.
gmpart::Path randomContour(unsigned seed, std::size_t elements);

}  // namespace engines
