// SPDX-License-Identifier: MIT
/// @file
/// Parallel contours with different distances in x and y.
///
/// Every element moves by a vector that the quadrant of its direction chooses. Neighbours are
/// trimmed or bridged; where the resulting chain crosses itself, walks from crossing to crossing
/// take it apart into loops, of which those with the sense of the source are kept. A loop is not
/// tested for its distance from the source. Elements that lie apart are passed over by boxes in
/// levels, made for each call. Cost: elements times the logarithm of their number where few boxes
/// overlap, then that of the walks.
#include "gmkernel/GmContour.h"

#include <memory>

#include "kernel/contour/GmContourArray.h"
#include "kernel/contour/variable_offset/ShiftedElements.h"
#include "kernel/contour/walk/CrossingWalk.h"
#include "kernel/contour/walk/LoopContour.h"
#include "kernel/curves/BoxLevels.h"
#include "kernel/curves/CurveBox.h"

namespace {

using namespace gmkernel_detail;

constexpr int kDidNotComeBack = -2;

/// Is the crossing only the joint of two curves that follow each other in the chain?
bool isJoint(GmPoint const& p, CurveList const& curves, int i, int k, bool closed) {
    if (k - i <= 1 && p == curves[i].EP()) return true;
    return closed && i == 0 && k == curves.Count() - 1 && p == curves[i].SP();
}

void addCrossings(Crossings& crossings, CurveList const& curves, int i, int k, bool closed) {
    GmCurve const& first = curves[i];
    GmCurve const& second = curves[k];
    first.Intersection(&second);
    for (GmPoint const& p : first.GetPtSol()) {
        if (!isJoint(p, curves, i, k, closed)) crossings.AddBothWays(first, i, second, k, p);
    }
}

void addCrossingsAmong(Crossings& crossings, CurveList const& curves, bool closed) {
    BoxLevels reaches;
    for (int i = 0; i < curves.Count(); ++i)
        reaches.append(reachOf(curves[i]));
    for (std::size_t i = 0; i < reaches.size(); ++i) {
        reaches.visitUntil(reaches[i], i + 1, [&](std::size_t k) {
            addCrossings(crossings, curves, static_cast<int>(i), static_cast<int>(k), closed);
            return false;
        });
    }
}

/// Where the pieces of a walk along an open chain go: behind the others up to the end of the chain,
/// then, in order, in front of them.
class InsertPosition {
public:
    void AtEndOfOpenChain() { m_next = -1; }
    bool InFront() const { return m_next >= 0; }
    int Index() const { return m_next; }
    void Advance() {
        if (m_next > kNotReached) ++m_next;
    }

private:
    static constexpr int kNotReached = -2;
    int m_next = kNotReached;
};

Loops wholeChain(CurveList const& curves) {
    Loops loops;
    loops.contours.push_back(std::make_unique<GmContour>());
    for (int i = 0; i < curves.Count(); ++i)
        loops.contours.front()->AddElement(curves[i], false, 0);
    return loops;
}

/// One loop, from the crossing `start` on; null when it is no continuous chain or, with `cameBack`
/// false, when the walk was given up.
std::unique_ptr<GmContour> loopFrom(Crossings& crossings, int start, CurveList const& curves,
                                    bool closed, bool& cameBack) {
    auto loop = std::make_unique<LoopContour>();
    InsertPosition position;
    WalkTrack track;
    track.curveCount = curves.Count();
    track.curveAt = [&](int index) -> GmCurve const& { return curves[index]; };
    track.following = [&](int index) {
        if (index + 1 < curves.Count()) return index + 1;
        if (!closed) position.AtEndOfOpenChain();
        return 0;
    };
    track.append = [&](GmCurve& piece) {
        if (position.InFront())
            loop->InsertElem(position.Index(), &piece, false, 0);
        else
            loop->AddRealElem(&piece);
        position.Advance();
    };
    cameBack = walkLoop(crossings, start, track);
    const bool continuous = !position.InFront() || loop->CheckContour();
    return cameBack && continuous ? std::move(loop) : nullptr;
}

Loops loopsOf(CurveList const& curves, Crossings& crossings, bool closed) {
    Loops loops;
    for (int i = 0; i < crossings.Count() && loops.cameBack; ++i) {
        if (crossings[i].bUsed) continue;
        std::unique_ptr<GmContour> loop = loopFrom(crossings, i, curves, closed, loops.cameBack);
        if (loop) loops.contours.push_back(std::move(loop));
    }
    return loops;
}

}  // namespace

int GmContour::VarParallelContours(GmVec const& v) {
    SplitArcsQuadrant();
    if (v.Length() < m_scdPrec) {
        CopyContourToSubContour();
        return m_pSubConts->GetCount();
    }
    CurveList curves;
    shiftElements(*this, v, curves);
    closeGaps(curves, m_bClosed);
    removeCollapsed(curves);
    Crossings crossings;
    addCrossingsAmong(crossings, curves, m_bClosed);
    Loops loops =
        crossings.Count() <= 1 ? wholeChain(curves) : loopsOf(curves, crossings, m_bClosed);

    RemoveAllSubConts();
    const GmPoint origin(0.0, 0.0, 0.0);
    const eRotDir sense = Dir(origin);
    for (std::unique_ptr<GmContour>& loop : loops.contours) {
        if (loop->Dir(origin) == sense) m_pSubConts->Take(std::move(loop));
    }
    return loops.cameBack ? m_pSubConts->GetCount() : kDidNotComeBack;
}
