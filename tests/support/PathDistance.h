// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <cmath>
#include <vector>

#include "region/plane/Nearest.h"
#include "region/simplify/Directions.h"

namespace gmregion::shapes {

/// The distance of a point from the nearest of some elements, by halves.
inline double distanceFrom(const std::vector<Element>& elements, Vec2 p) {
    double least = HUGE_VAL;
    for (const Element& e : elements) {
        if (e.sp == e.ep) continue;
        // An element of half a turn at the most is within its chord's length of its start.
        const double off = lengthOf(p - e.sp) - lengthOf(e.ep - e.sp);
        if (std::fabs(e.bulge) <= 1.0 && off > least) continue;
        const Parts parts = halved(e);
        for (const Element& half : {parts.first, parts.second})
            least = std::min(least, lengthOf(nearestOn(half, carrierOf(half), p) - p));
    }
    return least;
}

/// Calls visit for the starts of the 2^halvings equal parts of an element.
template <class Visit>
void visitSamples(const Element& e, int halvings, const Visit& visit) {
    if (halvings == 0 || e.sp == e.ep) return visit(e.sp);
    const Parts parts = halved(e);
    visitSamples(parts.first, halvings - 1, visit);
    visitSamples(parts.second, halvings - 1, visit);
}

/// The largest distance of the samples of some elements from others.
inline double farthest(const std::vector<Element>& from, const std::vector<Element>& to,
                       int halvings) {
    double most = 0.0;
    for (const Element& e : from)
        visitSamples(e, halvings, [&](Vec2 p) { most = std::max(most, distanceFrom(to, p)); });
    return most;
}

}  // namespace gmregion::shapes
