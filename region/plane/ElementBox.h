// SPDX-License-Identifier: MIT
#pragma once

#include "region/model/Box.h"

namespace gmregion {

/// A box about an element that turns by half a turn at the most; never too small but for rounding,
/// and for flat arcs larger than the exact one by up to their height. Unlike the exact box it needs
/// no centre.
Box boxAbout(const Element& e);

}  // namespace gmregion
