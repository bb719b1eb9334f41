// SPDX-License-Identifier: MIT
#pragma once

#include <array>

#include "gmregion/Outcome.h"
#include "region/overlay/OverlayScratch.h"

namespace gmregion {

/// Whether something is covered that two sets run round so often.
using Covers = bool (*)(Weight);

/// Makes a set of what is covered by the strands in the arrangement of a scratch.
/// @param split see Arrangement::settle
/// @return whether there is a result; else the outcome says why not
bool overlay(OverlayScratch& scratch, double tolerance, Index split, Care care,
             const OriginSource& source, Covers covers, Outcome& outcome);

/// How an overlay is tried.
struct OverlayAttempt {
    double share;  ///< of the tolerance
    Care care;
};
constexpr std::array<OverlayAttempt, 6> kOverlayAttempts{{{1.0, Care::kUsual},
                                                          {1.0, Care::kThorough},
                                                          {1.0 / 2.0, Care::kThorough},
                                                          {1.0 / 8.0, Care::kThorough},
                                                          {1.0 / 64.0, Care::kThorough},
                                                          {1.0 / 1024.0, Care::kThorough}}};

/// Lays a result over itself once more, so that it holds for a tolerance: no element shorter,
/// nothing nearer to each other. Where that does not work out it stays as it is, with the tolerance
/// that it has.
void consolidate(OverlayScratch& scratch, double tolerance, Outcome& outcome);

/// The same, and once more with more care where that does not work out, then with smaller
/// parts of the tolerance: what lies just within the tolerance then lies just beyond it.
/// @param fill fills the strands, and answers where to split them
template <class Fill>
bool overlayInAttempts(OverlayScratch& scratch, double tolerance, const Fill& fill,
                       const OriginSource& source, Covers covers, Outcome& outcome) {
    for (const OverlayAttempt& attempt : kOverlayAttempts) {
        Strands& strands = scratch.arrangement.strands();
        strands.clear();
        const Index split = fill(strands);
        scratch.order.improve(strands, split);
        if (!overlay(scratch, attempt.share * tolerance, split, attempt.care, source, covers,
                     outcome))
            continue;
        if (attempt.share < 1.0) consolidate(scratch, tolerance, outcome);
        return true;
    }
    return false;
}

/// Gives up: an empty set and a refusal.
bool refuse(Outcome& outcome, const Refusal& refusal);

/// The same for an arrangement that has not settled.
bool refuseUnsettled(const Arrangement& arrangement, Outcome& outcome);

/// Begins an outcome anew, keeping its memory.
void beginOutcome(Outcome& outcome, double tolerance);

}  // namespace gmregion
