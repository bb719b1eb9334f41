// SPDX-License-Identifier: MIT
/// @file
/// Lines as y = k x + d.
///
/// The form makes crossings and distances one formula, at the price of the lines parallel to the y
/// axis, which stand apart. A direction counts as parallel within the tolerance of directions; a
/// line beside that limit has a slope of about a million.
#include "kernel/curves/kernels/SlopeForm.h"

namespace gmkernel_detail {

bool parallelToYAxis(GmDir const& dir) {
    return GmParallelDir(dir, GmDir(0.0, 1.0, 0.0));
}

SlopeForm slopeForm(GmPoint const& sp, GmDir const& dir) {
    if (parallelToYAxis(dir)) return {true, 0.0, sp.X()};
    const double k = dir.k();
    return {false, k, sp.Y() - k * sp.X()};
}

}  // namespace gmkernel_detail
