// SPDX-License-Identifier: MIT
#pragma once

#include "region/offset/RoundOffset.h"

namespace gmregion {

/// A refusal of what is no distance, or no limit of miters.
Refusal checkedOffset(double distance, const OffsetOptions& options);

/// The offset of the source in a scratch, by one way after the other until one works out.
/// @param origins of the elements of the source
/// @param distance in length units, not 0
/// @param isOpen whether ends matter
/// @return what the runs of the result are made of; null when no way works out, the outcome says
/// what failed last
const MadeOf* offsetInAttempts(OverlayScratch& scratch, OffsetScratch& offsets,
                               const OriginSource& origins, double distance, double tolerance,
                               const OffsetOptions& options, bool isOpen, Outcome& outcome);

}  // namespace gmregion
