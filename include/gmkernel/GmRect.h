// SPDX-License-Identifier: MIT
#ifndef GMKERNEL_GMRECT_H
#define GMKERNEL_GMRECT_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmCurve.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/export.h"

class GmLine;
class GmMatrix;

/// The nine reference points of a rectangle, clockwise from the top.
enum eGmRefPoint : int {
    eRefCenter = 0,
    eRefTop = 1,
    eRefTopRight = 2,
    eRefRight = 3,
    eRefBottomRight = 4,
    eRefBottom = 5,
    eRefBottomLeft = 6,
    eRefLeft = 7,
    eRefTopLeft = 8
};

/// An axis-parallel rectangle in the x-y plane, y pointing up: the bounding box of every class.
///
/// As a curve it is its boundary, with mostly trivial operations. Constructors order the corners;
/// the edge setters, Stretch, Include and Move do not, so that they can leave a rectangle with
/// crossed corners. Free operators: `!=`, `>`, `<=`, `>=`.
class GMKERNEL_EXPORT GmRect : public GmCurve, public boost::totally_ordered<GmRect> {
public:
    /// Undefined, with both corners undefined.
    GmRect();
    /// From two opposite corners in any order, z dropped. Undefined when one of them is.
    GmRect(GmPoint const& a, GmPoint const& b);
    GmRect(double x1, double y1, double x2, double y2);
    /// From a corner and the way to the opposite one; w and h may be negative.
    GmRect(GmPoint const& p, double w, double h);
    /// The rectangle r grown by d on every side, shrunk for negative d. A d below minus half the
    /// width or height moves edges past each other; the corners are then ordered anew. Undefined
    /// when r is.
    GmRect(GmRect const& r, double d);
    /// Copies creation flag, solution list and corners.
    GmRect(GmRect const& r);
    ~GmRect() override;

    GmRect* Clone() const override;
    /// A copy of the rectangle.
    GmRect BoundingRect() const override;

protected:
    /// Also makes both corners undefined; the solution list stays.
    void Undefine() override;

public:
    /// True when p lies on the boundary: first against the vertical edges, within the distance t
    /// of their lines and exactly between their ends; only for a p away from both lines against
    /// the horizontal edges in the same way.
    bool Element(GmPoint const& p, double t) const override;
    /// The same within m_scdPrec.
    bool Element(GmPoint const& p) const override;
    /// Always 0.
    double Dist(GmPoint const& p) const override;
    using GmCurve::MinDist;
    /// An undefined point: a rectangle has no nearest points.
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// Strictly inside and strictly outside; a point on the boundary is neither.
    bool In(GmPoint const& p) override;
    bool Out(GmPoint const& p) override;
    /// An undefined point.
    GmPoint NP(GmPoint const& p) const override;
    /// An undefined line.
    GmLine Tangent(GmPoint const& p) const override;
    /// A new rectangle grown by d on every side; the caller owns it.
    GmCurve* GetParallel(double d) const override;
    /// Moves both corners by v.
    void Translation(GmVec const& v) override;
    /// Does nothing: the image of a rectangle need not be axis-parallel.
    void Transform(GmMatrix const& m) override;
    /// An empty string.
    std::string GetTraceString() const override;

    /// Copies type tag, corners and creation flag, not the solution list.
    GmRect& operator=(GmRect const& r);
    /// True for the very same object, or for corners equal within m_scdPrec in each coordinate.
    /// Flags and solution lists are ignored.
    bool operator==(GmRect const& r) const;
    /// True when both the width and the height are strictly less, without tolerance.
    bool operator<(GmRect const& r) const;

    /// The coordinates of the edges. Setting one does not order the corners anew.
    double Left() const;
    double Right() const;
    double Top() const;
    double Bottom() const;
    void Left(double x);
    void Right(double x);
    void Top(double y);
    void Bottom(double y);
    /// The top-left and the bottom-right corner; the references live as long as the rectangle.
    GmPoint& LTPoint();
    GmPoint& RBPoint();
    GmPoint LTPoint() const;
    GmPoint RBPoint() const;

    /// Extents in length units, never negative.
    double Width() const;
    double Height() const;
    /// The smaller and the larger of width and height.
    double MinDim() const;
    double MaxDim() const;
    /// The distance of the two corners.
    double Diagonal() const;
    /// The point halfway between the corners, with the flag of the top-left one.
    GmPoint Center() const;
    /// The points of the least and of the largest coordinates, z = 0; right for crossed corners
    /// too.
    GmPoint PMin() const;
    GmPoint PMax() const;

    /// The intersection. Rectangles that touch, or miss each other by less than 1e-6, give a
    /// degenerate or tiny rectangle; undefined when they are further apart or one is undefined.
    GmRect And(GmRect const& r) const;
    /// The smallest rectangle around both. An undefined operand yields a copy of the other.
    GmRect Or(GmRect const& r) const;
    /// Grows the rectangle to contain p. An undefined rectangle becomes the degenerate one on p,
    /// with its z; an undefined p changes nothing.
    void Include(GmPoint const& p);

    /// Scales about a point by the factor f: each corner c becomes p + (c - p) * f.
    void Stretch(GmPoint const& p, double f);
    /// Stretch by 1 / f, without a test for 0.
    void Shrink(GmPoint const& p, double f);
    /// Scales about a reference point of the rectangle; any other value of ref does nothing.
    void Stretch(eGmRefPoint ref, double f);
    void Shrink(eGmRefPoint ref, double f);
    /// Scales the x or the y extent only; the edge on which the reference point lies stays, both
    /// move when it lies on neither. Any other value of ref does nothing.
    void StretchX(eGmRefPoint ref, double f);
    void StretchY(eGmRefPoint ref, double f);
    /// The same as Translation.
    void Move(GmVec const& v);

private:
    void Init(GmPoint const& a, GmPoint const& b);

    GmPoint m_ptLT;
    GmPoint m_ptRB;
};

#endif  // GMKERNEL_GMRECT_H
