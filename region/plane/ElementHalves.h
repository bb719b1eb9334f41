// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cmath>

#include "region/plane/ElementWinding.h"

namespace gmregion {

/// The halves of an element.
inline std::array<Element, 2> halvesOf(const Element& e) {
    const Vec2 m = middleOf(e);
    const double half = e.bulge / (1.0 + std::sqrt(1.0 + e.bulge * e.bulge));
    return {Element{e.sp, m, half}, Element{m, e.ep, half}};
}

/// Calls visit for an element, or for its halves when it turns by more than half a turn.
template <class Visit>
void visitHalves(const Element& e, const Visit& visit) {
    if (std::fabs(e.bulge) <= 1.0) {
        visit(e);
        return;
    }
    for (const Element& half : halvesOf(e))
        visit(half);
}

}  // namespace gmregion
