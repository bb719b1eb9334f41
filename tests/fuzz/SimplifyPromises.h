// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Simplify.h"
#include "tests/fuzz/Complaints.h"

namespace gmregion::fuzz {

/// What a simplified heap must hold: a path for each, no more elements, bit by bit connected, ends
/// of open paths in place, and both ways within the tolerance.
void checkSimplified(const Paths& source, const SimplifyOptions& options,
                     const Simplified& simplified, Complaints& complaints);

/// The same for what stands for a curve, whose distance is not asked for.
void checkCurve(const std::vector<TangentPoint>& points, bool closed, const Simplified& simplified,
                Complaints& complaints);

}  // namespace gmregion::fuzz
