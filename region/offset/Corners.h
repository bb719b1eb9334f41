// SPDX-License-Identifier: MIT
#pragma once

#include "region/offset/OffsetSource.h"

namespace gmregion {

/// Whether the corner between two elements opens to a side, so that their parallels on that side
/// leave a gap. Where an element turns back, on the side on which it comes back.
/// @param distance to the right of the elements when positive
bool opensTo(const SourceElement& before, const SourceElement& after, double distance);

}  // namespace gmregion
