// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmBase.h"

namespace gmkernel_detail {

/// The sense of the cyclic order a0, a1, a2 on the circle of directions; eRotNone where two of them
/// coincide.
GmBase::eRotDir angleOrder(GmAngle const& a0, GmAngle const& a1, GmAngle const& a2);

}  // namespace gmkernel_detail
