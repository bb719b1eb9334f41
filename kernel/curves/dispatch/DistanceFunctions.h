// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmArc.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/GmStretch.h"

namespace gmkernel_detail {

// The distances of points, stretches and arcs; 0 where two curves cross.
double distance(GmPoint const& a, GmPoint const& b);
double distance(GmPoint const& p, GmArc const& arc);
double distance(GmPoint const& p, GmStretch const& stretch);
double distance(GmStretch const& a, GmStretch const& b);
double distance(GmArc const& arc, GmStretch const& stretch);
/// Of two arcs that do not cross one facing pair competes with the ends: the points of both circles
/// on the line of centres, each towards the other centre. Where one circle lies inside the other
/// that pair is not the nearest one.
double distance(GmArc const& a, GmArc const& b);

}  // namespace gmkernel_detail
