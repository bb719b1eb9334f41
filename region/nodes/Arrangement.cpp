// SPDX-License-Identifier: MIT
/// @file
/// From elements to nodes and edges.
///
/// Each two elements whose boxes come near are asked for the points they have to share: crossings,
/// ends of the one on the other, and where they come nearest without crossing, if that is within
/// the tolerance. These points and all ends are drawn together to nodes, and every element becomes
/// the pieces between its nodes, in the order in which it passes them. A piece of an arc keeps the
/// curvature of its arc: with s half the curvature times the chord, its bulge is
/// s / (1 + sqrt(1 - s s)). Pieces between the same nodes whose heights agree within the tolerance
/// are one edge, lines and arcs alike.
#include "region/nodes/Arrangement.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include "region/plane/Crossing.h"
#include "region/plane/ElementBox.h"
#include "region/plane/Nearest.h"

namespace gmregion {

namespace {

double squaredLength(Vec2 v) {
    return dot(v, v);
}

}  // namespace

void Arrangement::assign(const std::vector<Element>& elements) {
    m_points.clear();
    m_stops.clear();
    m_pieces.clear();
    findStops(elements);
    m_clusters.assign(m_points);
    cutPieces(elements);
    mergePieces();
}

void Arrangement::findStops(const std::vector<Element>& elements) {
    std::vector<Box> boxes;
    boxes.reserve(elements.size());
    for (std::size_t i = 0; i < elements.size(); ++i) {
        const Element& e = elements[i];
        boxes.push_back(boxAbout(e).grown(m_tolerance));
        m_points.push_back(e.sp);
        m_stops.push_back({i, -1.0, m_points.size() - 1});
        m_points.push_back(e.ep);
        m_stops.push_back({i, 2.0, m_points.size() - 1});
    }
    m_boxes.assign(boxes);
    m_boxes.visitPairs([&](std::size_t i, std::size_t j) { meet(elements, i, j); });
}

/// Finds the points that two elements have to share.
void Arrangement::meet(const std::vector<Element>& elements, std::size_t i, std::size_t j) {
    const Element& a = elements[i];
    const Element& b = elements[j];
    const bool endsOfA = stopAtEnds(elements, i, j);
    const bool endsOfB = stopAtEnds(elements, j, i);
    const CrossingPoints crossing = crossings(a, b);
    for (const Vec2 p : crossing)
        stopBoth(elements, i, j, p);
    if (endsOfA || endsOfB || crossing.size() > 0) return;
    const Carrier onA = carrierOf(a);
    const Carrier onB = carrierOf(b);
    const std::optional<Vec2> p = nearestApproach(onA, onB);
    if (!p) return;
    const Vec2 gap = nearestOn(a, onA, *p) - nearestOn(b, onB, *p);
    if (squaredLength(gap) <= m_tolerance * m_tolerance) stopBoth(elements, i, j, *p);
}

/// Lets one element stop at the ends of another that lie on it; answers whether there are any.
bool Arrangement::stopAtEnds(const std::vector<Element>& elements, std::size_t ends,
                             std::size_t on) {
    const Element& e = elements[on];
    const Carrier carrier = carrierOf(e);
    bool any = false;
    for (const std::size_t point : {2 * ends, 2 * ends + 1}) {
        const Vec2 end = m_points[point];
        if (squaredLength(nearestOn(e, carrier, end) - end) > m_tolerance * m_tolerance) continue;
        stop(e, on, point);
        any = true;
    }
    return any;
}

void Arrangement::stopBoth(const std::vector<Element>& elements, std::size_t i, std::size_t j,
                           Vec2 p) {
    m_points.push_back(p);
    stop(elements[i], i, m_points.size() - 1);
    stop(elements[j], j, m_points.size() - 1);
}

/// Ends keep their places; what lies beside them comes after the start and before the end.
void Arrangement::stop(const Element& e, std::size_t element, std::size_t point) {
    const double place = std::clamp(placeOn(e, m_points[point]), 0.0, 1.0);
    m_stops.push_back({element, place, point});
}

void Arrangement::cutPieces(const std::vector<Element>& elements) {
    std::sort(m_stops.begin(), m_stops.end(), [](const Stop& a, const Stop& b) {
        if (a.element != b.element) return a.element < b.element;
        return a.place < b.place || (a.place == b.place && a.point < b.point);
    });
    for (std::size_t i = 1; i < m_stops.size(); ++i) {
        if (m_stops[i].element != m_stops[i - 1].element) continue;
        const std::size_t from = m_clusters.nodeOf(m_stops[i - 1].point);
        const std::size_t to = m_clusters.nodeOf(m_stops[i].point);
        if (from != to) addPiece(elements[m_stops[i].element], m_stops[i].element, from, to);
    }
}

void Arrangement::addPiece(const Element& e, std::size_t element, std::size_t from,
                           std::size_t to) {
    const double chord = std::sqrt(squaredLength(nodes()[to] - nodes()[from]));
    const double curvature = e.bulge == 0.0 ? 0.0 : carrierOf(e).curvature;
    const double s = std::clamp(0.5 * curvature * chord, -1.0, 1.0);
    const double bulge = s / (1.0 + std::sqrt((1.0 - s) * (1.0 + s)));
    const double height = -0.5 * bulge * chord;
    if (from < to) {
        m_pieces.push_back({from, to, bulge, height, 1, element});
    } else {
        m_pieces.push_back({to, from, -bulge, -height, -1, element});
    }
}

void Arrangement::mergePieces() {
    m_edges.clear();
    m_sources.clear();
    std::sort(m_pieces.begin(), m_pieces.end(), [](const Piece& a, const Piece& b) {
        if (a.from != b.from) return a.from < b.from;
        if (a.to != b.to) return a.to < b.to;
        return a.height < b.height || (a.height == b.height && a.element < b.element);
    });
    for (std::size_t i = 0; i < m_pieces.size();) {
        const Piece& lowest = m_pieces[i];
        Edge edge{lowest.from, lowest.to, lowest.bulge, 0, m_sources.size(), 0};
        for (; i < m_pieces.size() && m_pieces[i].from == edge.from && m_pieces[i].to == edge.to &&
               m_pieces[i].height - lowest.height <= m_tolerance;
             ++i) {
            edge.multiplicity += m_pieces[i].sense;
            m_sources.push_back(m_pieces[i].element);
        }
        edge.last = m_sources.size();
        std::sort(m_sources.begin() + static_cast<std::ptrdiff_t>(edge.first), m_sources.end());
        m_edges.push_back(edge);
    }
}

}  // namespace gmregion
