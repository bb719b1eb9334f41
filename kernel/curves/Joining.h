// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmCurve.h"
#include "gmkernel/GmLine.h"

namespace gmkernel_detail {

/// Of two solution points of a curve the farther one from a reference wins, ties take the first.
GmPoint fartherSolution(GmCurve const& curve, GmPoint const& reference);

/// Ends `first`, and starts `next`, at their crossing, the one farther from the start of `first` of
/// two. True without change when they meet already, false without change when they do not cross.
bool trimToCrossing(GmCurve& first, GmCurve* next);

/// Moves the end of `first` and the start of `next` to one point.
void joinAt(GmCurve& first, GmCurve const& next, GmPoint const& p);

/// A new curve from the end of `from` to the start of `next`, owned by the caller: a stretch for
/// mode 0, for mode 1 an arc that leaves `from` tangentially where one fits (else a stretch).
/// @param normalAtEnd the normal of `from` at its end
/// @param normalAtNext the normal of `next` at its start, undefined for kinds without one
/// @return null for any other mode, and for mode 1 when a normal is undefined
GmCurve* connectingCurve(GmCurve const& from, GmLine const& normalAtEnd, GmCurve const& next,
                         GmLine const& normalAtNext, int mode);

}  // namespace gmkernel_detail
