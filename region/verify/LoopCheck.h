// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Verify.h"
#include "region/locate/BoundaryIndex.h"
#include "region/verify/FaultList.h"

namespace gmregion {

/// Whether all numbers of loops are finite; else the fault is reported.
bool checkNumbers(const LoopsView& view, FaultList& faults);

/// What every set must hold: loops close, no element is shorter than the tolerance, none crosses
/// another one or runs along it, outlines and holes nest. Cost: near-linear.
/// @param index of the same loops
void checkLoops(const LoopsView& view, const BoundaryIndex& index, double tolerance,
                FaultList& faults);

}  // namespace gmregion
