// SPDX-License-Identifier: MIT
/// @file
/// Walks along curves that change over at every crossing.
///
/// Where two curves meet, a boundary of what they enclose together goes over from one to the other.
/// A walk therefore takes each piece of a curve up to the nearest crossing ahead and goes on along
/// the other curve. Each crossing is used once, so that different walks cannot share a piece; the
/// walk ends where it began. Rounding can lose a crossing: then a walk may never come back, and is
/// given up by the number of its steps. Which loop is wanted is for the caller to judge.
///
/// Crossings are linked by the curve that they leave, so a step looks at those of its own curve
/// only, the used ones among them. Cost: for each step the number of crossings that leave its
/// curve, which is quadratic in the crossings where one curve has most of them.
#include "kernel/contour/walk/CrossingWalk.h"

#include <cmath>
#include <memory>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// Distances along a curve that differ by less count as equal: length units on segments, degrees on
/// arcs.
constexpr double kAheadPrec = 1e-4;

/// How far points lie ahead of `p` on a segment (length units) or an arc (degrees).
class Ahead {
public:
    Ahead(GmCurve const& curve, GmPoint const& p)
        : m_from(p), m_segment(curveAs<GmStretch>(curve)), m_arc(curveAs<GmArc>(curve)) {}

    /// Is the curve a segment or an arc?
    bool isMeasurable() const { return m_segment != nullptr || m_arc != nullptr; }
    double operator()(GmPoint const& q) const {
        if (m_arc != nullptr) return m_from.AngDist(q, m_arc->M(), m_arc->Dir());
        return m_from.DirDist(q, m_segment->Dir());
    }

private:
    GmPoint const& m_from;
    GmStretch const* m_segment;
    GmArc const* m_arc;
};

/// The nearest of the crossings that are offered one after another, up to the end of the curve.
class NearestAhead {
public:
    NearestAhead(GmCurve const& curve, GmPoint const& p)
        : m_from(p),
          m_ahead(curve, p),
          m_nearest(m_ahead.isMeasurable() ? m_ahead(curve.EP()) : 0.0) {}

    /// Is there any way from the point to the end of the curve?
    bool hasWay() const { return m_nearest >= kAheadPrec; }
    void offer(int number, GmContIntPoint const& crossing) {
        if (crossing.bUsed || crossing.Point == m_from) return;
        const double dist = m_ahead(crossing.Point);
        if (dist <= -kAheadPrec) return;
        if (dist < m_nearest || std::fabs(dist - m_nearest) < kAheadPrec) {
            m_nearest = dist;
            m_found = number;
        }
    }
    /// The number of the nearest one, -1 when there is none.
    int found() const { return m_found; }

private:
    GmPoint const& m_from;
    Ahead m_ahead;
    double m_nearest;
    int m_found = -1;
};

}  // namespace

void Crossings::AddBothWays(GmCurve const& a, int ia, GmCurve const& b, int ib, GmPoint const& p) {
    if (!(p == a.SP()) && !(p == b.EP())) Add(ia, ib, p);
    if (!(p == b.SP()) && !(p == a.EP())) Add(ib, ia, p);
}

void Crossings::Add(int from, int to, GmPoint const& p) {
    const int number = Count();
    m_entries.push_back({{from, to, p}});
    const std::size_t curve = static_cast<std::size_t>(from);
    if (curve >= m_rows.size()) m_rows.resize(curve + 1);
    Row& row = m_rows[curve];
    (row.first == kNone ? row.first : entry(row.last).next) = number;
    row.last = number;
}

int nextCrossing(GmPoint const& p, GmCurve const& curve, int index, Crossings const& crossings) {
    NearestAhead nearest(curve, p);
    if (!nearest.hasWay()) return -1;
    crossings.VisitFrom(index, [&](int number, GmContIntPoint const& crossing) {
        nearest.offer(number, crossing);
    });
    return nearest.found();
}

int nextCrossing(GmPoint const& p, GmCurve const& curve, int index,
                 CrossingArray const& crossings) {
    NearestAhead nearest(curve, p);
    if (!nearest.hasWay()) return -1;
    for (int i = 0; i < crossings.GetSize(); ++i) {
        if (crossings[i]->nFrom == index) nearest.offer(i, *crossings[i]);
    }
    return nearest.found();
}

bool walkLoop(Crossings& crossings, int start, WalkTrack const& track) {
    const long long stepLimit = static_cast<long long>(track.curveCount) * crossings.Count();
    int index = crossings[start].nTo;
    GmPoint at = crossings[start].Point;
    int found = start;
    long long steps = 0;
    int stepsWithoutCrossing = 0;
    do {
        const std::unique_ptr<GmCurve> piece(track.curveAt(index).Clone());
        if (found >= 0) piece->SetSP(at);
        found = nextCrossing(piece->SP(), *piece, index, crossings);
        if (found < 0) {
            at = piece->EP();
            index = track.following(index);
        } else {
            crossings[found].bUsed = true;
            at = crossings[found].Point;
            piece->SetEP(at);
            index = crossings[found].nTo;
        }
        track.append(*piece);
        stepsWithoutCrossing = found < 0 ? stepsWithoutCrossing + 1 : 0;
        if (++steps > stepLimit || stepsWithoutCrossing > track.curveCount + 1) return false;
    } while (found != start);
    return true;
}

}  // namespace gmkernel_detail
