// SPDX-License-Identifier: MIT
/// @file
/// The circular arc.
#ifndef GMKERNEL_GMARC_H
#define GMKERNEL_GMARC_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmCircle.h"
#include "gmkernel/export.h"

/// A circular arc in the x-y plane, one of the two kinds of contour elements.
///
/// A circle with start point, end point, their direction angles seen from the centre and a sense of
/// rotation; the arc runs from start to end in that sense. Coincident ends (within m_scdPrecCalc)
/// make a full circle; for Element() ends that are equal within m_scdPrec do so already. `double`
/// angles are in radians unless the name ends in Deg. In() and Out() answer false.
class GMKERNEL_EXPORT GmArc : public GmCircle, public boost::equality_comparable<GmArc> {
public:
    /// An undefined arc.
    GmArc();
    /// Copies every field.
    GmArc(GmArc const& arc);
    /// The arc on a circle between two points. Undefined when one of the three is; not created (but
    /// with the circle's fields) when a point lies off the circle by more than m_scdPrec.
    GmArc(GmCircle const& circle, GmPoint const& sp, GmPoint const& ep, eRotDir rot);
    /// The arc on a circle between two points in the sense of the shorter (bShort) or longer way
    /// round. Undefined when one of the three is, or when the distances of the points from the
    /// centre differ by more than 2 m_scdPrec; they are not tested against the radius.
    GmArc(GmCircle const& circle, GmPoint const& sp, GmPoint const& ep, bool bShort);
    /// The arc on a circle between two polar angles (radians); undefined when the circle is.
    GmArc(GmCircle const& circle, double sAng, double eAng, eRotDir rot);
    /// The arc about `m` between two polar angles (radians); undefined when `m` is or when the
    /// radius falls below m_scdPrec.
    GmArc(GmPoint const& m, double r, double sAng, double eAng, eRotDir rot);
    /// The arc from `sp` to `ep` about a centre near `m`: where the two distances from `m` differ,
    /// the centre moves to the point of the perpendicular bisector on the same side that keeps the
    /// radius |m sp| (|m ep| where the chord is longer than the diameter). Undefined when a point
    /// is.
    GmArc(GmPoint const& sp, GmPoint const& ep, GmPoint const& m, eRotDir rot);
    /// The arc from `p1` through `p2` to `p3`; undefined when a point is, when two are equal or
    /// when all are collinear.
    GmArc(GmPoint const& p1, GmPoint const& p2, GmPoint const& p3);
    /// The arc of radius |r| from `sp` to `ep` in the given sense with a sweep of at most 180
    /// degrees (bShort) or more; undefined when a point is, when the points are equal or when no
    /// such arc exists.
    GmArc(GmPoint const& sp, GmPoint const& ep, double r, bool bShort, eRotDir rot);
    /// The parallel arc at the signed distance `d`, positive to the right of the direction of
    /// travel, with the same centre and angles; not created, with radius 0, when the new radius
    /// falls below m_scdPrec or `arc` is undefined.
    GmArc(GmArc const& arc, double d);
    ~GmArc() override;
    /// Copies circle part, points, angles, sense and creation flag.
    GmArc& operator=(GmArc const& arc);

