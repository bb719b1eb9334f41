// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>
#include <vector>

#include "region/model/Path.h"

namespace gmregion {

/// What is wrong with the offset of a path, the lesser fault first.
enum class OffsetFault {
    kNone,
    kMissing,   ///< a part of it is missing
    kDistance,  ///< a result leaves the distance from the source
    kOpen       ///< the source is closed, a result is not
};

/// The fault as the end of a sentence about an offset.
std::string_view faultText(OffsetFault fault);

/// The tolerance of the check for a source: 1e-3, or 1e-6 of its size if that is more.
double checkTolerance(const Path& source);

/// Compares the offset of a path at the signed distance d (positive to the right) with its source:
/// results of a closed path must be closed, keep the distance from the source, and leave out no
/// point beside the source that keeps it, within checkTolerance. Points are sampled; a defect
/// shorter than about a 1000th of the offset's length may stay unseen. Results below the kernel's
/// shortest piece, and gaps left by a few of them, are no fault. Distances below the kernel's
/// tolerance, of which the kernel makes copies, are not checked. Cost: linear in the number of
/// elements, times a logarithm.
OffsetFault checkOffset(const Path& source, double d, const std::vector<Path>& results);

}  // namespace gmregion
