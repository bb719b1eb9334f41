// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmPoint.h"

/// A crossing from one curve onto another: where a walk along numbered curves may change over.
struct GmContIntPoint {
    int nFrom;           ///< curve on which the walk arrives
    int nTo;             ///< curve on which it goes on
    GmPoint Point;       ///< the point common to both
    bool bUsed = false;  ///< a walk has passed here
};
