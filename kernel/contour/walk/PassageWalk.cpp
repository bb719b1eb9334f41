#include "kernel/contour/walk/PassageWalk.h"

#include <cmath>
#include <utility>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace gmkernel_detail {

namespace {

constexpr double kAheadPrec = 1e-4;

/// How far `q` lies ahead of `p` on a segment (length units) or an arc (degrees).
double aheadOn(GmCurve const& curve, GmPoint const& p, GmPoint const& q) {
    if (curve.IsArc()) {
        auto const& arc = static_cast<GmArc const&>(curve);
        return p.AngDist(q, arc.M(), arc.Dir());
    }
    return p.DirDist(q, static_cast<GmStretch const&>(curve).Dir());
}

}  // namespace

void Passages::AddCrossing(GmCurve const& a, int ia, GmCurve const& b, int ib, GmPoint const& p) {
    if (!(p == a.SP()) && !(p == b.EP())) Add(ia, ib, p);
    if (!(p == b.SP()) && !(p == a.EP())) Add(ib, ia, p);
}

void Passages::Add(int from, int to, GmPoint const& p) {
    m_owned.push_back(std::make_unique<GmContIntPoint>(GmContIntPoint{from, to, p}));
    m_array.SetAtGrow(m_array.GetSize(), m_owned.back().get());
}

int nextPassage(GmPoint const& p, GmCurve const& curve, int index, PassageArray const& passages) {
    if (!curve.IsStretch() && !curve.IsArc()) return -1;
    double nearest = aheadOn(curve, p, curve.EP());
    if (nearest < kAheadPrec) return -1;
    int found = -1;
    for (int i = 0; i < passages.GetSize(); ++i) {
        GmContIntPoint const& passage = *passages[i];
        if (passage.bUsed || passage.nFrom != index || passage.Point == p) continue;
        const double ahead = aheadOn(curve, p, passage.Point);
        if (ahead <= -kAheadPrec) continue;
        if (ahead < nearest || std::fabs(ahead - nearest) < kAheadPrec) {
            nearest = ahead;
            found = i;
        }
    }
    return found;
}

bool walkLoop(Passages& passages, int start, WalkTrack const& track) {
    const long long stepLimit = static_cast<long long>(track.curveCount) * passages.Count();
    int index = passages[start].nTo;
    GmPoint at = passages[start].Point;
    int found = start;
    long long steps = 0;
    int stepsWithoutPassage = 0;
    do {
        const std::unique_ptr<GmCurve> piece(track.curveAt(index).Clone());
        if (found >= 0) piece->SetSP(at);
        found = nextPassage(piece->SP(), *piece, index, passages.Array());
        if (found < 0) {
            at = piece->EP();
            index = track.following(index);
        } else {
            passages[found].bUsed = true;
            at = passages[found].Point;
            piece->SetEP(at);
            index = passages[found].nTo;
        }
        track.append(*piece);
        stepsWithoutPassage = found < 0 ? stepsWithoutPassage + 1 : 0;
        if (++steps > stepLimit || stepsWithoutPassage > track.curveCount + 1) return false;
    } while (found != start);
    return true;
}

}  // namespace gmkernel_detail
