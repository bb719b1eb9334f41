// SPDX-License-Identifier: MIT
#pragma once

#include <cmath>

#include "region/plane/ElementWinding.h"

namespace gmregion {

/// Calls visit for an element, or for its halves when it turns by more than half a turn.
template <class Visit>
void visitHalves(const Element& e, const Visit& visit) {
    if (std::fabs(e.bulge) <= 1.0) {
        visit(e);
        return;
    }
    const Vec2 m = middleOf(e);
    const double half = e.bulge / (1.0 + std::sqrt(1.0 + e.bulge * e.bulge));
    visit(Element{e.sp, m, half});
    visit(Element{m, e.ep, half});
}

}  // namespace gmregion
