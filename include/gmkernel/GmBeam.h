// SPDX-License-Identifier: MIT
/// @file
/// The ray.
#ifndef GMKERNEL_GMBEAM_H
#define GMKERNEL_GMBEAM_H

#include <boost/operators.hpp>

#include "gmkernel/GmLine.h"
#include "gmkernel/export.h"

/// A ray that starts at its origin and runs to infinity along its direction.
///
/// Bounded only in membership and nearest points: distances of points, parallels (which are lines),
/// the bounding rectangle (of the origin), tangents and the trace are those of the supporting line.
class GMKERNEL_EXPORT GmBeam : public GmLine, public boost::equality_comparable<GmBeam> {
public:
    /// An undefined beam.
    GmBeam();
    /// Copies origin, direction, creation flag and solution list.
    GmBeam(GmBeam const& beam);
    /// The ray from `p1` towards `p2`; undefined when a point is.
    GmBeam(GmPoint const& p1, GmPoint const& p2);
    /// The ray from `p` along `dir`; undefined when one of them is.
    GmBeam(GmPoint const& p, GmDir const& dir);
    /// The parallel ray at the signed distance `d`, positive to the right; carries the creation
    /// flag of `beam`, its fields are computed also when that is undefined.
    GmBeam(GmBeam const& beam, double d);
    ~GmBeam() override;
    /// Copies origin, direction, creation flag and solution list.
    GmBeam& operator=(GmBeam const& beam);

    /// A new beam; the caller owns it.
    GmBeam* Clone() const override;
    /// Reverses the direction in place: the origin stays, the ray covers the other half of the
    /// supporting line.
    void Invert() override;
    using GmLine::Element;
    /// Is the foot of the point on the supporting line strictly nearer than `eps`, and ahead of the
    /// origin or equal to it?
    bool Element(GmPoint const& p, double eps) const override;
    using GmLine::MinDist;
    /// The foot of the point where it lies on the ray, else the origin; the flag is ignored.
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// Moves the origin; the direction is unchanged.
    void SetSP(GmPoint const& p) override;
    /// The direction.
    GmDir TangSP() const override;

    /// The ray from the same origin in the opposite direction.
    GmBeam Inverted() const;
    /// Origin on this ray, the same direction and equal type tags.
    bool operator==(GmBeam const& beam) const;
};

#endif  // GMKERNEL_GMBEAM_H
