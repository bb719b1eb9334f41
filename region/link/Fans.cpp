// SPDX-License-Identifier: MIT
/// @file
/// Runs about nodes.
///
/// The order round a node is that of directions, by a measure that grows with the angle and needs a
/// division only. Where two directions nearly agree they say nothing, since nodes have moved
/// elements by up to the tolerance; there the far end of the shorter piece decides, or its middle,
/// by the side of the longer one: the end lies farther off than the tolerance, or it would be a
/// node of the longer.
#include "region/link/Fans.h"

#include <algorithm>
#include <cmath>

#include "region/plane/Carrier.h"
#include "region/plane/ElementWinding.h"

namespace gmregion {

namespace {

/// Directions that differ by less are not told apart by themselves.
constexpr double kNearlySame = 1e-5;

Element turned(const Element& e) {
    return {e.ep, e.sp, -e.bulge};
}

/// 0..4 for the directions of a full turn counter-clockwise.
double placeOfDirection(Vec2 d) {
    const double sum = std::fabs(d.x) + std::fabs(d.y);
    const double along = d.x / sum;
    if (d.y >= 0.0) return 1.0 - along;
    return 3.0 + along;
}

/// Counts places from one that is not nearly that of any of them.
void beginInGap(std::vector<double>& places) {
    constexpr int kAttempts = 32;
    double begin = 0.37;
    for (int attempt = 0; attempt < kAttempts; ++attempt) {
        const auto isNear = [&](double place) { return std::fabs(place - begin) <= kNearlySame; };
        if (std::none_of(places.begin(), places.end(), isNear)) break;
        begin += 0.0917;
    }
    for (double& place : places)
        place = place < begin ? place + 4.0 - begin : place - begin;
}

/// The direction of travel at the start, not of length 1.
Vec2 startDirection(const Element& e) {
    const Vec2 chord = e.ep - e.sp;
    const double b = e.bulge;
    return ((1.0 - b) * (1.0 + b)) * chord + (2.0 * b) * rightNormal(chord);
}

/// On which side of an element another one from the same point lies that is not longer: by its
/// middle or its end, whichever is farther aside.
double sideOfShorter(const Element& longer, const Element& shorter) {
    const Carrier carrier = carrierOf(longer);
    const double byEnd = sideOf(carrier, shorter.ep).value;
    const double byMiddle = sideOf(carrier, middleOf(shorter)).value;
    return std::fabs(byEnd) > std::fabs(byMiddle) ? byEnd : byMiddle;
}

/// Whether the one of two elements from the same point, in nearly the same direction, is left of
/// the other.
bool isLeft(const Element& a, const Element& b) {
    const Vec2 chordA = a.ep - a.sp;
    const Vec2 chordB = b.ep - b.sp;
    if (a.ep == b.ep) return a.bulge < b.bulge;
    if (dot(chordA, chordA) <= dot(chordB, chordB)) return sideOfShorter(b, a) > 0.0;
    return sideOfShorter(a, b) < 0.0;
}

}  // namespace

void Fans::build(const Arrangement& arrangement) {
    m_arrangement = &arrangement;
    const auto& runs = arrangement.runs();
    m_runs.resize(runs.size());
    for (Index run = 0; run < runs.size(); ++run)
        m_runs[run] = {runs[run].weight, run, kNone, false};
    count();
    for (Index node = 0; node < nodeCount(); ++node)
        mergeAt(node);
}

/// Counts the halves into their nodes.
void Fans::count() {
    const auto& runs = m_arrangement->runs();
    m_first.assign(m_arrangement->nodes().size() + 2, 0);
    for (const Run& run : runs) {
        if (run.from == kNone) continue;
        ++m_first[run.from + 2];
        ++m_first[run.to + 2];
    }
    for (std::size_t i = 2; i < m_first.size(); ++i)
        m_first[i] += m_first[i - 1];
    m_halves.resize(m_first.back());
    for (Index run = 0; run < runs.size(); ++run) {
        if (runs[run].from == kNone) continue;
        m_halves[m_first[runs[run].from + 1]++] = leaving(run, false);
        m_halves[m_first[runs[run].to + 1]++] = leaving(run, true);
    }
    m_last.assign(m_first.begin() + 1, m_first.end());
}

Index Fans::fromNode(Half half) const {
    const Run& run = m_arrangement->runs()[runOf(half)];
    return leavesEnd(half) ? run.to : run.from;
}

Index Fans::toNode(Half half) const {
    return fromNode(half ^ 1u);
}

Element Fans::firstPiece(Half half) const {
    const Run& run = m_arrangement->runs()[runOf(half)];
    const auto& pieces = m_arrangement->pieces();
    return leavesEnd(half) ? turned(pieces[run.last - 1]) : Element(pieces[run.first]);
}

bool Fans::isSingle(Half half) const {
    const Run& run = m_arrangement->runs()[runOf(half)];
    return run.last - run.first == 1;
}

/// Above the chord, positive on its left.
double Fans::height(Half half) const {
    const Element e = firstPiece(half);
    const Vec2 chord = e.ep - e.sp;
    return -0.5 * e.bulge * std::sqrt(dot(chord, chord));
}

/// Makes the same runs between a node and those of higher numbers one.
void Fans::mergeAt(Index node) {
    m_same.clear();
    for (const Half half : at(node)) {
        if (isSingle(half) && toNode(half) > node) m_same.push_back(half);
    }
    if (m_same.size() < 2) return;
    if (m_same.size() == 2 && toNode(m_same[0]) != toNode(m_same[1])) return;
    std::sort(m_same.begin(), m_same.end(), [&](Half a, Half b) {
        const Index toA = toNode(a);
        const Index toB = toNode(b);
        if (toA != toB) return toA < toB;
        const double heightA = height(a);
        const double heightB = height(b);
        return heightA < heightB || (heightA == heightB && a < b);
    });
    const double tolerance = m_arrangement->tolerance();
    Half standIn = m_same.front();
    bool any = false;
    for (std::size_t i = 1; i < m_same.size(); ++i) {
        const bool same = toNode(m_same[i]) == toNode(standIn) &&
                          height(m_same[i]) - height(standIn) <= tolerance;
        if (!same) {
            standIn = m_same[i];
            continue;
        }
        absorb(standIn, m_same[i]);
        any = true;
    }
    if (!any) return;
    removeAbsorbed(node);
    for (std::size_t i = 0; i < m_same.size(); ++i) {
        if (i == 0 || toNode(m_same[i]) != toNode(m_same[i - 1])) removeAbsorbed(toNode(m_same[i]));
    }
}

/// Takes runs that another one stands for out of the fan of a node.
void Fans::removeAbsorbed(Index node) {
    const Fan fan = at(node);
    Half* const end =
        std::remove_if(fan.first, fan.last, [&](Half half) { return !stands(runOf(half)); });
    m_last[node] -= static_cast<Index>(fan.last - end);
}

void Fans::absorb(Half by, Half half) {
    State& standIn = m_runs[runOf(by)];
    State& run = m_runs[runOf(half)];
    const bool sameSense = leavesEnd(by) == leavesEnd(half);
    standIn.weight = sameSense ? standIn.weight + run.weight : standIn.weight - run.weight;
    standIn.twoWay = standIn.twoWay || !sameSense;
    run.standIn = runOf(by);
    run.nextSame = standIn.nextSame;
    standIn.nextSame = runOf(half);
}

void Fans::sort(Index node) {
    const Fan fan = at(node);
    m_places.clear();
    for (const Half half : fan)
        m_places.push_back(placeOfDirection(startDirection(firstPiece(half))));
    beginInGap(m_places);
    // By insertion: where directions nearly agree the order may be no strict order.
    for (std::size_t i = 1; i < fan.size(); ++i) {
        const Half half = fan.first[i];
        const double place = m_places[i];
        std::size_t to = i;
        for (; to > 0 && isBefore(half, fan.first[to - 1], place, m_places[to - 1]); --to) {
            fan.first[to] = fan.first[to - 1];
            m_places[to] = m_places[to - 1];
        }
        fan.first[to] = half;
        m_places[to] = place;
    }
}

/// Whether one half comes before another, counter-clockwise from the direction of x.
bool Fans::isBefore(Half a, Half b, double placeOfA, double placeOfB) const {
    const double apart = std::fabs(placeOfA - placeOfB);
    if (apart > kNearlySame) return placeOfA < placeOfB;
    return isLeft(firstPiece(b), firstPiece(a));
}

}  // namespace gmregion
