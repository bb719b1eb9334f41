// SPDX-License-Identifier: MIT
/// @file
/// The infinite straight line.
#ifndef GMKERNEL_GMLINE_H
#define GMKERNEL_GMLINE_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmCurve.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/export.h"

class GmCircle;

/// Selects a line built from a line and a point.
enum eLineCustructionTypePL : int {
    ePLParallel = 0,  ///< the parallel through the point
    ePLNormal = 1,    ///< the perpendicular through the point, directed to the right of the line
    ePLCopy = 2       ///< a copy of the line; the point is only tested for being defined
};

/// Selects a line built from two points.
enum eLineCustructionTypePP : int {
    ePPMidNormal = 0,     ///< the perpendicular bisector
    ePPNormalFirst = 1,   ///< the perpendicular to the connection, through the first point
    ePPNormalSecond = 2,  ///< the perpendicular to the connection, through the second point
    ePPThrough = 3        ///< the line through both points
};

/// An infinite straight line: a point and a unit direction, and base of beams and stretches.
///
/// The sense of the direction matters for sides: "right" is the side to which the direction points
/// after a quarter-turn clockwise, and positive parallel distances go there. A line counts as
/// parallel to the y axis when its direction is (0, 1, 0) or (0, -1, 0) within 1e-6 per component.
class GMKERNEL_EXPORT GmLine : public GmCurve, public boost::equality_comparable<GmLine> {
public:
    /// An undefined line.
    GmLine();
    /// Copies point, direction, creation flag and solution list; the copy is a line also when the
    /// source is a beam or a stretch.
    GmLine(GmLine const& line);
    /// The line from `p1` towards `p2`; undefined when a point is. Coincident points give a created
    /// line with the zero direction.
    GmLine(GmPoint const& p1, GmPoint const& p2);
    /// The line through `p` with direction `dir`; undefined when `p` is. `dir` is not tested.
    GmLine(GmPoint const& p, GmDir const& dir);
    /// A line made from a line and a point, see eLineCustructionTypePL (any other value copies);
    /// undefined when one of them is.
    GmLine(GmLine const& line, GmPoint const& p, eLineCustructionTypePL type);
    /// A line made from two points, see eLineCustructionTypePP (any other value goes through both);
    /// undefined when a point is or when the points are equal.
    GmLine(GmPoint const& p1, GmPoint const& p2, eLineCustructionTypePP type);
    /// The parallel at the signed distance `d` (length units), positive to the right; undefined
    /// when `line` is.
    GmLine(GmLine const& line, double d);
    /// The bisector of two lines: through their crossing along the sum of both unit directions, so
    /// that reversing one line gives the other, perpendicular bisector. Of parallel lines it is the
    /// middle parallel with the direction of `a`. Undefined when a line is.
    GmLine(GmLine const& a, GmLine const& b);
    /// The tangent from `p` to a circle: starts at the touching point and points away from `p`,
    /// with the circle on its right if bRight is set, else on its left. The touching points are the
    /// crossings of the circle with the circle whose diameter joins `p` and the centre. For a point
    /// of the circle it is the tangent there. Undefined for a point inside the circle, and when
    /// point or circle is.
    GmLine(GmPoint const& p, GmCircle const& c, bool bRight);
    /// The common tangent from `c1` to `c2` with each circle on the side its flag asks for: right
    /// if set, else left. It starts at its touching point on `c2`; equal flags give a direct
    /// tangent, different ones a crossing tangent.
    ///
    /// With D the distance of the centres, the radius to the touching points makes the angle
    /// 90 degrees - asin((R1 - R2) / D) with the line of centres, R1 + R2 for a crossing tangent.
    /// Undefined when there is none (one circle inside the other; a crossing tangent of circles
    /// that overlap), for equal concentric circles, and when a circle is undefined.
    GmLine(GmCircle const& c1, bool bRight1, GmCircle const& c2, bool bRight2);
    ~GmLine() override;
    /// Copies point, direction, creation flag and solution list, and keeps the own type tag;
    /// nothing when assigned to itself.
    GmLine& operator=(GmLine const& line);

    /// A new line; the caller owns it.
    GmLine* Clone() const override;
    /// The degenerate rectangle on the start point.
    GmRect BoundingRect() const override;

protected:
    /// Clears flag, start point and direction; the solution list does not change.
    void Undefine() override;

public:
    /// Reverses the direction; the start point stays.
    void Invert() override;
    /// Is the point strictly nearer than `eps` to its nearest point NP()?
    bool Element(GmPoint const& p, double eps) const override;
    /// Membership within m_scdPrec; shared unchanged by beams and stretches.
    bool Element(GmPoint const& p) const override;
    /// The distance from the supporting line in the x-y plane (z is ignored), by the slope form
    /// |y - kx - d| / sqrt(k^2 + 1).
    double Dist(GmPoint const& p) const override;
    /// The distance from the start point.
    double DistSP(GmPoint const& p) const override;
    using GmCurve::MinDist;
    /// The projection of the point onto the supporting line, SP + t Dir with t = (p - SP) . Dir;
    /// the flag is ignored.
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// The start point.
    GmPoint SP() const override;
    /// The nearest point of the curve, on beams and stretches within their bounds.
    GmPoint NP(GmPoint const& p) const override;
    /// A copy of the supporting line, whatever the point.
    GmLine Tangent(GmPoint const& p) const override;
    /// A new line at the signed distance `d`, positive to the right; the caller owns it.
    GmCurve* GetParallel(double d) const override;
    /// Moves the start point.
    void Translation(GmVec const& v) override;
    /// Known limit: leaves the line unchanged.
    void Transform(GmMatrix const& m) override;
    /// The empty string.
    std::string GetTraceString() const override;

    /// The unit direction.
    GmDir const& Dir() const;
    /// The slope y/x of the direction; 0 when the line is parallel to the y axis.
    double k() const;
    /// The y intercept at x = 0; the x position of a line parallel to the y axis.
    double d() const;
    /// The direction turned a quarter-turn clockwise: it points to the right.
    GmDir Normal() const;
    /// The distance of a parallel line (in either sense); 0 for lines that cross.
    double Dist(GmLine const& line) const;
    /// The side of a point seen along the direction: 0 within m_scdPrec of the curve, -1 left,
    /// +1 right.
    int PointPos(GmPoint const& p) const;
    /// Intersects the supporting lines, the bounds of beams and stretches ignored. The point
    /// replaces this line's solution list; its z comes from this line's start point, or from
    /// `line`'s where only that one is parallel to the y axis.
    /// @return 0 (parallel or coincident lines) or 1
    int IntersectionWithLine(GmLine const& line) const;
    /// The line with the opposite direction.
    GmLine Inverted() const;
    /// The same supporting line, in either sense.
    bool operator==(GmLine const& line) const;

protected:
    /// Sets point and direction and marks the line as created.
    GMKERNEL_NO_EXPORT void Define(GmPoint const& p, GmDir const& dir);

    GmPoint m_SP;  ///< a point of the line; the start of beams and stretches
    GmDir m_Dir;   ///< unit direction
};

#endif  // GMKERNEL_GMLINE_H
