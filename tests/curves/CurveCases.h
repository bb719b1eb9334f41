#pragma once

#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <memory>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmBeam.h"
#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmStretch.h"

/// Random curves and an independent measure to judge them by.
namespace cases {

/// The five kinds of curves of which every pair can be intersected.
std::vector<GmBase::eGmTypes> const& Kinds();
char const* NameOf(GmBase::eGmTypes kind);

/// Is the point defined and within `eps` of (x, y, z)?
::testing::AssertionResult IsAt(GmPoint const& p, double x, double y, double z = 0.0,
                                double eps = 1e-9);
/// Is the direction defined and within 1e-9 of (x, y, 0)?
::testing::AssertionResult Points(GmDir const& d, double x, double y);

/// Random values on a quarter-unit grid within 8 units of the origin, angles in steps of 15
/// degrees: parallels, tangents, shared ends and axis directions come up often, and nothing is
/// smaller than 0.25 units or 15 degrees. Arcs are no full circles.
GmPoint AnyGridPoint();
GmLine AnyLine();
GmStretch AnyStretch();
GmCircle AnyCircle();
GmArc AnyArc();
GmBase::eRotDir AnySense();
/// A signed distance on the grid, not zero.
double AnyOffset();
/// A curve of one of the Kinds().
std::unique_ptr<GmCurve> AnyCurve(GmBase::eGmTypes kind);

/// The point at the fraction t in 0..1 of a curve; lines and beams show a window of 100 units.
GmPoint Along(GmCurve const& curve, double t);
/// The distance of a point from a curve by elementary trigonometry on the curve's fields.
double ExactDist(GmCurve const& curve, GmPoint const& p);

/// The smallest distance of samples of one curve from another curve; the true distance of the
/// shown part is smaller by less than `step`.
struct Sampled {
    double dist;
    double step;
};
Sampled SampledDist(GmCurve const& sampled, GmCurve const& other);

}  // namespace cases
