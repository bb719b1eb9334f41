// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/RegionSet.h"
#include "gmregion/export.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace gmregion {

/// Why something was refused.
enum class Reason : std::uint8_t {
    kNone,        ///< it was not
    kNotFinite,   ///< a number is not finite
    kOutOfRange,  ///< a coordinate, distance or count beyond what is stated, or a negative limit
    kTolerance,   ///< the tolerance is not positive, or too fine or too coarse for the drawing
    kOpenPath,    ///< a path is open where a loop is needed
    kGap,         ///< an element starts farther from the end of the one before than the tolerance
    kUnsettled,   ///< nodes did not come to rest: the input is dense in comparison to the tolerance
    kUncertified,  ///< the result does not hold what every result must
    kWorkLimit     ///< more work than the caller allows
};

/// A short text for a reason, in English, without a full stop. Never null.
GMREGION_EXPORT const char* textOf(Reason reason);

/// What could not be answered, and where.
struct Refusal {
    Reason reason = Reason::kNone;
    Point at;              ///< a point near the cause, where there is one
    std::size_t path = 0;  ///< number of the input path concerned, where there is one

    explicit operator bool() const { return reason != Reason::kNone; }
};

/// What an operation gives: a set, or a refusal and an empty set.
struct Outcome {
    RegionSet regions;
    Refusal refusal;
    /// Points where an offset hangs on some tolerances: necks, gaps and slots that are twice the
    /// distance wide within the tolerance, and places where boundaries cross by less than four.
    /// Results are right there, too, but a little more or less would make another number of loops.
    std::vector<Point> marginal;
};

}  // namespace gmregion
