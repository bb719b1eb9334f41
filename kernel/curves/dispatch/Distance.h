// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmBase.h"

/// The distance of two objects, for offsetting.
///
/// Exact for points, stretches and arcs (0 where they cross). Any other pair of curves answers with
/// GmCurve::MinDist, and everything else with the largest double. Never throws for a missing pair.
double Distance(GmBase const& a, GmBase const& b);
