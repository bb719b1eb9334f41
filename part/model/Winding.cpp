// SPDX-License-Identifier: MIT
#include "part/model/Winding.h"

#include "region/plane/ElementHalves.h"
#include "region/plane/ElementWinding.h"

namespace gmpart {

int windingNumber(const Path& path, Vec2 p) {
    int winding = 0;
    for (const Element& e : path.elements) {
        gmregion::visitHalves(e, [&](const Element& half) {
            if (half.sp != half.ep) winding += gmregion::windingOf(half, p);
        });
    }
    return winding;
}

}  // namespace gmpart
