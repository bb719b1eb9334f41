// SPDX-License-Identifier: MIT
/// @file
/// Conversions of coordinates between a plane and a rotary axis.
#ifndef GMKERNEL_GMROTARY_H
#define GMKERNEL_GMROTARY_H

#include "gmkernel/export.h"

/// From a length along the circumference of a cylinder to the rotation that covers it:
/// s / (2 pi r) * 360.
/// @param s length in length units, signed
/// @param r radius of the cylinder; up to 1e-7 in magnitude it counts as 0 and the angle is 0
/// @param angle receives degrees, not reduced to one turn
GMKERNEL_EXPORT void Tracyl(double s, double r, double& angle);

/// From a rotation of a cylinder to the length along its circumference: 2 pi r a / 360.
/// @param a angle in degrees
/// @param r radius of the cylinder, length units
/// @param length receives length units
GMKERNEL_EXPORT void ITracyl(double a, double r, double& length);

/// From Cartesian coordinates on an end face to polar ones.
/// @param x, y the point in length units; a coordinate below 1e-7 in magnitude counts as 0 for the
///        angle, except that with both so small any negative y gives 180
/// @param c offset added to the radius
/// @param radius receives the distance from the origin plus `c`
/// @param angle receives degrees in [0, 360), clockwise from the positive y axis; 90 at the origin
GMKERNEL_EXPORT void Transmit(double x, double y, double c, double& radius, double& angle);

/// From polar coordinates on an end face back to Cartesian ones; undoes Transmit() with the same
/// offset.
/// @param radius the radius with the offset in it, length units
/// @param angle degrees, clockwise from the positive y axis
/// @param c the offset
/// @param x, y receive the point in length units
GMKERNEL_EXPORT void ITransmit(double radius, double angle, double c, double& x, double& y);

#endif  // GMKERNEL_GMROTARY_H
