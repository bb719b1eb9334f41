// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmCircle.h"
#include "gmkernel/GmCurve.h"

namespace gmkernel_detail {

/// The circle of radius `r` that rounds the corner between the end of one element and the start of
/// the next; undefined where there is none and for elements other than segments and arcs.
GmCircle filletCircle(GmCurve const& first, GmCurve const& second, double r);

}  // namespace gmkernel_detail
