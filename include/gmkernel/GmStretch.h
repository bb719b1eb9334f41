// SPDX-License-Identifier: MIT
/// @file
/// The straight segment.
#ifndef GMKERNEL_GMSTRETCH_H
#define GMKERNEL_GMSTRETCH_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmLine.h"
#include "gmkernel/export.h"

/// A straight segment from a start to an end point, one of the two kinds of contour elements.
///
/// The direction points from start to end while the two differ; when SetSP() or SetEP() makes them
/// meet, it keeps its last value.
class GMKERNEL_EXPORT GmStretch : public GmLine, public boost::equality_comparable<GmStretch> {
public:
    /// An undefined stretch.
    GmStretch();
    /// Copies line part and end point.
    GmStretch(GmStretch const& stretch);
    /// The segment from `p1` to `p2`; undefined when a point is. Coincident points give a created
    /// stretch with the zero direction.
    GmStretch(GmPoint const& p1, GmPoint const& p2);
    /// The segment of length `len` from `p` along `dir`; undefined when one of them is. A negative
    /// length puts the end behind the start, the direction stays `dir`.
    GmStretch(GmPoint const& p, GmDir const& dir, double len);
    /// The parallel segment at the signed distance `d`, positive to the right; undefined when
    /// `stretch` is.
    GmStretch(GmStretch const& stretch, double d);
    ~GmStretch() override;
    /// Copies line part and end point.
    GmStretch& operator=(GmStretch const& stretch);

    /// A new stretch; the caller owns it.
    GmStretch* Clone() const override;
    /// The box over both end points.
    GmRect BoundingRect() const override;

protected:
    /// Clears flag, both points and the direction.
    void Undefine() override;

public:
    /// Ends this segment, and starts `next`, at their crossing; with two crossings at the one
    /// farther from this segment's start (a tie takes the first). True without change when they
    /// meet already.
    /// @throw std::runtime_error for a `next` that cannot be intersected with a segment, and when
    /// the tag
    ///        of either is that of another class
    bool Trim(GmCurve* next) override;
    /// A new connection from this end to the start of `next`, owned by the caller. Mode 0: a
    /// stretch, undefined where `next` has no start. Mode 1: the arc that leaves this segment
    /// tangentially, about the crossing of the normals at both ends, provided that their distances
    /// from it agree within m_scdPrec and 5 %; the half circle about the midpoint where both
    /// normals coincide; else a stretch. Null for any other mode, and for mode 1 where `next` is
    /// neither a stretch nor an arc.
    GmCurve* Concat(GmCurve const& next, int mode) override;
    /// Extends or shortens this segment to the supporting line of a stretch or the supporting
    /// circle of an arc and moves the start of `next` there (although it is passed as constant).
    /// Of two points on a circle the one at the smaller angle from this end, seen from the centre.
    bool Concat(GmCurve const& next) override;
    /// Swaps the ends and reverses the direction.
    void Invert() override;
    using GmLine::Element;
    /// Does the foot of the point lie on the segment (ends within m_scdPrec) and strictly nearer
    /// than `eps`?
    bool Element(GmPoint const& p, double eps) const override;
    using GmLine::Dist;
    /// The distance from the segment.
    double Dist(GmPoint const& p) const override;
    using GmLine::MinDist;
    /// The foot of the point where it lies on the segment; else the start point if preferred, else
    /// the nearer end (a tie goes to the end point).
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// Moves the start; the direction follows unless the ends meet.
    void SetSP(GmPoint const& p) override;
    /// Moves the end; the direction follows unless the ends meet.
    void SetEP(GmPoint const& p) override;
    /// The end point.
    GmPoint EP() const override;
    /// The direction, the same at both ends.
    GmDir TangSP() const override;
    /// The direction, the same at both ends.
    GmDir TangEP() const override;
    /// The distance of the end points.
    double Length() const override;
    /// A new stretch at the signed distance `d`, positive to the right; the caller owns it.
    GmCurve* GetParallel(double d) const override;
    /// Moves both ends.
    void Translation(GmVec const& v) override;
    /// Transforms both ends and recomputes the direction.
    void Transform(GmMatrix const& m) override;
    /// "line (x, y) - (x, y)" with five decimals: start, end.
    std::string GetTraceString() const override;

    /// The midpoint.
    GmPoint HP() const;
    /// The direction.
    GmDir TangHP() const;
    /// The segment from end to start.
    GmStretch Inverted() const;
    /// Equal starts and equal ends; a segment does not equal its inverse.
    bool operator==(GmStretch const& stretch) const;

private:
    GMKERNEL_NO_EXPORT void FollowEnds();

    GmPoint m_EP;
};

#endif  // GMKERNEL_GMSTRETCH_H
