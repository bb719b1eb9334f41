// SPDX-License-Identifier: MIT
#include "part/kernel/BoxedCurve.h"

#include "gmkernel/GmRect.h"

namespace gmpart {

void BoxedCurve::take(const GmCurve& other) {
    curve.reset(other.Clone());
    const GmRect rect = curve->BoundingRect();
    box = {{rect.Left(), rect.Bottom()}, {rect.Right(), rect.Top()}};
}

bool meet(const BoxedCurve& a, const BoxedCurve& b) {
    return a.box.grown(kKernelTolerance).overlaps(b.box) &&
           a.curve->Intersection(b.curve.get()) > 0;
}

}  // namespace gmpart
