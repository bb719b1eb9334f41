// SPDX-License-Identifier: MIT
/// @file
/// The contour: a chain of segments and arcs.
#ifndef GMKERNEL_GMCONTOUR_H
#define GMKERNEL_GMCONTOUR_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmContElement.h"
#include "gmkernel/GmCurve.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/KxArray.h"
#include "gmkernel/export.h"

class GmArc;
class GmCircle;
class GmContourArray;
class GmStretch;
struct GmApprDepData;
struct GmContIntPoint;

/// A chain of segments and arcs in which every element starts where the previous one ends.
///
/// Every joint is continuous within m_scdPrec per coordinate; the contour is closed when the last
/// element ends where the first one starts. It is built element by element with AddElement().
/// Elements are meant to be GmStretch and GmArc objects; other curves are appended when they pass
/// the same tests, but only segments and arcs are copied by GetNewElement(), offset or compared.
///
/// A contour answers SP(), EP(), TangSP(), TangEP() and Length() with the defaults of GmCurve (an
/// undefined point or direction, 0), and Trim() and Concat() do nothing: ask the first or the last
/// element.
///
/// Sub-contours are the results that operations such as offsetting leave in the contour. Each such
/// operation replaces the whole list; walk it with GetSubContour(0), GetSubContour(1), ... until it
/// answers null.
///
/// Ownership: the contour owns its elements, their records and its sub-contours. Pointers that it
/// hands out stay owned by it and die with the element or sub-contour; GetNewElement() and Clone()
/// hand out new objects that the caller owns. Element indices run from 0 to ElementCount()-1; an
/// index outside answers null or changes nothing.
///
/// A contour has no move: returning one by value, where the compiler does not elide it, and
/// assigning a temporary clone the elements. Assigning through a reference to GmBase copies
/// creation flag and type tag, through one to GmCurve the solution list as well, and leaves the
/// elements. A contour with the tag of another class is refused by intersections like a pair that
/// cannot be intersected, and distances from it are still those from its elements.
///
/// Elements that cannot be intersected (a helix, a rectangle) make every operation throw that
/// intersects the elements: Intersection(), IntersectionWithCurve(), In() and Out(), SplitAt() with
/// a curve, and AddElement() and Close() with validation. What is thrown is std::runtime_error
/// "Function not found"; the contour then is unchanged, with an empty solution list.
///
/// Unless said otherwise a query costs time linear in the number of elements, and it writes the
/// solution lists of the elements: one contour must not be used from two threads at once.
class GMKERNEL_EXPORT GmContour : public GmCurve,
                                  private boost::equality_comparable<GmContour, GmContour> {
public:
    /// The kinds of transition between two elements, and what their value means (length units).
    enum eTransType : int {
        eTransRadius = 1,         ///< rounding arc, tangent to both elements, of this radius
        eTransChamferDist = 2,    ///< chamfer between the points at this distance from the corner
        eTransChamferLength = 3,  ///< chamfer of this length
    };

    /// An empty open contour without sub-contours, created.
    GmContour();
    /// Copies creation flag, tag and solution list, and clones the elements as if each was appended
    /// without validation: the copies have identifier 0, are not marked as inserted and are
    /// indexed by position; the closed flag is what the appending gives. Sub-contours and the last
    /// insert point are not copied. Of a chain that is broken (by RemoveElement(), or through the
    /// element pointers) the elements that do not join are left out.
    GmContour(GmContour const& source);
    /// An approach to a curve or a departure from it, of segments and arcs with identifier 0; see
    /// GmApprDepData. Undefined when the curve is null or has no such end, when the free point is
    /// undefined, and where the kind of move builds nothing (as when the free point lies inside
    /// the circle of the lead-in arc). Created but empty when the free point is the curve's end.
    GmContour(GmApprDepData const& data);
    /// Deletes the elements and the sub-contours.
    ~GmContour() override;
    /// Makes this contour an independent copy: the elements as in the copy constructor, with
    /// creation flag, solution list, last insert point and closed flag of the source. Earlier
    /// elements and sub-contours are deleted, the type tag stays. Nothing when assigned to itself;
    /// the source may be one of this contour's own sub-contours.
    GmContour& operator=(GmContour const& source);

    /// A new heap copy made by the copy constructor; the caller owns it.
    GmContour* Clone() const override;
    /// The union of the elements' bounding rectangles; undefined without elements.
    GmRect BoundingRect() const override;
    /// Reverses the chain: the elements in reverse order, each running the other way. Records keep
    /// their identifier, index and mark; the closed flag stays. Inverting twice restores the chain.
    void Invert() override;
    /// Does some element contain the point within `eps` (length units)?
    bool Element(GmPoint const& p, double eps) const override;
    /// Element(p, m_scdPrec).
    bool Element(GmPoint const& p) const override;
    /// The smallest distance of an element from the point; 1e30 without elements.
    ///
    /// Known limit: an arc counts with its full circle, so this can fall below the distance that
    /// MinDist() finds.
    double Dist(GmPoint const& p) const override;
    /// The point of the contour nearest to `p`; of equally near elements the first one answers.
    /// Without elements, and when no distance is a finite number, undefined.
    /// @param d receives the distance, the largest double where there is none
    /// @param p the point
    /// @param bPreferSP as for the elements: leaves their end points out of the search
    GmPoint MinDist(double& d, GmPoint const& p, bool bPreferSP) const override;
    /// The point of the contour nearest to the curve `c`, which may be a contour: the nearest of
    /// all pairs of elements, the first of equal ones. Undefined when there is none or `c` is null.
    /// Cost: elements times elements of `c`. Crossings are not looked for.
    /// @param d receives the distance, the largest double where there is none
    /// @param c the other curve
    /// @param bPreferSP not used, end points always take part
    GmPoint MinDist(double& d, GmCurve const* c, bool bPreferSP) const override;
    /// Not provided for contours: an undefined point.
    GmPoint MinDist(GmPoint const& p, bool bPreferSP) const override;
    /// True when the point lies strictly inside the closed chain: by an odd number of crossings
    /// with a segment from the point through the middle of the first element and as far beyond it.
    /// False on the contour, outside the bounding rectangle and without elements. Replaces the
    /// solution list.
    ///
    /// Known limit: the parity is right only where the far end of that segment lies outside. For a
    /// convex contour this holds for all points inside it, but not for points outside it that are
    /// within its rectangle and close to the middle of the first element.
    /// @throw std::runtime_error "Function not found" for a point off the contour and within its
    ///        rectangle, when an element cannot be intersected (a helix, a rectangle)
    bool In(GmPoint const& p) override;
    /// True when the point is neither on the contour nor In(), true without elements. Replaces the
    /// solution list.
    /// @throw std::runtime_error as In()
    bool Out(GmPoint const& p) override;
    /// Not provided for contours: an undefined point.
    GmPoint NP(GmPoint const& p) const override;
    /// The tangent line of the last element that contains the point, see LastPointElem(). Undefined
    /// for a point off the contour, and for one that lies more than m_scdPrec off an arc.
    ///
    /// Known limit: it runs along a segment, but clockwise about the centre of every arc.
    GmLine Tangent(GmPoint const& p) const override;
    /// Not provided for contours, null: see Offsetting().
    GmCurve* GetParallel(double d) const override;
    /// Moves every element; sub-contours, solution list and last insert point stay.
    void Translation(GmVec const& v) override;
    /// Transforms every element; sub-contours, solution list and last insert point stay.
    void Transform(GmMatrix const& m) override;
    /// An empty string.
    std::string GetTraceString() const override;

    using GmCurve::Intersection;
    /// Intersects this contour with another one; the points replace this contour's solution list.
    /// Cost: a logarithm for each element where few come near each other, up to elements times
    /// elements. A null contour gives no points.
    /// @param other the other contour, may be this one
    /// @param bAtEnds false: only points that are no end of either element involved count;
    ///        true: points at ends count too, each joint once
    /// @return the number of points
    /// @throw std::runtime_error "Function not found" when two elements cannot be intersected (one
    ///        is a helix or a rectangle); the list is empty then
    virtual int Intersection(GmContour const* other, bool bAtEnds) const;
    /// Intersects this contour with any curve and leaves the points in the solution list, in the
    /// order of the elements; a crossing at a joint is listed once. A null curve gives no points.
    /// @throw std::runtime_error "Function not found" for a curve or an element that cannot be
    ///        intersected (a helix or a rectangle); the list is empty then. Without elements there
    ///        is nothing to throw for.
    void IntersectionWithCurve(GmCurve const* c) const;

    /// True for the same contour, and for chains of equal count whose elements are pairwise of the
    /// same kind and equal by GmStretch's or GmArc's operator==. Closed flag, identifiers,
    /// sub-contours and solution lists are not compared.
    bool operator==(GmContour const& other) const;

    /// Number of elements. Constant cost.
    long ElementCount() const;
    /// The curve of an element, owned by the contour; null for an index outside. Changing its ends
    /// can break the chain.
    GmCurve* GetElement(int index);
    GmCurve const* GetElement(int index) const;
    /// The record of an element, owned by the contour; null for an index outside.
    GmContElement* GetContElement(int index);
    GmContElement const* GetContElement(int index) const;
    /// A new copy of an element that the caller owns; null for an index outside and for an element
    /// that is neither a segment nor an arc.
    GmCurve* GetNewElement(int index) const;
    /// A sub-contour, owned by this contour; null for an index outside.
    GmContour* GetSubContour(int index);
    GmContour const* GetSubContour(int index) const;
    /// The sub-contour whose bounding rectangle encloses those of all others; null when there is
    /// none. Sub-contours without elements are passed over.
    ///
    /// Known limit: null also where a rectangle in the list neither encloses the largest one before
    /// it nor lies inside it, even when a later one encloses both.
    GmContour* GetMaxSubContour();
    /// The sub-contour whose start is nearest to the point, the first of equally near ones; null
    /// without sub-contours. Sub-contours without elements are passed over.
    GmContour* GetNearSubContour(GmPoint const& p);
    /// Does the chain end where it starts? Set by appending, re-evaluated by inserting; removing
    /// elements leaves it as it was.
    bool IsClosed() const;
    /// Not provided: false for every contour.
    bool Convex() const;
    bool Concave() const;
    /// The point at which the contour was last split, undefined when it never was.
    GmPoint GetLastInsertPoint();

    /// Appends a clone of the curve; the caller keeps its own.
    ///
    /// The curve must start at the end of the chain (any curve fits an empty contour). When it
    /// ends at the start of the chain the contour becomes closed; a first element never closes it.
    ///
    /// With validation a closed contour refuses the curve, and the curve may meet the chain only
    /// at its own start and, when it closes the contour, at its end. The validation costs an
    /// intersection with every element and replaces the solution list, also on refusal. The
    /// closed flag outlives removed elements: such a contour still refuses.
    /// @param c the curve; null is refused
    /// @param bValidate with the tests against the whole contour
    /// @param id identifier stored with the element
    /// @return false when the curve is refused and nothing was appended
    /// @throw std::runtime_error "Function not found" with validation, when the curve or an element
    ///        cannot be intersected (a helix, a rectangle); nothing is appended then. A first
    ///        element is not tested.
    bool AddElement(GmCurve const* c, bool bValidate, long id);
    bool AddElement(GmCurve const& c, bool bValidate, long id);
    /// The same with a record from the heap, which is taken over with its curve and keeps its
    /// fields. On false, and when an exception leaves, the caller still owns both.
    bool AddElement(GmContElement* element, bool bValidate);
    /// Deletes an element. The neighbours are not joined and the closed flag stays.
    void RemoveElement(int index);
    /// Deletes the elements marked as inserted from the end of the chain, back to the first one
    /// that is not; element 0 always stays.
    void RemoveInsertedElementsAtBack();
    /// A copy that is inverted; like every copy it has the identifiers 0.
    GmContour Inverted() const;
    /// Appends a segment with identifier 0 from the end of the chain to its start unless they meet
    /// already. Validation may refuse the segment; the contour then stays open. Nothing happens
    /// without elements.
    /// @throw std::runtime_error as AddElement()
    void Close(bool bValidate);

    /// The point of the contour nearest to `p`; among points equally near to it (within 1e-4) one
    /// that is clearly nearer to `q` (by 1e-4 in squared distance). End points of elements are left
    /// out of the search, see GmCurve::MinDist(). Undefined without elements.
    /// @param d receives the distance, -1 without elements
    /// @param p the point
    /// @param q the point that breaks ties
    /// @param bPreferSP not used
    GmPoint MinDist(double& d, GmPoint const& p, GmPoint const& q, bool bPreferSP);
    /// The element start nearest to the point; a later one counts only when nearer by more than
    /// 1e-4. The end of an open chain is no candidate. Undefined without elements.
    GmPoint NearPoint(GmPoint const& p);
    /// The index of the element whose start NearPoint() answers; -1 without elements.
    int NearPointElem(GmPoint const& p);
    /// The index of the element whose start is nearest to `p`, compared in squared distances: of
    /// starts equally near within 1e-4 the last one, except that one nearer to `q` by 1e-4 or more
    /// than the choice so far is passed over. -1 without elements.
    int NearPointElem(GmPoint const& p, GmPoint const& q);
    /// The element end farthest from the point, or the start of the chain; a later one counts only
    /// when farther by more than 1e-4. Undefined without elements.
    GmPoint FarPoint(GmPoint const& p);
    /// The highest index of an element that contains the point with the element's own default
    /// tolerance (0.01 for arcs); -1 for a point off the contour.
    int LastPointElem(GmPoint const& p) const;
    /// The sense of rotation: the sign of the area of the polygon over the joints and some points
    /// of each arc, closed if the chain is open, summed as seen from the point `r`. An area of
    /// exactly 0 is tried once more from the start of the chain; still 0, or no elements, is
    /// eRotNone.
    eRotDir Dir(GmPoint const& r);

    /// Puts a rounding or chamfer into the junction after an element, between the last and the
    /// first one too when the contour is closed. Both neighbours are cut back to its ends; then
    /// every element of the contour shorter than m_scdPrec is removed, also after a failure.
    ///
    /// A chamfer of given length between two segments is exact: both legs are value / |2 sin(a/2)|
    /// with the angle a of the corner. Beside an arc at most 20 halvings of the distance from the
    /// corner look for it, to within 0.005. The new element is marked as inserted.
    ///
    /// Known limits: beside an arc a chamfer of at most 0.005 is never found, nor one whose legs
    /// are longer than the shorter of the two elements' chords (0 for a full circle).
    /// @param type the kind; any other value makes no transition
    /// @param index index of the element that ends at the junction
    /// @param value radius, distance or length. Between segments, and as a distance everywhere, it
    ///        counts by its magnitude; beside an arc a radius or length has to be positive.
    /// @param bIdOfFirst the new element gets the identifier of the element before the junction,
    ///        else that of the one after it
    /// @return was it made, or not needed because the elements continue each other? False, too, for
    ///        an index outside and for values that do not fit the elements.
    bool AddTrans(eTransType type, int index, double value, bool bIdOfFirst);
    /// AddElement() with the curve, the validation flag and the identifier, then AddTrans() between
    /// it and the element before it. False when the curve is refused, when there is no transition
    /// (the curve stays appended) and for the first element.
    /// @throw std::runtime_error as AddElement()
    bool AddElementAndTrans(GmCurve const* c, bool bValidate, long id, eTransType type,
                            double value, bool bIdOfFirst);
    bool AddElementAndTrans(GmCurve const& c, bool bValidate, long id, eTransType type,
                            double value, bool bIdOfFirst);
    /// Rounds the corners between consecutive elements, in a closed contour that between the last
    /// and the first one too. A corner stays sharp where no circle of the radius touches each
    /// element in exactly one point. New arcs are marked as inserted.
    ///
    /// Known limit: identifier and index of a new arc are its position at that time, so an
    /// identifier may occur twice.
    /// @param dRadius the radius in length units; between segments it counts by its magnitude,
    ///        beside an arc it has to be positive
    /// @param nMode for closed contours: below 0 only corners that turn with the contour, above 0
    ///        only those that turn against it, 0 all
    void RoundCorners(double dRadius, int nMode);

    /// Splits the first element that contains the point (with the element's own tolerance, 0.01 for
    /// arcs) into two that meet there. The second one carries the identifier and index of the first
    /// and is marked as inserted. A point that is a joint already splits nothing. The point becomes
    /// the last insert point.
    /// @return does the point lie on the contour? False also for an element that is neither a
    ///         segment nor an arc, which cannot be split.
    bool SplitAt(GmPoint const& p);
    /// Splits at every point in which a curve meets the contour; replaces the solution list. False
    /// when they do not meet.
    /// @throw std::runtime_error "Function not found" when the curve or an element cannot be
    ///        intersected (a helix, a rectangle); nothing is split then
    bool SplitAt(GmCurve* curve);
    /// Splits at the point nearest to `p`; false without elements.
    bool SplitAtMinDist(GmPoint const& p);
    /// Splits at the point nearest to `p`, of equally near ones at the one nearer to `q`; false
    /// without elements.
    bool SplitAtMinDist(GmPoint const& p, GmPoint const& q);
    /// Splits at the point nearest to another contour; false for null and without elements.
    bool SplitAtMinDist(GmContour* other);
    /// Splits both contours where they are nearest to each other; false for null and without
    /// elements.
    bool SplitBothAtMinDist(GmContour* other);

    /// Computes the loops which the boundaries of this and another closed contour form together and
    /// stores them as sub-contours in place of earlier ones: a loop follows one boundary to the
    /// next crossing, changes over to the other one, and so on. For two overlapping contours of the
    /// same sense these are the outline of both and of their common part, running in that sense.
    /// Neither contour changes; all identifiers are 0. Cost: a logarithm for each element where few
    /// come near each other, up to elements times elements, then for each step along the loops the
    /// crossings on its element.
    ///
    /// Known limits: where sides lie flush on each other there are no crossings; only the joints at
    /// their ends count. Contours that touch along a side may yield one loop, parts or none. A
    /// crossing within m_scdPrec of a joint can be lost when the next element misses it by more
    /// than that; a loop may then not come back. Nor does a loop that starts on a full circle:
    /// split the circle first.
    /// @param other the other contour; may be one of the sub-contours
    /// @param bSameSense keeps only loops with the sense of this contour
    /// @return the number of sub-contours, 0 for contours apart from each other; -1, with nothing
    ///         changed, when a contour is not closed, is null or holds other elements than segments
    ///         and arcs; -2 when a loop does not come back to its start: the loops before it stay
    int MeltContours(GmContour* other, bool bSameSense);
    /// MeltContours(other, false): every loop, whatever its sense.
    int SplitContours(GmContour* other);

    /// Computes the contours at the constant distance `d` beside the contour, positive to the
    /// right of the direction of travel, and stores them as sub-contours in place of earlier ones.
    ///
    /// Corners that open away from the offset side are rounded by arcs of radius |d|; what would
    /// come closer than |d| to the contour is cut away, so that one contour may yield several
    /// results or none. A corner carries the identifier of the element that ends there; identifiers
    /// are carried as int, so that one outside -2147483648..2147483647 comes out as another number.
    /// The result of an open contour goes on with the half circle around its end. A distance below
    /// m_scdPrec in magnitude stores a copy, one that is not finite nothing. The elements of this
    /// contour are not changed. Cost: a logarithm for each element, and the pieces near it; the
    /// square of the number of elements where all come near to each other.
    ///
    /// Known limits: results can be lost or stay open beside sides that are tilted from the
    /// vertical by about 1e-6 or less, beside a first element shorter than 0.001, where an arc
    /// nearly vanishes, and beside arcs that leave their chord by 1e-3 or less. What would be
    /// bounded by rounded corners alone is not stored.
    /// @param d the distance in length units
    /// @param nSpan how many of the most recent elements a piece is cut by and tested against
    /// @param bKeepOpen keeps open results of a closed contour that is offset to its inside;
    ///        otherwise such results are dropped and the span counts as unbounded
    /// @return the number of sub-contours
    int Offsetting(double d, int nSpan, bool bKeepOpen);
    /// Offsetting(d, 1000000, false); the bools are not used.
    int ParallelContours(double d, bool, bool, bool);
    /// Offsets element by element and trims neighbours to their crossing, without any test for
    /// distance; elements that vanish are left out, and the joint of last and first element is not
    /// trimmed. The result replaces the sub-contours, also when there is none; it is an empty
    /// contour when every element vanishes.
    /// @return 1, or 0 with no sub-contour when neighbours do not cross or `d` is not finite
    int SimpleOffsetting(double d);
    /// Computes parallel contours with different distances in x and y and stores them as
    /// sub-contours in place of earlier ones. Arcs of this contour are first split where they cross
    /// the axes through their centre, which stays. Every element moves by +-x and +-y, with both
    /// positive to the right of the direction of travel: by (x, -y) for a direction of the first
    /// quadrant, by the whole vector (z included) for the second, then by (-x, y) and (-x, -y);
    /// directions along +y and -x count to the second, along +x and -y to the fourth. Neighbours
    /// that no longer meet are trimmed or bridged by segments, and the chain is taken apart at its
    /// crossings into loops; those with the sense of this contour are kept. A vector shorter than
    /// m_scdPrec gives a copy. Cost: a logarithm for each element where few cross, up to elements
    /// times elements.
    ///
    /// Known limits: nothing is tested for distance, so a loop may come near the contour or be a
    /// second loop beside the one that is wanted, and arcs keep their radius. Directions within
    /// m_scdPrec of an axis follow the sign of their small component. A contour without elements
    /// gives one empty sub-contour.
    /// @param v the distances in x and y, length units
    /// @return the number of sub-contours; -2 when a loop does not come back to its start, the
    ///         loops before it stay
    int VarParallelContours(GmVec const& v);

protected:
    /// Empties the contour: elements, sub-contours, last insert point, closed flag.
    void InitAll();
    /// Deletes all elements; the closed flag stays.
    void RemoveAllElements();
    /// Deletes all sub-contours.
    void RemoveAllSubConts();
    /// The tests of AddElement(). Sets the closed flag when the curve passes and closes the
    /// contour; with validation and elements it replaces the solution list.
    bool AppendElementValid(GmCurve const* c, bool bValidate);
    /// A new record that owns the curve; the caller owns the record.
    static GmContElement* CreateContElement(GmCurve* c, long id, long index, bool bInserted);
    /// Inserts a clone of the curve before the element `index`, marked as inserted, and sets the
    /// closed flag by whether the chain now ends where it starts. The joints at the new element are
    /// not tested. With validation the tests of AppendElementValid() must pass first. False for an
    /// index outside 0..ElementCount() and for null.
    bool InsertElem(int index, GmCurve const* c, bool bValidate, long id);
    /// Appends a clone of the curve without validation unless its ends coincide; false when nothing
    /// was appended. Identifier 0, or the one given.
    bool AddRealElem(GmCurve* c);
    bool AddRealElem(GmCurve* c, long id);
    /// AddTrans() at the corner after the element `index` of two elements of this contour, without
    /// the removal of short elements. The new element gets the identifier `id`.
    bool AddTrans(eTransType type, GmStretch* first, GmStretch* second, int index, double value,
                  long id);
    /// The same for a segment and an arc; bArcFirst says that the arc ends at the corner.
    bool AddTrans(eTransType type, GmStretch* segment, GmArc* arc, int index, double value, long id,
                  bool bArcFirst);
    /// The same for two arcs.
    bool AddTrans(eTransType type, GmArc* first, GmArc* second, int index, double value, long id);
    /// Ends `c1` and starts `c2` on a circle of radius |r| and answers the arc between them in the
    /// given sense. The circle touches one of the curves, on its left for a positive radius, on its
    /// right for a negative one: `c2` at its start when that lies to the right of the end of `c1`
    /// (to the left for a negative radius), else `c1` at its end. The caller owns the arc. Null for
    /// null, and when the circle misses a curve; `c1` may then be cut already.
    GmCurve* GetArc(GmCurve* c1, GmCurve* c2, double r, eRotDir dir);
    /// Splits every arc at the point of its circle in the given direction from the centre and, with
    /// bBoth, at the opposite point. Always true.
    bool SplitArcs(GmDir const& dir, bool bBoth);
    /// Splits every arc where it crosses the axes through its centre. Always true.
    bool SplitArcsQuadrant();
    /// Is the chain continuous and, when the closed flag is set, closed? True without elements.
    bool CheckContour();
    /// The middle point of an element; undefined for an index outside and for an element that is
    /// neither a segment nor an arc.
    GmPoint GetHP(int index);

    KxArray<GmContElement*, GmContElement*>* m_pElements;  ///< the chain; owned with its records
    bool m_bClosed;                                        ///< see IsClosed()
    GmContourArray* m_pSubConts;                           ///< the sub-contours; owned with them
    GmPoint m_LastInsertPoint;                             ///< see GetLastInsertPoint()

private:
    GMKERNEL_NO_EXPORT bool AddTransAt(eTransType type, int index, double value, bool bIdOfFirst);
    GMKERNEL_NO_EXPORT bool AddTransBetween(eTransType type, GmCurve* first, GmCurve* second,
                                            int index, double value, long id);
    GmPoint GetIntersectionPoint(GmCircle const& circle, GmArc const* arc) const;
    /// Splits an element at a point; false for an element that is neither a segment nor an arc.
    GMKERNEL_NO_EXPORT bool SplitElement(int index, GmPoint const& p);
    /// Splits an element at a point of it other than its ends; false where there is no such point.
    GMKERNEL_NO_EXPORT bool SplitInside(int index, GmPoint const& p);
    int FindNextPoint(GmPoint p, GmCurve* curve, int index,
                      KxArray<GmContIntPoint*, GmContIntPoint*> const& crossings) const;
    GmContour* GetSubContour_private(int index) const;
    /// Replaces the sub-contours by one copy of this chain that keeps the identifiers.
    void CopyContourToSubContour();
};

/// Picks where a path along the offsets of a contour starts: at the element with the smallest
/// identifier, of several the one whose start is nearest to the start of the contour moved sideways
/// by the distance. Of an open contour with exactly one open offset only that one is searched, for
/// the first element with the smallest identifier. Identifiers from 2147483647 on count as none.
/// @param c the contour; null or without elements answers false
/// @param count how many of its sub-contours are searched; more than there are stand for all
/// @param d the signed distance of the offsets, positive to the right
/// @param sub, elem receive the indices of sub-contour and element; on false they may hold a part
///        of the answer or -1
/// @return was a start found?
GMKERNEL_EXPORT bool FindTPCCont(GmContour const* c, int count, double d, int& sub, int& elem);

/// Hook for diagnostics of a contour's elements; does nothing.
GMKERNEL_EXPORT void GmTraceContourElements(GmContour const* contour, std::string const& title,
                                            std::string const& text);

#endif  // GMKERNEL_GMCONTOUR_H
