// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Outcome.h"
#include "region/overlay/Scratch.h"

namespace gmregion {

/// Whether something is covered that two sets run round so often.
using Covers = bool (*)(Weight);

/// Makes a set of what is covered by the strands in the arrangement of a scratch.
/// @param split see Arrangement::settle
/// @return whether there is a result; else the outcome says why not
bool overlay(Scratch& scratch, double tolerance, Index split, const OriginSource& source,
             Covers covers, Outcome& outcome);

/// Gives up: an empty set and a refusal.
bool refuse(Outcome& outcome, const Refusal& refusal);

/// Begins an outcome anew, keeping its memory.
void beginOutcome(Outcome& outcome, double tolerance);

}  // namespace gmregion
