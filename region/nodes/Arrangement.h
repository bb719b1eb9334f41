// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "region/model/Element.h"
#include "region/nodes/NodeClusters.h"
#include "region/search/BoxRow.h"

namespace gmregion {

/// A piece of one or more elements between two nodes, with nothing else on it.
struct Edge {
    std::size_t from;  ///< the node with the lower number, or of a loop the same as `to`
    std::size_t to;
    double bulge;       ///< from `from` to `to`
    int multiplicity;   ///< how many elements run along it that way, less those that run back
    std::size_t first;  ///< its elements: a range of Arrangement::sources()
    std::size_t last;
};

/// Elements cut at each other: nodes, and edges that meet at nodes alone.
///
/// Wherever elements cross, end on each other or come nearer than the tolerance, they share a node;
/// where they run alongside within it, they share an edge. Nothing moves by more than twice the
/// tolerance. Memory is kept from one use to the next.
class Arrangement {
public:
    /// @param tolerance in length units, positive, far below the length of common elements
    explicit Arrangement(double tolerance) : m_tolerance(tolerance), m_clusters(tolerance) {}

    /// Takes elements in place of those before; each turns by half a turn at the most, and all
    /// coordinates are finite. Cost: that of sorting, and the pairs of elements that come near.
    void assign(const std::vector<Element>& elements);

    const std::vector<Vec2>& nodes() const { return m_clusters.nodes(); }
    /// In the order of their nodes, then of their heights.
    const std::vector<Edge>& edges() const { return m_edges; }
    /// The numbers of the elements along each edge, in increasing order.
    const std::vector<std::size_t>& sources() const { return m_sources; }

private:
    /// A point that an element has to pass.
    struct Stop {
        std::size_t element;
        double place;
        std::size_t point;
    };
    /// A piece of one element between nodes, turned to run from the lower node to the higher.
    struct Piece {
        std::size_t from;
        std::size_t to;
        double bulge;
        double height;  ///< above the chord, positive on its left
        int sense;      ///< -1 when it was turned
        std::size_t element;
    };

    void findStops(const std::vector<Element>& elements);
    void meet(const std::vector<Element>& elements, std::size_t i, std::size_t j);
    bool stopAtEnds(const std::vector<Element>& elements, std::size_t ends, std::size_t on);
    void stopBoth(const std::vector<Element>& elements, std::size_t i, std::size_t j, Vec2 p);
    void stop(const Element& e, std::size_t element, std::size_t point);
    void cutPieces(const std::vector<Element>& elements);
    void addPiece(const Element& e, std::size_t element, std::size_t from, std::size_t to);
    void mergePieces();

    double m_tolerance;
    NodeClusters m_clusters;
    BoxRow m_boxes;
    std::vector<Vec2> m_points;
    std::vector<Stop> m_stops;
    std::vector<Piece> m_pieces;
    std::vector<Edge> m_edges;
    std::vector<std::size_t> m_sources;
};

}  // namespace gmregion
