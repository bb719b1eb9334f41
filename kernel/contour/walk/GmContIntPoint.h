#pragma once

#include "gmkernel/GmPoint.h"

/// A passage: the place where a walk along numbered curves may leave one for another.
struct GmContIntPoint {
    int nFrom;           ///< curve on which the walk arrives
    int nTo;             ///< curve on which it goes on
    GmPoint Point;       ///< their crossing
    bool bUsed = false;  ///< a walk has passed here
};
