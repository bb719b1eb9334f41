// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmBase.h"

namespace gmkernel_detail {

/// The sense of the cyclic order a0, a1, a2 of polar angles in (-180, 180] on the circle; eRotNone
/// where two of them coincide.
GmBase::eRotDir angleOrder(double a0, double a1, double a2);

}  // namespace gmkernel_detail
