// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Questions.h"

#include "part/model/Path.h"

namespace gmpart {

/// True when no part of a path is outside of what a locator's set covers and some part is inside.
/// Parts within the kernel's tolerance of the boundary do not count. Cost: a question to the
/// locator for every element, and for every halving of those that come near to the boundary.
bool liesIn(const Path& path, const gmregion::Locator& outer);

}  // namespace gmpart
