// SPDX-License-Identifier: MIT
#ifndef GMKERNEL_GMPOINT_H
#define GMKERNEL_GMPOINT_H

#include <string>

#include "gmkernel/GmBase.h"
#include "gmkernel/GmVec.h"
#include "gmkernel/export.h"

/// A point: a position vector with a type tag of its own.
///
/// The free operators inherited from the vector yield vectors; `GmPoint(p + v)` makes a point of
/// the result. Points compare equal when each coordinate agrees within m_scdPrec.
class GMKERNEL_EXPORT GmPoint : public GmVec {
public:
    /// The undefined point with coordinates 0.
    GmPoint();
    /// A point with z = 0.
    GmPoint(double x, double y);
    GmPoint(double x, double y, double z);
    /// Copies coordinates and creation flag.
    GmPoint(GmVec const& v);
    GmPoint(GmPoint const& p);
    /// The midpoint of two points. Undefined with coordinates 0 when one of them is undefined.
    GmPoint(GmPoint const& a, GmPoint const& b);
    /// The centroid of three points. Undefined with coordinates 0 when one of them is undefined.
    GmPoint(GmPoint const& a, GmPoint const& b, GmPoint const& c);
    ~GmPoint() override;

    GmPoint* Clone() const override;
    /// The rectangle of width and height 0 on the point; undefined for an undefined point.
    GmRect BoundingRect() const override;
    /// "point " and the raw trace string.
    std::string GetTraceString() const override;

    /// Copies coordinates and creation flag.
    GmPoint& operator=(GmPoint const& p);

    /// The distance to p over all three coordinates.
    double Dist(GmPoint const& p) const;
    /// The squared distance to p.
    double Dist2(GmPoint const& p) const;
    /// The direction towards p: zero but defined for coincident points, undefined when either
    /// point is undefined.
    GmDir Dir(GmPoint const& p) const;
    /// The distance to p, positive when p lies in direction d from here, negative otherwise;
    /// -0.0 for coincident points.
    double DirDist(GmPoint const& p, GmDir const& d) const;
    /// The angle in degrees swept from this point to p about the centre c in the sense rot, in
    /// [0, 360). Every sense but eRotCW counts as counter-clockwise.
    double AngDist(GmPoint const& p, GmPoint const& c, GmBase::eRotDir rot) const;
    /// The smaller of the angles between this point and p about the centre c, in [0, 180] degrees.
    double AngDist(GmPoint const& p, GmPoint const& c) const;
    /// The midpoint to p, or the centroid with p and q.
    GmPoint Mean(GmPoint const& p) const;
    GmPoint Mean(GmPoint const& p, GmPoint const& q) const;

    /// Moves the point by v; the creation flag does not change.
    void Translation(GmVec const& v);
    /// Replaces the point by its image under m; it becomes defined.
    void Transform(GmMatrix const& m);
};

#endif  // GMKERNEL_GMPOINT_H
