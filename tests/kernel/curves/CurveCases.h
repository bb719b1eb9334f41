// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <memory>
#include <string>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmBeam.h"
#include "gmkernel/GmCircle.h"
#include "gmkernel/GmStretch.h"

/// Random curves, an independent measure to judge them by, and points as text.
namespace cases {

GmBase::eRotDir constexpr CW = GmBase::eRotCW;
GmBase::eRotDir constexpr CCW = GmBase::eRotCCW;

/// "x,y" or "x,y,z" (where z is not 0) with nine digits, "none" for undefined ones.
std::string Text(GmPoint const& p);
std::string Text(GmDir const& d);
/// The points' texts, separated by blanks.
std::string TextOf(std::vector<GmPoint> const& points);

GmStretch Stretch(double x1, double y1, double x2, double y2);
GmCircle Circle(double x, double y, double r);
/// Angles in degrees.
GmArc Arc(double x, double y, double r, double start, double end, GmBase::eRotDir rot);

/// The five kinds of curves of which every pair can be intersected.
std::vector<GmBase::eGmTypes> const& Kinds();
std::string PairName(GmBase::eGmTypes first, GmBase::eGmTypes second);

/// Random values on a quarter-unit grid within 8 units of the origin, angles in steps of 15
/// degrees: parallels, tangents, shared ends and axis directions come up often, and nothing is
/// smaller than 0.25 units or 15 degrees. Arcs are no full circles, offsets are signed and not
/// zero.
GmPoint AnyGridPoint();
GmStretch AnyStretch();
GmArc AnyArc();
double AnyOffset();
std::unique_ptr<GmCurve> AnyCurve(GmBase::eGmTypes kind);

/// The point at the fraction t in 0..1 of a curve; lines and beams show a window of 100 units.
GmPoint Along(GmCurve const& curve, double t);
/// The distance of a point from a curve by elementary trigonometry on the curve's fields.
double ExactDist(GmCurve const& curve, GmPoint const& p);

}  // namespace cases
