// SPDX-License-Identifier: MIT
/// @file
/// From strands to nodes and runs.
///
/// The points where elements meet, and the vertices that something comes near, are drawn together
/// to nodes, and every strand becomes the runs between its nodes in the order in which it passes
/// them. A piece of an arc turns as its arc does between the piece's ends.
///
/// Whatever was within the tolerance of an element is a node on it now. So two elements that did
/// not meet were farther apart, and only where one of them was bent by more than half a tolerance
/// may they meet after all. Pieces that were bent so are compared again with all others, in a
/// second round and a third; nodes of the round before stay where they are.
#include "region/nodes/Arrangement.h"

#include <algorithm>
#include <cmath>

#include "region/plane/Carrier.h"

namespace gmregion {

namespace {

constexpr int kRounds = 3;
/// In tolerances: arcs of a longer chord keep their height, however small.
constexpr double kShort = 4.0;

/// The part of an element between two points of it, or of one that was bent a little.
StrandElement part(const StrandElement& e, Vec2 from, Vec2 to) {
    StrandElement piece = e;
    piece.sp = from;
    piece.ep = to;
    if (e.bulge == 0.0 || (from == e.sp && to == e.ep)) return piece;
    piece.bulge = bulgeBetween(carrierOf(e), from, to);
    return piece;
}

/// Short arcs within the tolerance of their chord become segments: next to what nodes have moved,
/// their directions at the ends say nothing, and may turn a corner inside out.
StrandElement flattened(StrandElement e, double tolerance) {
    const Vec2 chord = e.ep - e.sp;
    const double squared = dot(chord, chord);
    const bool isShort = squared <= kShort * kShort * tolerance * tolerance;
    if (isShort && 0.25 * e.bulge * e.bulge * squared <= tolerance * tolerance) e.bulge = 0.0;
    return e;
}

}  // namespace

bool Arrangement::settle(double tolerance, Index split, Care care) {
    m_tolerance = tolerance;
    m_settled.clear();
    if (!m_meetings.find(m_in, tolerance, {split, nullptr, care})) return false;
    cutRound(true);
    for (int round = 1;; ++round) {
        const bool any = std::find(m_moved.begin(), m_moved.end(), 1) != m_moved.end();
        if (!any) return true;
        if (!m_meetings.find(m_in, tolerance, {kNone, &m_moved, care})) return false;
        if (!m_meetings.foundAny()) return true;
        if (round == kRounds) return false;
        const std::size_t before = m_in.elements.size();
        const std::size_t runs = m_runs.size();
        cutRound(false);
        if (m_in.elements.size() == before && m_runs.size() == runs) return true;
    }
}

void Arrangement::cutRound(bool first) {
    gatherPoints(first);
    m_runs.clear();
    m_out.clear();
    m_out.elements.reserve(m_in.elements.size() + m_meetings.stopCount());
    m_movedOut.clear();
    for (const Strand& strand : m_in.strands)
        cutStrand(strand);
    std::swap(m_in, m_out);
    std::swap(m_moved, m_movedOut);
    m_settled.assign(m_in.elements.size() + m_in.strands.size(), 0);
    for (const Run& run : m_runs) {
        if (run.from != kNone) m_settled[run.first] = 1;
    }
}

/// Draws together what is a node now: first the vertices that were nodes before.
void Arrangement::gatherPoints(bool first) {
    const std::size_t vertices = m_meetings.vertexCount();
    m_points.clear();
    m_pointOf.assign(vertices + m_meetings.points().size(), kNone);
    const auto take = [&](Index v) {
        m_pointOf[v] = static_cast<Index>(m_points.size());
        m_points.push_back(m_meetings.vertex(v));
    };
    for (Index v = 0; v < vertices; ++v) {
        if (!first && m_settled[v] != 0) take(v);
    }
    const std::size_t settled = m_points.size();
    for (Index v = 0; v < vertices; ++v) {
        if (m_pointOf[v] == kNone && m_meetings.isMet(v)) take(v);
    }
    for (std::size_t i = 0; i < m_meetings.points().size(); ++i) {
        m_pointOf[vertices + i] = static_cast<Index>(m_points.size());
        m_points.push_back(m_meetings.points()[i]);
    }
    m_clusters.assign(m_points, m_tolerance, settled);
}

bool Arrangement::meetsNode(Index element) const {
    return m_pointOf[element] != kNone ||
           m_meetings.firstStop(element) != m_meetings.firstStop(element + 1);
}

/// The first element of a strand with a node at its start or within it; kNone when there is none.
Index Arrangement::findStart(const Strand& strand) const {
    for (Index i = strand.first; i < strand.last; ++i) {
        if (meetsNode(i)) return i;
    }
    return kNone;
}

void Arrangement::cutStrand(const Strand& strand) {
    const std::size_t before = m_out.elements.size();
    m_weight = strand.weight;
    m_node = kNone;
    m_runFirst = static_cast<Index>(before);
    const Index start = findStart(strand);
    if (start == kNone) {
        cutFreeStrand(strand);
    } else {
        // A closed strand is walked once round from its first node, so that no run is in two parts.
        const Index firstStop = m_meetings.firstStop(start);
        const Index lastStop = m_meetings.firstStop(start + 1);
        const bool atVertex = m_pointOf[start] != kNone;
        const Index point =
            atVertex ? m_pointOf[start] : m_pointOf[m_meetings.stops()[firstStop].point];
        m_node = m_clusters.nodeOf(point);
        m_at = m_clusters.nodes()[m_node];
        cutElement(start, atVertex ? firstStop : firstStop + 1, lastStop);
        for (Index i = start + 1; i < strand.last; ++i)
            cutElement(i, m_meetings.firstStop(i), m_meetings.firstStop(i + 1));
        for (Index i = strand.first; i < start; ++i)
            cutElement(i, m_meetings.firstStop(i), m_meetings.firstStop(i + 1));
        if (!atVertex)
            advance(start, m_clusters.nodes()[m_clusters.nodeOf(point)], m_clusters.nodeOf(point));
    }
    const Index last = static_cast<Index>(m_out.elements.size());
    if (before < last)
        m_out.strands.push_back({static_cast<Index>(before), last, strand.closed, strand.weight});
    m_movedOut.resize(last, 0);
}

void Arrangement::cutFreeStrand(const Strand& strand) {
    for (Index i = strand.first; i < strand.last; ++i)
        m_out.elements.push_back(flattened(m_in.elements[i], m_tolerance));
    m_runs.push_back(
        {kNone, kNone, m_runFirst, static_cast<Index>(m_out.elements.size()), m_weight});
}

/// Goes on along an element, past some of its stops, to its end.
void Arrangement::cutElement(Index element, Index firstStop, Index lastStop) {
    const StrandElement& e = m_in.elements[element];
    for (Index s = firstStop; s < lastStop; ++s) {
        const Index node = m_clusters.nodeOf(m_pointOf[m_meetings.stops()[s].point]);
        advance(element, m_clusters.nodes()[node], node);
    }
    const Index point = m_pointOf[m_meetings.endVertex(element)];
    const Index node = point == kNone ? kNone : m_clusters.nodeOf(point);
    advance(element, node == kNone ? e.ep : m_clusters.nodes()[node], node);
}

/// Goes on along an element to a point, which is a node or the end of the element.
void Arrangement::advance(Index element, Vec2 to, Index node) {
    if (node != kNone && node == m_node && m_out.elements.size() == m_runFirst) return;
    const StrandElement& e = m_in.elements[element];
    m_out.elements.push_back(flattened(part(e, m_at, to), m_tolerance));
    m_movedOut.resize(m_out.elements.size(), 0);
    if (hasMoved(e, e.sp, m_at) || hasMoved(e, e.ep, to)) m_movedOut.back() = 1;
    m_at = to;
    if (node != kNone) passNode(node);
}

/// Ends the run in hand and begins the next.
void Arrangement::passNode(Index node) {
    const Index last = static_cast<Index>(m_out.elements.size());
    m_runs.push_back({m_node, node, m_runFirst, last, m_weight});
    m_runFirst = last;
    m_node = node;
}

/// Whether a piece with an end there has been bent away from its element by more than half a
/// tolerance.
bool Arrangement::hasMoved(const StrandElement& e, Vec2 was, Vec2 node) const {
    const double limit = 0.5 * m_tolerance;
    const Vec2 by = node - was;
    if (dot(by, by) <= limit * limit) return false;
    return std::fabs(signedDistance(carrierOf(e), node)) > limit;
}

}  // namespace gmregion
