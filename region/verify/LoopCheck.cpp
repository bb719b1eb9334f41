// SPDX-License-Identifier: MIT
/// @file
/// What every set must hold.
///
/// Loops may touch in points. So a crossing counts only when points of the one element on both
/// sides of it lie to different sides of the other by more than the tolerance, and two elements run
/// along each other only when two points of the shorter one lie on the longer one.
#include "region/verify/LoopCheck.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "region/plane/Apart.h"
#include "region/plane/Crossing.h"
#include "region/plane/ElementHalves.h"
#include "region/plane/ElementWinding.h"
#include "region/plane/Measures.h"
#include "region/plane/Nearest.h"

namespace gmregion {

namespace {

double squared(Vec2 v) {
    return dot(v, v);
}

/// The middle of the part between two points of a piece.
Vec2 between(const BoundaryPiece& e, Vec2 a, Vec2 b) {
    return middleOf({a, b, e.bulge == 0.0 ? 0.0 : bulgeBetween(e.carrier, a, b)});
}

bool isOn(const BoundaryPiece& e, Vec2 p, double within) {
    return isWithin(e.carrier, p, within) &&
           squared(nearestOn(e, e.carrier, p) - p) <= within * within;
}

/// Whether the shorter piece runs along the longer one. Sides of a wedge whose ends are two nodes
/// do not: at three quarters of their length they are farther apart than half the tolerance.
bool runAlong(const BoundaryPiece& a, const BoundaryPiece& b, double within) {
    const bool aIsShorter = squared(a.ep - a.sp) < squared(b.ep - b.sp);
    const BoundaryPiece& shorter = aIsShorter ? a : b;
    const BoundaryPiece& longer = aIsShorter ? b : a;
    if (squared(shorter.ep - shorter.sp) < 64.0 * within * within) return false;
    const Vec2 m = middleOf(shorter);
    const auto isBeside = [&](Vec2 p) { return isOn(longer, p, 0.5 * within); };
    return isBeside(between(shorter, shorter.sp, m)) && isBeside(between(shorter, m, shorter.ep)) &&
           isBeside(m);
}

/// Whether a piece passes from one side of another to the other at a point of both.
bool passes(const BoundaryPiece& a, const BoundaryPiece& b, Vec2 p, double within) {
    const double before = signedDistance(b.carrier, between(a, a.sp, p));
    const double behind = signedDistance(b.carrier, between(a, p, a.ep));
    return std::min(std::fabs(before), std::fabs(behind)) > within &&
           (before > 0.0) != (behind > 0.0);
}

bool isNear(Vec2 a, Vec2 b, double within) {
    return squared(a - b) <= within * within;
}

void checkPair(const BoundaryPiece& a, const BoundaryPiece& b, double tolerance,
               FaultList& faults) {
    const auto isEnd = [&](Vec2 p) {
        const double within = 4.0 * tolerance;
        return isNear(p, a.sp, within) || isNear(p, a.ep, within) || isNear(p, b.sp, within) ||
               isNear(p, b.ep, within);
    };
    const bool follows = a.ep == b.sp || b.ep == a.sp;
    if (follows && a.bulge == 0.0 && b.bulge == 0.0 && dot(a.ep - a.sp, b.ep - b.sp) >= 0.0) return;
    for (const Vec2 p : crossings(a.carrier, b.carrier)) {
        if (!spans(a, p) || !spans(b, p)) continue;
        if (isEnd(p) || !passes(a, b, p, tolerance)) continue;
        faults.add(FaultKind::kCrossing, p, 0.0, a.element);
        return;
    }
    // Two that follow each other smoothly lie beside each other, but not along.
    if (follows && dot(a.carrier.normal, b.carrier.normal) > 0.0) return;
    if (runAlong(a, b, tolerance)) faults.add(FaultKind::kCrossing, middleOf(a), 0.0, a.element);
}

void checkEnds(const LoopsView& view, double tolerance, FaultList& faults) {
    const std::vector<Element>& elements = *view.elements;
    Index first = 0;
    for (const Index last : *view.loopEnds) {
        for (Index i = first; i < last; ++i) {
            const Element& before = elements[i == first ? last - 1 : i - 1];
            const Element& e = elements[i];
            if (before.ep != e.sp)
                faults.add(FaultKind::kOpenLoop, e.sp, std::sqrt(squared(e.sp - before.ep)), i);
            const double size = lengthAlong(e);
            if (!(size >= tolerance)) faults.add(FaultKind::kShort, e.sp, tolerance - size, i);
        }
        first = last;
    }
}

/// Whether the other loops run round an element of a loop as often as they must: at its middle, or,
/// since another loop may touch it right there, at the middles of both its halves.
bool nestsAt(const Element& e, Index loop, int wanted, const BoundaryIndex& index) {
    const auto fits = [&](Vec2 p) {
        int covered = 0;
        index.visitWindings(p, [&](Index other, int winding) {
            if (other != loop) covered += winding;
        });
        return covered == wanted;
    };
    if (fits(middleOf(e))) return true;
    const std::array<Element, 2> halves = halvesOf(e);
    return fits(middleOf(halves[0])) && fits(middleOf(halves[1]));
}

/// An outline must stand in nothing that is covered by other loops, a hole in what is covered.
void checkNesting(const LoopsView& view, const BoundaryIndex& index, FaultList& faults) {
    Index first = 0;
    for (Index loop = 0; loop < view.loopEnds->size(); ++loop) {
        const Index last = (*view.loopEnds)[loop];
        if (first == last) continue;
        Index longest = first;
        double twice = 0.0;
        for (Index i = first; i < last; ++i) {
            const Element& e = (*view.elements)[i];
            const Element& best = (*view.elements)[longest];
            twice += sweptTwice(e, (*view.elements)[first].sp);
            if (squared(e.ep - e.sp) > squared(best.ep - best.sp)) longest = i;
        }
        const Element& e = (*view.elements)[longest];
        if (!nestsAt(e, loop, twice > 0.0 ? 0 : 1, index)) {
            faults.add(FaultKind::kNesting, middleOf(e), 0.0, longest);
        }
        first = last;
    }
}

}  // namespace

bool checkNumbers(const LoopsView& view, FaultList& faults) {
    const auto isFinite = [](const Element& e) {
        // A sum is finite only when all parts are; sets hold nothing near the largest numbers.
        return std::isfinite(e.sp.x + e.sp.y + e.ep.x + e.ep.y + e.bulge);
    };
    const auto found = std::find_if_not(view.elements->begin(), view.elements->end(), isFinite);
    if (found == view.elements->end()) return true;
    faults.add(FaultKind::kUndefined, {}, 0.0,
               static_cast<std::size_t>(found - view.elements->begin()));
    return false;
}

void checkLoops(const LoopsView& view, const BoundaryIndex& index, double tolerance,
                FaultList& faults) {
    checkEnds(view, tolerance, faults);
    index.boxes().visitPairs([&](std::size_t i, std::size_t j) {
        const BoundaryPiece& a = index.pieces()[i];
        const BoundaryPiece& b = index.pieces()[j];
        const Box& aboutA = index.boxes()[i];
        if (!areApart(a.carrier, aboutA, b.carrier, index.boxes()[j], tolerance))
            checkPair(a, b, tolerance, faults);
        return true;
    });
    checkNesting(view, index, faults);
}

}  // namespace gmregion
