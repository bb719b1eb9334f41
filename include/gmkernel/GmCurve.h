// SPDX-License-Identifier: MIT
/// @file
/// The curve interface, the solution list and two function objects over curves.
#ifndef GMKERNEL_GMCURVE_H
#define GMKERNEL_GMCURVE_H

#include <boost/operators.hpp>
#include <functional>
#include <string>
#include <vector>

#include "gmkernel/GmBase.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/export.h"

class GmLine;
class GmMatrix;

/// Abstract base of every curve: line, beam, stretch, circle, arc, rectangle and contour.
///
/// The interface treats all curves alike; an operation that a kind of curve does not have keeps the
/// harmless default given here. Beside it a curve owns its solution list, the points in which it
/// reports the results of an intersection. The list is written by const operations, so one curve
/// object must not be used from two threads at once; distinct objects are independent.
///
/// Computations are planar in x and y with z carried along. Lengths are in the caller's length
/// unit, `double` angles in radians. Operations do not refuse undefined curves: they compute with
/// whatever the fields hold. A null pointer passed as the other curve stands for a curve without
/// points: no intersections, no nearest point, nothing trimmed.
class GMKERNEL_EXPORT GmCurve : public GmBase, public boost::equality_comparable<GmCurve> {
public:
    /// An undefined curve with an empty solution list.
    GmCurve();
    /// Copies type tag, creation flag and solution list.
    GmCurve(GmCurve const& other);
    /// Releases the solution list.
    ~GmCurve() override;
    /// Copies type tag, creation flag and solution list; nothing when assigned to itself.
    ///
    /// Assigning through a reference to GmCurve therefore gives an object the tag of another class
    /// and leaves its fields. Such an object is not taken for what it is not: where its tag decides
    /// and it is not of the class named there (nor of one derived from it), an intersection is
    /// refused like that of a pair of kinds that cannot be intersected, a distance is that of the
    /// general nearest-point search, and a contour treats it as neither a segment nor an arc.
    GmCurve& operator=(GmCurve const& other);

    /// A new heap copy of the curve in its own class; the caller owns it.
    GmCurve* Clone() const override = 0;
    /// The axis-parallel bounding box; here an undefined rectangle.
    GmRect BoundingRect() const override;

protected:
    /// Clears the creation flag; the solution list does not change.
    void Undefine() override;

public:
    /// Intersects this curve with another one.
    ///
    /// The points replace this curve's solution list; read them with GetSolution(). Points are kept
    /// only where they lie on both bounded curves (within m_scdPrec on beams and stretches, within
    /// 0.01 on arcs). A pair of two kinds and its swapped pair give the same points in the same
    /// order. Two curves of one kind take z from the first one, but straight ones from the second
    /// where it alone is parallel to the y axis; swapping two circles or arcs reverses the order of
    /// their points. Coincident curves have no intersection.
    /// @return the number of points found
    /// @throw std::runtime_error "Function not found" for a pair of kinds that cannot be
    ///        intersected (a helix or a rectangle takes part, also as an element of a contour), and
    ///        for an object that is not of the class its tag names; the list is empty then
    virtual int Intersection(GmCurve const* other) const;
    /// Point `i` of the solution list; the defined point (0, 0, 0) when `i` is out of range.
    virtual GmPoint GetSolution(unsigned int i) const;
    /// The solution list itself, valid until the next operation that fills it.
    virtual std::vector<GmPoint> const& GetPtSol() const;

    /// Cuts this curve's end and the start of `next` back to their crossing.
    /// @return false, with nothing changed, when there is none; here always
    virtual bool Trim(GmCurve* next);
    /// A new curve that connects this curve's end with the start of `next`, owned by the caller:
    /// a stretch for mode 0, an arc leaving tangentially for mode 1; here null.
    virtual GmCurve* Concat(GmCurve const& next, int mode);
    /// Extends or cuts this curve's end and the start of `next` to the crossing of their supporting
    /// lines and circles; moves the start of `next` although it is passed as constant.
    /// @return false, with nothing changed, when there is none; here always
    virtual bool Concat(GmCurve const& next);
    /// Reverses the sense in which the curve is travelled; here nothing.
    virtual void Invert();

    /// Does the point lie on the curve at a distance strictly below `eps` (length units)?
    virtual bool Element(GmPoint const& p, double eps) const = 0;
    /// Membership with the default tolerance: m_scdPrec, but 0.01 for arcs.
    virtual bool Element(GmPoint const& p) const = 0;
    /// The distance of a point from the curve.
    virtual double Dist(GmPoint const& p) const = 0;
    /// The distance of a point from the curve's start, measured as the curve says (arcs: along the
    /// arc); the largest double for curves without a start.
    virtual double DistSP(GmPoint const& p) const;
    /// The point of this curve nearest to `p` among start point, foot point and end point, in this
    /// order; a later one wins only when strictly nearer.
    /// @param d receives the distance; where no candidate is defined, the square root of the
    ///        absolute value that the caller passed in
    /// @param p the point
    /// @param bPreferSP leaves the end point out of the search
    virtual GmPoint MinDist(double& d, GmPoint const& p, bool bPreferSP) const;
    /// The point of this curve nearest to the curve `c`, among end points, their foot points on the
    /// other curve and, for circles and arcs, the points that face the other curve.
    ///
    /// Crossings are not looked for: two curves that cross away from their ends have a positive
    /// result.
    /// @param d receives the distance; see the other overload for the case without candidates.
    ///        Where this curve has a start point and `c` has none, the search starts from the
    ///        largest double, so that the start competes through its foot point on `c` alone.
    /// @param c the other curve; null leaves `d` as it is
    /// @param bPreferSP leaves the end points of both curves out of the search
    virtual GmPoint MinDist(double& d, GmCurve const* c, bool bPreferSP) const;
    /// The point of this curve nearest to `p`; undefined where there is none.
    virtual GmPoint MinDist(GmPoint const& p, bool bPreferSP) const = 0;
    /// Is the point strictly inside a closed curve? Here false.
    virtual bool In(GmPoint const& p);
    /// Is the point strictly outside a closed curve? Here false.
    virtual bool Out(GmPoint const& p);