    /// A new arc; the caller owns it.
    GmArc* Clone() const override;
    /// The box over the arc; an arc without sense answers the box of its ends.
    GmRect BoundingRect() const override;

protected:
    /// Clears flag, circle, points, angles and sense.
    void Undefine() override;

public:
    /// Ends this arc, and starts `next`, at their crossing; with two crossings at the one farther
    /// from this arc's start (a tie takes the first). True without change when they meet already.
    /// @throw std::runtime_error for a `next` that cannot be intersected with an arc, and when the
    /// tag of
    ///        either is that of another class
    bool Trim(GmCurve* next) override;
    /// A new connection from this end to the start of `next`, owned by the caller. Mode 0: a
    /// stretch. Mode 1: the arc that leaves this one tangentially, under the conditions of
    /// GmStretch::Concat; else a stretch. Null for any other mode, and for mode 1 where `next` is
    /// neither a stretch nor an arc.
    GmCurve* Concat(GmCurve const& next, int mode) override;
    /// Moves this end and the start of `next` (although it is passed as constant) to the crossing
    /// of the supporting circle with the supporting line of a stretch (the crossing nearer to this
    /// end) or with the supporting circle of an arc (the one at the smaller angle from this end).
    /// Without a crossing true only for an arc that already starts at this end.
    bool Concat(GmCurve const& next) override;
    /// Swaps the ends and reverses the sense.
    void Invert() override;
    /// Is the point one of the ends, or in the sweep and strictly within `eps` of the circle?
    bool Element(GmPoint const& p, double eps) const override;
    /// Membership within 0.01.
    bool Element(GmPoint const& p) const override;
    /// The length along the arc from the start to the direction of the point; 0 for the start.
    double DistSP(GmPoint const& p) const override;
    using GmCircle::MinDist;
    /// The point of the arc in the direction of `p` from the centre; else the start point if
    /// preferred, else the nearer end (a tie goes to the end point). The centre answers the start
    /// point. Replaces the solution list.
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// Always false.
    bool In(GmPoint const& p) override;
    /// Always false.
    bool Out(GmPoint const& p) override;
    /// Moves the start and its angle; centre and radius stay, the point is not projected.
    void SetSP(GmPoint const& p) override;
    /// Moves the end and its angle; centre and radius stay, the point is not projected.
    void SetEP(GmPoint const& p) override;
    /// The start point.
    GmPoint SP() const override;
    /// The end point.
    GmPoint EP() const override;
    /// The direction of travel at the start.
    GmDir TangSP() const override;
    /// The direction of travel at the end.
    GmDir TangEP() const override;
    /// Radius times sweep, 2 pi r for a full circle.
    double Length() const override;
    /// A new parallel arc, possibly undefined; the caller owns it.
    GmCurve* GetParallel(double d) const override;
    /// Moves centre and ends.
    void Translation(GmVec const& v) override;
    /// Transforms ends and centre and rebuilds the arc from them; a mirroring transform reverses
    /// the sense. Shapes other than circles cannot result: a non-uniform scale keeps the ends. The
    /// result is created also where this arc is undefined.
    void Transform(GmMatrix const& m) override;
    /// "circ2 (x, y) - (x, y) mp (x, y)" with five decimals: start, end, centre; "circ3" for every
    /// arc that is not clockwise.
    std::string GetTraceString() const override;
    /// The box over the arc; `true` leaves the case of a full circle out, which then answers the
    /// box of its end point.
    virtual GmRect BoundingRect(bool bIgnoreFullCircle) const;

    /// The sense of rotation.
    eRotDir Dir() const;
    /// The polar angle of the start, in radians.
    double SAng() const;
    /// The polar angle of the end, in radians.
    double EAng() const;
    /// The polar angle of the start, in degrees.
    double SAngDeg() const;
    /// The polar angle of the end, in degrees.
    double EAngDeg() const;
    /// The swept angle in radians, in [0, 2 pi); 0 for a full circle.
    double Ang() const;
    /// The swept angle in radians, 2 pi for a full circle.
    double Ang2Pi() const;
    /// Do the ends coincide in the x-y plane (within m_scdPrecCalc)?
    bool IsFullCircle() const;
    /// The point at the fraction i/n of the sweep; on a full circle always the start.
    ///
    /// Known limit: an end within 1e-4 of an axis through the centre counts at the angle of the
    /// axis, here and in HP().
    GmPoint SectionPoint(int i, int n) const;
    /// The point halfway along the arc.
    GmPoint HP() const;
    /// The direction of travel at HP().
    GmDir TangHP() const;
    /// The arc from end to start in the opposite sense; not created when a point lies off the
    /// circle.
    GmArc Inverted() const;
    /// The same object, or equal circle, points, angles and sense.
    bool operator==(GmArc const& arc) const;

protected:
    /// The sense of the cyclic order a0, a1, a2; eRotNone where angles coincide.
    eRotDir Rotation(GmAngle const& a0, GmAngle const& a1, GmAngle const& a2) const;

private:
    GmPoint SP_Ang() const;
    GmPoint EP_Ang() const;
    GMKERNEL_NO_EXPORT bool AreDefined(GmPoint const& sp, GmPoint const& ep);
    GMKERNEL_NO_EXPORT void SetEnds(GmPoint const& sp, GmPoint const& ep);
    GMKERNEL_NO_EXPORT void SetAngles(double sAng, double eAng, eRotDir rot);
    GMKERNEL_NO_EXPORT GmDir TangentAt(GmDir const& radial) const;

    GmPoint m_SP;
    GmPoint m_EP;
    GmAngle m_SAng;
    GmAngle m_EAng;
    eRotDir m_eDir;
};

#endif  // GMKERNEL_GMARC_H
