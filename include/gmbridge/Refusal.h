// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

#include "gmbridge/export.h"
#include "gmkernel/GmPoint.h"
#include "gmregion/Outcome.h"

namespace gmbridge {

/// Why a contour was refused.
enum class Reason : std::uint8_t {
    kNone,       ///< it was not
    kUndefined,  ///< the contour is missing or undefined, or has no elements
    kElement,    ///< an element is no segment or arc, or is undefined, or has a number that is none
    kGap,        ///< an element starts beside the end of the one before: the chain is broken
    kOpen,       ///< the contour is open where a closed one is needed
    kNoSide,     ///< it runs round parts of the plane in both senses, or round none
    kRegions     ///< the regions refused, for a reason of theirs
};

/// What was refused, and where.
struct Refusal {
    Reason reason = Reason::kNone;
    std::size_t contour = 0;  ///< number of the contour concerned, where there is one
    long element = 0;         ///< index of its element, where it is one element's fault
    GmPoint at = GmPoint();   ///< a point near the cause; undefined where there is none
    gmregion::Reason regions = gmregion::Reason::kNone;  ///< theirs, with kRegions

    explicit operator bool() const { return reason != Reason::kNone; }
};

/// A short text for a refusal, that of the regions where it is theirs, in English, without a full
/// stop. Never null.
GMBRIDGE_EXPORT const char* textOf(const Refusal& refusal);

}  // namespace gmbridge
