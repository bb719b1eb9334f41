// SPDX-License-Identifier: MIT
/// @file
/// Between a plane and a rotary axis.
///
/// Unrolling a cylinder maps the circumference to one turn. On an end face a point is its distance
/// from the axis and its angle, clockwise from the positive y axis, where the rest of the library
/// counts counter-clockwise from x. Turns of the cylinder are not reduced, and radii are not tested
/// against the offset.
#include <cmath>

#include "gmkernel/GmRotary.h"
#include "gmkernel/GmVec.h"
#include "kernel/values/Constants.h"

using gmkernel_detail::kPi;

namespace {

/// Coordinates are scaled, so that the tolerance of polar angles acts at 1e-7 of the length unit.
constexpr double kScale = 1000.0;

/// From the polar angle in (-180, 180] to the clockwise one from the positive y axis.
double clockwiseFromY(double degrees) {
    return degrees >= 0.0 ? std::fmod(450.0 - degrees, 360.0) : std::fabs(degrees) + 90.0;
}

}  // namespace

void Tracyl(double s, double r, double& angle) {
    const bool noCylinder = std::fabs(kScale * r) <= GmBase::m_scdPrec;
    angle = noCylinder ? 0.0 : s / (2.0 * r * kPi) * 360.0;
}

void ITracyl(double a, double r, double& length) {
    length = 2.0 * r * kPi * a / 360.0;
}

void Transmit(double x, double y, double c, double& radius, double& angle) {
    const GmVec v(kScale * x, kScale * y, 0.0);
    radius = (v.Length() + kScale * c) / kScale;
    angle = clockwiseFromY(v.DAngle());
}

void ITransmit(double radius, double angle, double c, double& x, double& y) {
    const double phi = kPi / 2.0 - angle * kPi / 180.0;
    const double rho = radius - c;
    x = std::cos(phi) * rho;
    y = std::sin(phi) * rho;
}
