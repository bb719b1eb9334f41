// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Element.h"

namespace gmbridge {

/// The centre of an arc; not finite for a segment.
inline gmregion::Point centreOf(const gmregion::Element& e) {
    const double beside = (e.bulge * e.bulge - 1.0) / (4.0 * e.bulge);
    return {0.5 * (e.sp.x + e.ep.x) + beside * (e.ep.y - e.sp.y),
            0.5 * (e.sp.y + e.ep.y) - beside * (e.ep.x - e.sp.x)};
}

}  // namespace gmbridge
