// SPDX-License-Identifier: MIT
/// @file
/// The sense in which three angles follow each other on the circle.
///
/// Of the six orders of three different angles in (-180, 180] three are rotations of one another
/// and go counter-clockwise, the others clockwise; so comparisons decide, without differences that
/// would have to be brought back into the range. Angles are compared exactly: there is no
/// tolerance.
#include "kernel/curves/kernels/AngleOrder.h"

namespace gmkernel_detail {

GmBase::eRotDir angleOrder(double a0, double a1, double a2) {
    if (a0 < a1 && a1 < a2) return GmBase::eRotCCW;
    if (a2 < a0 && (a0 < a1 || a1 < a2)) return GmBase::eRotCCW;
    if (a2 < a1 && a1 < a0) return GmBase::eRotCW;
    if (!(a0 < a2)) return GmBase::eRotNone;
    if (a1 < a0) return GmBase::eRotCW;
    if (!(a2 < a1)) return GmBase::eRotNone;
    return GmBase::eRotCW;
}

}  // namespace gmkernel_detail
