// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/RegionSet.h"
#include "gmregion/Verify.h"

#include "part/offset/PartOffset.h"

namespace gmpart {

/// Offsets every contour by itself as the kernel does it, with round joins.
///
/// Those of closed contours are checked, see checkKernelOffset(). Those of open ones are not; for
/// sides other than right and left they are offset to both. A contour that the kernel cannot hold
/// is refused in every pass, for a gap.
PartOffsets offsetPartByKernel(const std::vector<Path>& contours, const OffsetRequest& request,
                               const ProgressCall& progress);

/// What a check of an offset of the kernel found, and the offset as regions.
struct KernelVerdict {
    gmregion::Verdict verdict;
    gmregion::RegionSet regions;
};

/// Checks an offset that the kernel made of one contour: its loops must be the boundary of regions,
/// loop for loop, and these must keep the distance within 1e-3.
/// @param source what the contour runs round
/// @param distance positive outward
/// @param loops what the kernel made
KernelVerdict checkKernelOffset(const gmregion::RegionSet& source, double distance,
                                const std::vector<Path>& loops);

}  // namespace gmpart
