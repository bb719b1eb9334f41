// SPDX-License-Identifier: MIT
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

class GmArc;
class GmStretch;

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

    /// The circle through three points; undefined when one of them is, when two of them are equal
    /// and when all are collinear.
    GmCircle(GmPoint const& p1, GmPoint const& p2, GmPoint const& p3);
    /// The circle that touches three lines, about the crossing of the bisectors of (l1, l2) and of
    /// (reversed l1, l3). Directions choose among the four such circles: for a triangle, reversing
    /// one side of a boundary run in one sense leads from one circle to another. Undefined when a
    /// line is and when the bisectors do not cross.
    GmCircle(GmLine const& l1, GmLine const& l2, GmLine const& l3);
    /// The circle of radius |r| that touches two lines, in the sector between the rays that leave
    /// their crossing along both directions: at |r / sin(a/2)| from the crossing on the bisector,
    /// a the angle between the directions. Radius 0 gives the crossing. Undefined when a line is
    /// and for parallel lines.
    GmCircle(GmLine const& l1, GmLine const& l2, double r);
    /// The circle of radius `r` that touches a circle and a line. Undefined when one of them is,
    /// when `r` is not positive and when no such circle exists.
    /// @param c the circle to touch
    /// @param l the line to touch, directed
    /// @param r the radius, positive
    /// @param bRight the new circle lies right of the line, else left
    /// @param bOutside it touches `c` from outside, else from inside
    /// @param bAfter of two such circles the one that comes after its touching point with `c` in
    ///        the direction of the line, else the one that comes before it
    GmCircle(GmCircle const& c, GmLine const& l, double r, bool bRight, bool bOutside, bool bAfter);
    /// The circle of radius `r` that touches two circles. Undefined when one of them is, when `r`
    /// is not positive and when no such circle exists.
    /// @param c1, c2 the circles to touch
    /// @param r the radius, positive
    /// @param bCW of two such circles the one whose centre sees the touching point with `c2`
    ///        clockwise from that with `c1` (by less than a half-turn), else counter-clockwise
    /// @param bOutside1, bOutside2 it touches the circle from outside, else from inside
    /// @param bOther the other of the two circles
    GmCircle(GmCircle const& c1, GmCircle const& c2, double r, bool bCW, bool bOutside1,
             bool bOutside2, bool bOther);
    /// The fillet of radius `r` between the end of `a1` and the start of `a2`: it lies on the side
    /// to which the path turns there, and touches an arc from inside where the path turns with it.
    /// Where the path reverses it turns with `a1` if the end of `a2` lies inside a1's full circle,
    /// else against it. The touching points may lie off the arcs; bOther takes the other of two
    /// candidates. Undefined when an arc is, when `r` is not positive and when no such circle
    /// exists.
    GmCircle(GmArc const& a1, GmArc const& a2, double r, bool bOther);
    /// The fillet of radius `r` between an arc and a segment, chosen as between two arcs.
    /// @param a the arc
    /// @param s the segment; only its supporting line counts
    /// @param r the radius, positive
    /// @param bArcFirst the end of the arc joins the start of the segment, else the end of the
    ///        segment joins the start of the arc
    /// @param bOther the other of two candidates
    GmCircle(GmArc const& a, GmStretch const& s, double r, bool bArcFirst, bool bOther);
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
    /// The tangent through a point of the circle (within m_scdPrec); else undefined.
    ///
    /// Known limit: it is directed clockwise about the centre, on arcs of either sense.
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
    /// Intersects the full circle with the supporting line of a straight curve; the points replace
    /// the solution list. Only touching is judged by the curve itself: a stretch has to reach the
    /// point. A line up to m_scdPrec outside the circle touches it.
    ///
    /// Known limit: a line parallel to the y axis touches only up to about 1e-9 / R outside.
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
    GMKERNEL_NO_EXPORT void Define(GmPoint const& m, GmDir const& axis, double r);

    GmPoint m_M;   ///< centre
    GmDir m_Axis;  ///< axis of the plane
    double m_dR;   ///< radius

private:
    void CreateTangCircle(GmCircle const& c, GmLine const& l, double r, bool bRight, bool bOutside,
                          bool bAfter);
    void CreateTangCircle(GmCircle const& c1, GmCircle const& c2, double r, bool bCW,
                          bool bOutside1, bool bOutside2, bool bOther);
};

#endif  // GMKERNEL_GMCIRCLE_H
