// SPDX-License-Identifier: MIT
#include "gmbridge/Refusal.h"

namespace gmbridge {

const char* textOf(const Refusal& refusal) {
    switch (refusal.reason) {
        case Reason::kNone:
            return "not refused";
        case Reason::kUndefined:
            return "the contour is undefined or has no elements";
        case Reason::kElement:
            return "an element is no segment or arc, or is undefined";
        case Reason::kGap:
            return "an element starts beside the end of the one before";
        case Reason::kOpen:
            return "the contour is open where a closed one is needed";
        case Reason::kNoSide:
            return "the contour runs round parts of the plane in both senses, or round none";
        case Reason::kRegions:
            return gmregion::textOf(refusal.regions);
    }
    return "unknown reason";
}

}  // namespace gmbridge
