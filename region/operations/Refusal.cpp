// SPDX-License-Identifier: MIT
#include "gmregion/Outcome.h"

namespace gmregion {

const char* textOf(Reason reason) {
    switch (reason) {
        case Reason::kNone:
            return "not refused";
        case Reason::kNotFinite:
            return "a number is not finite";
        case Reason::kOutOfRange:
            return "a number is out of range";
        case Reason::kTolerance:
            return "the tolerance is not positive or too fine";
        case Reason::kOpenPath:
            return "a path is open";
        case Reason::kGap:
            return "two elements that follow each other do not meet";
        case Reason::kUnsettled:
            return "too much lies within the tolerance of each other";
        case Reason::kUncertified:
            return "the result did not pass its own check";
        case Reason::kWorkLimit:
            return "more work than allowed";
    }
    return "unknown reason";
}

}  // namespace gmregion
