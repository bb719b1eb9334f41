// SPDX-License-Identifier: MIT
/// @file
/// Lines as y = k x + d.
///
/// The form makes crossings and distances one formula, at the price of the lines parallel to the y
/// axis, which stand apart. A direction counts as parallel within the tolerance of directions; a
/// line beside that limit has a slope of about a million.
#include "kernel/curves/kernels/SlopeForm.h"

namespace gmkernel_detail {

namespace {

/// Of the components of unit directions.
double directionTolerance() {
    return GmBase::m_scdPrec / 100.0;
}

}  // namespace

bool isParallel(Vec3 const& a, Vec3 const& b) {
    return isEqual(a, b, directionTolerance()) ||
           isEqual(a, standardized(-b), directionTolerance());
}

bool parallelToYAxis(Vec3 const& dir) {
    return isEqual(dir, {0.0, 1.0, 0.0}, directionTolerance()) ||
           isEqual(dir, {0.0, -1.0, 0.0}, directionTolerance());
}

SlopeForm slopeForm(Vec3 const& sp, Vec3 const& dir) {
    if (parallelToYAxis(dir)) return {true, 0.0, sp.x};
    const double k = dir.x == 0.0 ? 0.0 : dir.y / dir.x;
    return {false, k, sp.y - k * sp.x};
}

}  // namespace gmkernel_detail