    /// Moves the start point; here nothing.
    virtual void SetSP(GmPoint const& p);
    /// Moves the end point; here nothing.
    virtual void SetEP(GmPoint const& p);
    /// The start point; undefined for curves without one.
    virtual GmPoint SP() const;
    /// The end point; undefined for curves without one.
    virtual GmPoint EP() const;
    /// The direction of travel at the start point; undefined for curves without one.
    virtual GmDir TangSP() const;
    /// The direction of travel at the end point; undefined for curves without one.
    virtual GmDir TangEP() const;
    /// The point of the curve nearest to `p`; undefined where there is none.
    virtual GmPoint NP(GmPoint const& p) const = 0;
    /// The tangent line at a point of the curve; undefined where there is none.
    virtual GmLine Tangent(GmPoint const& p) const = 0;
    /// The length of the curve; 0 where it has none.
    virtual double Length() const;
    /// A new parallel curve at the signed distance `d`, positive to the right of the direction of
    /// travel; the caller owns it and tests its CreationOK().
    virtual GmCurve* GetParallel(double d) const = 0;

    /// Moves the curve by a vector.
    virtual void Translation(GmVec const& v) = 0;
    /// Transforms the curve; lines, beams, circles and rectangles stay unchanged.
    virtual void Transform(GmMatrix const& m) = 0;
    /// A one-line description for diagnostics.
    virtual std::string GetTraceString() const = 0;

    /// True for the very same object, else when the solution lists have the same length and
    /// pairwise equal points. Nothing else is compared here; derived classes compare their own
    /// fields.
    bool operator==(GmCurve const& other) const;

protected:
    /// Replaces this curve's solution list by a copy of the other's.
    void CopyPtSol(GmCurve const& other) const;
    /// Copies creation flag and solution list and keeps the own type tag.
    GMKERNEL_NO_EXPORT void CopyCurvePart(GmCurve const& other);
    /// Offers the candidate `p` with the reference point `q` to a nearest-point search. Ignored
    /// when `q` is undefined; else it becomes the best point when the squared distance of both is
    /// strictly below `d`, or when there is no defined best point yet.
    void CheckDist(double& d, GmPoint& best, GmPoint const& p, GmPoint const& q) const;

    /// The solution list, mutable state of a constant curve.
    mutable std::vector<GmPoint> m_ptSol;

private:
    void Copy(GmCurve const& other);
};

/// Intersects two objects and stores the points in `result`, which is cleared first. The same as
/// GmCurve::Intersection, but no curve's own solution list is touched unless a contour takes part.
/// @throw std::runtime_error "Function not found" for a pair that cannot be intersected; `result`
///        is empty then
GMKERNEL_EXPORT void Intersection(GmBase const& a, GmBase const& b, std::vector<GmPoint>& result);

/// Orders points by their distance from a curve's start, for sorting points along the curve.
class GMKERNEL_EXPORT less_than_curve {
public:
    /// The curve is not owned and must outlive the function object.
    less_than_curve(GmCurve const* curve);
    /// True when `a` lies strictly nearer to the curve's start than `b` (GmCurve::DistSP()).
    bool operator()(GmPoint const& a, GmPoint const& b) const;

private:
    GmCurve const* m_pCurve;
};

// The standard's base for unary function objects is deprecated since C++11 and left the standard
// with C++17. Where the standard library still has it, it stays the base, without its warning.
#if defined(__GLIBCXX__)
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"
#endif

namespace gmkernel_detail {
#if defined(__GLIBCXX__)
using point_predicate_base = std::unary_function<GmPoint, bool>;
#else
/// Stands in for the removed base, with the same member types.
struct point_predicate_base {
    typedef GmPoint argument_type;
    typedef bool result_type;
};
#endif
}  // namespace gmkernel_detail

/// Asks whether points lie on a curve, with the curve's default tolerance, for filtering points.
class GMKERNEL_EXPORT point_is_element : public gmkernel_detail::point_predicate_base {
public:
    /// The curve is not owned and must outlive the function object.
    point_is_element(GmCurve const* curve);
    /// True when GmCurve::Element() accepts the point.
    bool operator()(GmPoint p) const;

private:
    GmCurve const* m_pCurve;
};

#if defined(__GLIBCXX__)
#pragma GCC diagnostic pop
#endif

#endif  // GMKERNEL_GMCURVE_H
