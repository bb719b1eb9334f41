// SPDX-License-Identifier: MIT
/// @file
/// The helical piece over an arc.
#ifndef GMKERNEL_GMHELIX_H
#define GMKERNEL_GMHELIX_H

#include <string>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmCurve.h"
#include "gmkernel/export.h"

/// A helical piece: its projection onto the x-y plane is an arc, and its height rises linearly with
/// the swept angle from a start to an end height.
///
/// At the swept angle a from the start, in the arc's sense, the height is
/// start + (end - start) a / Ang2Pi(). A helix is created when its arc is. It takes part in no
/// intersection (GmCurve::Intersection() throws), and what is not listed here keeps the defaults of
/// GmCurve.
///
/// Known limits: the arc of a helix built from an arc keeps that arc's own z coordinates, while
/// Element() and MinDist() project points to z = 0, so they expect an arc at z = 0.
class GMKERNEL_EXPORT GmHelix : public GmCurve {
public:
    /// The piece from `sp` to `ep` about the vertical axis through `m`; its heights are those of
    /// the two points. The arc is built at z = 0 by GmArc(sp, ep, m, rot). Whether the points are
    /// defined is not tested.
    GmHelix(GmPoint const& sp, GmPoint const& ep, GmPoint const& m, eRotDir rot);
    /// The piece over an arc, with the z of its start and end for heights.
    GmHelix(GmArc const& arc);
    /// Copies every field.
    GmHelix(GmHelix const& helix);
    /// The piece over the parallel arc at the signed distance `d`, positive to the right of the
    /// direction of travel, with the same heights; undefined when that arc is.
    GmHelix(GmHelix const& helix, double d);
    ~GmHelix() override;
    /// Copies creation flag, solution list, arc and heights.
    GmHelix& operator=(GmHelix const& helix);

    /// A new helix; the caller owns it.
    GmHelix* Clone() const override;
    /// Not provided: an undefined rectangle.
    GmRect BoundingRect() const override;
    /// GmArc::Trim() of the projection; the heights stay. The start of `next` moves to the end of
    /// the arc, at the arc's z.
    bool Trim(GmCurve* next) override;
    /// Is the point's projection on the arc (within 0.01) and its height strictly within m_scdPrec
    /// of the height there?
    bool Element(GmPoint const& p) const override;
    /// Not provided: always false.
    bool Element(GmPoint const& p, double eps) const override;
    /// Not provided: always 0.
    double Dist(GmPoint const& p) const override;
    using GmCurve::MinDist;
    /// The point over the arc's point nearest to the projection of `p`; p's own height counts only
    /// where that is the start of the arc: then the nearer one of EP() and SP() answers (a tie goes
    /// to the end point), SP() if preferred.
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// The start point at the start height.
    GmPoint SP() const override;
    /// The end point at the end height.
    GmPoint EP() const override;
    /// The horizontal tangent at the start; the slope is not included.
    GmDir TangSP() const override;
    /// The horizontal tangent at the end; the slope is not included.
    GmDir TangEP() const override;
    /// Not provided: an undefined point.
    GmPoint NP(GmPoint const& p) const override;
    /// Not provided: an undefined line.
    GmLine Tangent(GmPoint const& p) const override;
    /// sqrt((r sweep)^2 + rise^2), in length units.
    double Length() const override;
    /// A new helix over the parallel arc, possibly undefined; the caller owns it.
    GmCurve* GetParallel(double d) const override;
    /// Has no effect: a helix does not move.
    void Translation(GmVec const& v) override;
    /// Transforms the arc, which is created by that. The heights stay, so what a matrix does along
    /// z does not reach them.
    void Transform(GmMatrix const& m) override;
    /// "helix2 (x, y) - (x, y) mp (x, y)" with five decimals: start, end, centre; "helix3" for
    /// every helix that is not clockwise.
    std::string GetTraceString() const override;

    /// The centre of the arc.
    GmPoint M() const;
    /// The radius of the arc.
    double R() const;
    /// The sense of rotation seen from above.
    eRotDir Dir() const;
    /// The projection, owned by the helix.
    GmArc const& GetArc() const;
    /// Has no effect: a helix keeps its arc.
    void SetArc(GmArc& arc);

private:
    /// The swept angle in radians from the start of the arc to a point beside it.
    GMKERNEL_NO_EXPORT double SweepTo(GmPoint const& p) const;
    GMKERNEL_NO_EXPORT double HeightAt(double sweep) const;

    GmArc m_Arc;
    double m_dStartHeight;
    double m_dEndHeight;
};

#endif  // GMKERNEL_GMHELIX_H
