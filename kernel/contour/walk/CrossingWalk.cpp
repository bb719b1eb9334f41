// SPDX-License-Identifier: MIT
/// @file
/// Walks along curves that change over at every crossing.
///
/// Where two curves meet, a boundary of what they enclose together goes over from one to the other.
/// A walk therefore takes each piece of a curve up to the nearest crossing ahead and goes on along
/// the other curve. Each crossing is used once, so that different walks cannot share a piece; the
/// walk ends where it began. Rounding can lose a crossing: then a walk may never come back, and is
/// given up by the number of its steps. Which loop is wanted is for the caller to judge.
/// Cost: the number of crossings for each step.
#include "kernel/contour/walk/CrossingWalk.h"

#include <cmath>
#include <utility>

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

}  // namespace

void Crossings::AddBothWays(GmCurve const& a, int ia, GmCurve const& b, int ib, GmPoint const& p) {
    if (!(p == a.SP()) && !(p == b.EP())) Add(ia, ib, p);
    if (!(p == b.SP()) && !(p == a.EP())) Add(ib, ia, p);
}

void Crossings::Add(int from, int to, GmPoint const& p) {
    m_owned.push_back(std::make_unique<GmContIntPoint>(GmContIntPoint{from, to, p}));
    m_array.SetAtGrow(m_array.GetSize(), m_owned.back().get());
}

int nextCrossing(GmPoint const& p, GmCurve const& curve, int index,
                 CrossingArray const& crossings) {
    const Ahead ahead(curve, p);
    if (!ahead.isMeasurable()) return -1;
    double nearest = ahead(curve.EP());
    if (nearest < kAheadPrec) return -1;
    int found = -1;
    for (int i = 0; i < crossings.GetSize(); ++i) {
        GmContIntPoint const& crossing = *crossings[i];
        if (crossing.bUsed || crossing.nFrom != index || crossing.Point == p) continue;
        const double dist = ahead(crossing.Point);
        if (dist <= -kAheadPrec) continue;
        if (dist < nearest || std::fabs(dist - nearest) < kAheadPrec) {
            nearest = dist;
            found = i;
        }
    }
    return found;
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
        found = nextCrossing(piece->SP(), *piece, index, crossings.Array());
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
