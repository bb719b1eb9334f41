// SPDX-License-Identifier: MIT
#pragma once

#include "gmbridge/Refusal.h"
#include "gmkernel/GmBase.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Outcome.h"
#include "gmregion/Workspace.h"

namespace gmbridge {

/// What a closed contour runs round, and in which sense it does.
struct OutlineRegion {
    gmregion::RegionSet region;
    GmBase::eRotDir sense = GmBase::eRotNone;
    Refusal refusal;
};

/// Takes the region of a closed path, and its sense; refused when it has both senses, or none. What
/// has room for no disc of the kernel's length tolerance as radius does not count.
OutlineRegion outlineRegion(const gmregion::PathView& outline, gmregion::Workspace& workspace);

/// What a path runs round, in whatever sense.
gmregion::Outcome cleanedUp(const gmregion::PathView& path, gmregion::FillRule rule,
                            gmregion::Workspace& workspace);

/// A refusal of the regions as one of the bridge.
Refusal refusalOf(const gmregion::Refusal& refusal, std::size_t contour);

}  // namespace gmbridge
