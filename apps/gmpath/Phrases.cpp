// SPDX-License-Identifier: MIT
#include "apps/gmpath/Phrases.h"

#include <cmath>

#include "drawing/Text.h"

namespace gmpath {

using gmdrawing::formatReal;
using gmregion::FaultyOffset;
using gmregion::kKernelTolerance;
using gmregion::Refusal;

std::string faultText(const FaultyOffset& faulty) {
    const std::string side = faulty.distance > 0.0 ? "right" : "left";
    return "the offset by " + formatReal(std::abs(faulty.distance), kDistanceDigits) + " to the " +
           side + " " + std::string(faultText(faulty.fault));
}

std::string refusalText(Refusal refusal) {
    const std::string tolerance = formatReal(kKernelTolerance);
    switch (refusal) {
        case Refusal::kTooSmall:
            return "an element is shorter than " + tolerance + ": scale the drawing up (--scale)";
        case Refusal::kJoint:
            return "an arc, very flat or far from the origin, misses its neighbour by " +
                   tolerance + " or more: draw a line in its place, or move the part to the origin";
        case Refusal::kEndsAtStart:
            return "it is open, but its end comes within " + tolerance +
                   " of its start: close it (--join), or draw its ends farther apart";
        case Refusal::kPassesStart:
            return "it is open, but passes within " + tolerance +
                   " of its start: begin it elsewhere, or split it there";
        case Refusal::kNone:
            break;
    }
    return {};
}

}  // namespace gmpath
