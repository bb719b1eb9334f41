// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <iosfwd>
#include <vector>

#include "tests/support/DrawnParts.h"

namespace sweep {

constexpr int kTurns = 360;  ///< whole degrees
constexpr int kFewestDecimals = 2;
constexpr int kMostDecimals = 12;

/// What happened to one part.
struct Row {
    std::size_t elements = 0;   ///< of the part
    std::size_t drawings = 0;   ///< in which it was offset
    std::size_t distances = 0;  ///< by which each of them was
    std::size_t runs = 0;
    std::size_t lost = 0;      ///< area or number of loops are wrong
    std::size_t open = 0;      ///< a loop does not close bit by bit
    std::size_t refused = 0;   ///< clean-up or offset
    std::size_t unsound = 0;   ///< found fault with by the check of offsets
    std::size_t marginal = 0;  ///< flagged: the number of loops hangs on some tolerances
    std::size_t hanging = 0;   ///< the number of loops hangs on the rounding, and is not compared

    bool isClean() const { return runs > 0 && lost + open + refused + unsound == 0; }
};

Row& operator+=(Row& sum, const Row& row);

/// Both ways: small ones, those of the part, and one beyond it.
std::vector<double> distancesOf(const gmregion::shapes::DrawnPart& part);

/// Offsets a part in many drawings by all its distances. There is a drawing for each of the whole
/// degrees, decimals, and elements to start at; every n-th of them is taken.
/// @param part the part
/// @param every n; without a factor in common with the numbers of degrees, decimals and starts
/// all of each are met
/// @param faults gets a line for each fault, with what makes it again
Row sweepPart(const gmregion::shapes::DrawnPart& part, std::size_t every, std::ostream& faults);

}  // namespace sweep
