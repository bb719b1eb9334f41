// SPDX-License-Identifier: MIT
/// @file
/// Melting two closed contours: the loops that their boundaries form together.
///
/// The elements of both contours are numbered in one row, this contour's first. Where
/// two of them cross there are up to two crossings, one from each boundary onto the other. A walk
/// follows one boundary to the next crossing, changes over, and so on until it is back where it
/// started. As every crossing is used once, the walks together give every loop once.
///
/// What overlaps instead of crossing gives no crossings: contours that touch along a side may yield
/// one loop, parts or none.
///
/// Elements that lie apart are passed over by boxes in levels, made for each call. Cost: elements
/// times the logarithm of their number where few boxes overlap, then that of the walks.
#include <memory>

#include "gmkernel/GmContour.h"
#include "kernel/contour/GmContourArray.h"
#include "kernel/contour/walk/CrossingWalk.h"
#include "kernel/contour/walk/LoopContour.h"
#include "kernel/curves/BoxLevels.h"
#include "kernel/curves/CurveBox.h"
#include "kernel/curves/VerifiedCast.h"

namespace {

using namespace gmkernel_detail;

constexpr int kNotClosed = -1;
constexpr int kDidNotComeBack = -2;

bool isClosedChain(GmContour const& contour) {
    if (!contour.IsClosed()) return false;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        if (!isSegmentOrArc(*contour.GetElement(i))) return false;
    }
    return true;
}

BoxLevels reachesOf(GmContour const& contour) {
    BoxLevels reaches;
    for (int i = 0; i < contour.ElementCount(); ++i)
        reaches.append(reachOf(*contour.GetElement(i)));
    return reaches;
}

void addCrossingsBetween(Crossings& crossings, GmContour const& a, GmContour const& b) {
    const int countA = static_cast<int>(a.ElementCount());
    const BoxLevels reachesB = reachesOf(b);
    for (int i = 0; i < countA; ++i) {
        GmCurve const& e = *a.GetElement(i);
        reachesB.visitUntil(reachOf(e), 0, [&](std::size_t number) {
            const int j = static_cast<int>(number);
            GmCurve const& f = *b.GetElement(j);
            e.Intersection(&f);
            for (GmPoint const& p : e.GetPtSol())
                crossings.AddBothWays(e, i, f, countA + j, p);
            return false;
        });
    }
}

/// Both boundaries as one row of elements; each goes round by itself.
WalkTrack trackAlong(GmContour const& a, GmContour const& b) {
    const int countA = static_cast<int>(a.ElementCount());
    const int count = countA + static_cast<int>(b.ElementCount());
    WalkTrack track;
    track.curveCount = count;
    track.curveAt = [&a, &b, countA](int index) -> GmCurve const& {
        return index < countA ? *a.GetElement(index) : *b.GetElement(index - countA);
    };
    track.following = [countA, count](int index) {
        if (index == countA - 1) return 0;
        return index == count - 1 ? countA : index + 1;
    };
    return track;
}

Loops loopsBetween(GmContour const& a, GmContour const& b) {
    Crossings crossings;
    addCrossingsBetween(crossings, a, b);
    WalkTrack track = trackAlong(a, b);
    Loops loops;
    for (int i = 0; i < crossings.Count(); ++i) {
        if (crossings[i].bUsed) continue;
        auto loop = std::make_unique<LoopContour>();
        track.append = [&loop](GmCurve& piece) { loop->AddRealElem(&piece); };
        loops.cameBack = walkLoop(crossings, i, track);
        if (!loops.cameBack) break;
        loops.contours.push_back(std::move(loop));
    }
    return loops;
}

}  // namespace

int GmContour::MeltContours(GmContour* other, bool bSameSense) {
    if (!other || !isClosedChain(*this) || !isClosedChain(*other)) return kNotClosed;
    const GmPoint origin(0.0, 0.0, 0.0);
    const eRotDir sense = Dir(origin);
    Loops loops = loopsBetween(*this, *other);
    // Only now, since the other contour may be one of the sub-contours.
    RemoveAllSubConts();
    for (std::unique_ptr<GmContour>& loop : loops.contours) {
        if (!bSameSense || loop->Dir(origin) == sense) m_pSubConts->Take(std::move(loop));
    }
    return loops.cameBack ? m_pSubConts->GetCount() : kDidNotComeBack;
}

int GmContour::SplitContours(GmContour* other) {
    return MeltContours(other, false);
}

int GmContour::FindNextPoint(GmPoint p, GmCurve* curve, int index,
                             KxArray<GmContIntPoint*, GmContIntPoint*> const& crossings) const {
    return curve ? gmkernel_detail::nextCrossing(p, *curve, index, crossings) : -1;
}
