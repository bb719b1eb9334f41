// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/contour/offset/OffsetElement.h"
#include "kernel/contour/offset/QuickDistance.h"
#include "kernel/curves/CurveBox.h"
#include "kernel/curves/PlainCurve.h"
#include "kernel/curves/QuickSweep.h"

namespace gmkernel_detail {

/// A piece of a band's boundary in plain numbers, with what is asked of it again and again: its
/// box, its halving point, the directions of its sweep. Parts made by splitting are copies with an
/// end moved. The curve of a result is made from it at last.
class Piece {
public:
    /// @param curve the piece of the boundary
    /// @param source index of the source element whose band it belongs to
    /// @param id identifier of that element
    /// @param role what the piece is in the boundary
    Piece(PlainCurve const& curve, int source, int id, PieceRole role);

    PlainCurve const& curve() const { return m_curve; }
    int source() const { return m_source; }
    int id() const { return m_id; }
    PieceRole role() const { return m_role; }
    /// Was the end moved since the band was made?
    bool startMoved() const { return m_startMoved; }
    bool endMoved() const { return m_endMoved; }

    /// Pieces whose boxes are apart cannot cross.
    CurveBox const& reach() const { return m_reach; }
    /// The z coordinate of the halving point, for pieces of one height; else not a number.
    double height() const { return heightOf(m_curve); }
    /// Does a point of the supporting line or circle lie on the piece?
    bool holds(Vec3 const& p) const;

    /// The point that stands for the piece when its distance from the source is judged.
    Vec3 halving() const { return halvingPointOf(m_curve); }
    /// The same, quicker; computed when it is first asked for, as most pieces are split again
    /// before.
    QuickPoint const& quickHalving();

    /// Moving ends leaves the box and the halving points as they are, until measure() is called.
    void moveStart(Vec3 const& p);
    void moveEnd(Vec3 const& p);
    void measure();

    /// At its last test the piece was far enough from every element then in the span. A split takes
    /// this back, since the parts are judged by other points.
    bool clearOfSpan = false;

private:
    PlainCurve m_curve;
    QuickSweep m_sweep;  ///< of an arc
    CurveBox m_reach{};
    QuickPoint m_quickHalving{};
    int m_source;
    int m_id;
    PieceRole m_role;
    bool m_startMoved = false;
    bool m_endMoved = false;
    bool m_quickHalvingKnown = false;
};

/// The points that lie on both pieces, in the order of `Intersection`.
Hits<2> crossings(Piece const& a, Piece const& b);

}  // namespace gmkernel_detail
