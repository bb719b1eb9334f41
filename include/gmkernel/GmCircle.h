/// @file
/// The full circle.
#ifndef GMKERNEL_GMCIRCLE_H
#define GMKERNEL_GMCIRCLE_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmCurve.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/export.h"

/// A full circle: centre, radius and axis; base of the arc.
///
/// Intersections are computed in the x-y plane and take z from a centre; distances of points are
/// three-dimensional. The axis is carried along and takes part in no computation. A circle has no
/// start and no end.
class GMKERNEL_EXPORT GmCircle : public GmCurve, public boost::equality_comparable<GmCircle> {
public:
    /// An undefined circle: centre (0, 0), radius 0, axis (0, 0, 1).
    GmCircle();
    /// Copies centre, radius, axis, creation flag and solution list; the copy is a circle also when
    /// the source is an arc.
    GmCircle(GmCircle const& circle);
    /// The circle of radius |r| (length units, 0 allowed) about `m`; undefined when `m` is. The
    /// flag has no effect.
    GmCircle(GmPoint const& m, double r, bool flag);
    /// The circle of radius |r| about `m` in the plane with the given axis; undefined when `m` is.
    GmCircle(GmPoint const& m, GmDir const& axis, double r);
    /// The concentric circle with the radius enlarged by `d`; undefined with radius 0 when `circle`
    /// is or when the new radius falls below m_scdPrec.
    GmCircle(GmCircle const& circle, double d);
    ~GmCircle() override;
    /// Copies centre, radius, axis, creation flag and solution list, and keeps the own type tag;
    /// nothing when assigned to itself.
    GmCircle& operator=(GmCircle const& circle);

    /// A new circle; the caller owns it.
    GmCircle* Clone() const override;
    /// The square about the circle.
    GmRect BoundingRect() const override;

protected:
    /// Clears the flag; centre (0, 0), radius 0, axis (0, 0, 1).
    void Undefine() override;

public:
    /// Is the distance from the centre strictly within `eps` of the radius?
    bool Element(GmPoint const& p, double eps) const override;
    /// Membership within m_scdPrec.
    bool Element(GmPoint const& p) const override;
    /// The distance from the circle line, inside and outside.
    double Dist(GmPoint const& p) const override;
    using GmCurve::MinDist;
    /// The crossing with the ray from the centre through the point; for the centre itself SP(). The
    /// flag is ignored. Replaces the solution list.
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// Strictly nearer to the centre than the radius.
    bool In(GmPoint const& p) override;
    /// Strictly farther from the centre than the radius.
    bool Out(GmPoint const& p) override;
    /// The nearest point of the curve on the line through centre and point; for the centre itself
    /// SP() (undefined on a full circle). Replaces the solution list.
    GmPoint NP(GmPoint const& p) const override;
    /// The tangent through a point of the circle (within m_scdPrec), directed clockwise about the
    /// centre; else undefined.
    GmLine Tangent(GmPoint const& p) const override;
    /// The circumference.
    double Length() const override;
    /// A new circle with the radius enlarged by `d`, possibly undefined; the caller owns it.
    GmCurve* GetParallel(double d) const override;
    /// Moves the centre.
    void Translation(GmVec const& v) override;
    /// Known limit: leaves the circle unchanged.
    void Transform(GmMatrix const& m) override;
    /// "circ (x, y) R = r" with five decimals: centre, radius.
    std::string GetTraceString() const override;

    /// The point in which a line touches the circle (within m_scdPrec); undefined where it does
    /// not.
    virtual GmPoint GetTangPoint(GmLine const& line);
    /// The point in which another circle touches this one from outside or inside (within
    /// m_scdPrec); undefined where it does not, and for equal radii in internal contact.
    virtual GmPoint GetTangPoint(GmCircle const& circle);
    /// The point of this curve that faces another curve, offered to nearest-point searches.
    ///
    /// On the perpendicular through the centre for straight curves (the nearer of two); on the line
    /// of centres for circles and arcs, there of two points the one farther from the other centre.
    /// Concentric curves take the other's start for its centre; where it has none, SP() answers.
    /// Undefined for other kinds and where the curve has no such point. Replaces the solution list.
    virtual GmPoint NP(GmCurve const* c) const;

    /// The centre.
    GmPoint M() const;
    /// The radius (length units), never negative.
    double R() const;
    /// The axis of the circle's plane.
    GmDir const& Axis() const;
    /// The clockwise tangent direction at a point of the curve; undefined elsewhere.
    GmDir TangDir(GmPoint const& p) const;
    /// The gap between circle and straight curve (on a stretch: the segment); 0 where they meet.
    double Dist(GmLine const& line) const;
    /// The gap between two circles, also when one lies inside the other; 0 where they meet.
    double Dist(GmCircle const& circle) const;
    /// Intersects the full circle with the carrier of a straight curve; the points replace the
    /// solution list. Only touching is judged by the curve itself: a stretch has to reach the
    /// point. A line up to m_scdPrec outside the circle touches it; one parallel to the y axis only
    /// up to about 1e-9 / R outside.
    /// @return 0, 1 (touching) or 2
    int IntersectionWithLine(GmLine const& line) const;
    /// Intersects two full circles; the points replace the solution list, the one on the right of
    /// the direction from this centre to the other first. Concentric circles have none.
    /// @return 0, 1 (touching) or 2
    int IntersectionWithCircle(GmCircle const& circle) const;
    /// Radii exactly equal, centres equal; the axis is not compared.
    bool operator==(GmCircle const& circle) const;

protected:
    /// Sets centre, axis and radius and marks the circle as created.
    void Define(GmPoint const& m, GmDir const& axis, double r);

    GmPoint m_M;   ///< centre
    GmDir m_Axis;  ///< axis of the plane
    double m_dR;   ///< radius
};

#endif  // GMKERNEL_GMCIRCLE_H
