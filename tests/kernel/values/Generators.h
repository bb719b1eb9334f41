// SPDX-License-Identifier: MIT
#pragma once

#include <rapidcheck.h>

#include "gmkernel/GmPoint.h"

/// A coordinate in -1000..1000 with three decimals; zero and whole numbers come up often enough to
/// hit the axes.
inline rc::Gen<double> anyCoordinate() {
    return rc::gen::oneOf(
        rc::gen::map(rc::gen::inRange(-1000000, 1000001), [](int i) { return i / 1000.0; }),
        rc::gen::map(rc::gen::inRange(-3, 4), [](int i) { return static_cast<double>(i); }));
}

/// Degrees in a few turns, whole degrees and thus the seams among them.
inline rc::Gen<double> anyDegrees() {
    return rc::gen::oneOf(
        rc::gen::map(rc::gen::inRange(-1000000, 1000001), [](int i) { return i / 1000.0; }),
        rc::gen::map(rc::gen::inRange(-12, 13), [](int i) { return i * 90.0; }));
}

inline GmVec anyVec() {
    double const x = *anyCoordinate();
    double const y = *anyCoordinate();
    double const z = *anyCoordinate();
    return GmVec(x, y, z);
}

inline GmPoint anyPoint() {
    return GmPoint(anyVec());
}
