// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Outcome.h"
#include "region/overlay/OverlayScratch.h"

namespace gmregion {

/// Whether something is covered that two sets run round so often.
using Covers = bool (*)(Weight);

/// Makes a set of what is covered by the strands in the arrangement of a scratch.
/// @param split see Arrangement::settle
/// @return whether there is a result; else the outcome says why not
bool overlay(OverlayScratch& scratch, double tolerance, Index split, const OriginSource& source,
             Covers covers, Outcome& outcome);

/// The same, and once more with half the tolerance where that does not work out: what lies just
/// within the tolerance then lies just beyond it.
/// @param fill fills the strands, and answers where to split them
template <class Fill>
bool overlayTwice(OverlayScratch& scratch, double tolerance, const Fill& fill,
                  const OriginSource& source, Covers covers, Outcome& outcome) {
    for (const double share : {1.0, 0.5}) {
        Strands& strands = scratch.arrangement.strands();
        strands.clear();
        const Index split = fill(strands);
        if (!overlay(scratch, share * tolerance, split, source, covers, outcome)) continue;
        SetWriter::setTolerance(outcome.regions, tolerance);
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
