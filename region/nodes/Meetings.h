// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <vector>

#include "region/nodes/Strands.h"
#include "region/plane/Carrier.h"
#include "region/search/BoxRow.h"

namespace gmregion {

/// A point that an element has to pass.
struct Stop {
    Index element;
    Index point;   ///< a vertex, or behind the vertices one of Meetings::points()
    double place;  ///< along the element, 0..1
};

/// What else comes near a crossing stops there, too: where the crossing is shallow, or anywhere.
enum class Care : std::uint8_t { kUsual, kThorough };

/// Finds where elements of strands meet: where they cross, where one ends on another, and where
/// they come nearest without crossing, if that is within the tolerance.
///
/// The start of element i is vertex i; behind them come the ends of open strands. Neighbours in a
/// strand do not meet in their common end.
class Meetings {
public:
    /// Which elements are compared, and how.
    struct Scope {
        Index split = kNone;  ///< see Arrangement::settle
        const std::vector<std::uint8_t>* moved =
            nullptr;  ///< if given, of each two one that is set
        Care care = Care::kUsual;
        bool wantsNearMisses = false;  ///< see nearMisses()
    };

    /// Lets the next calls compare so many pairs of elements altogether.
    void allow(std::uint64_t pairs) { m_pairsLeft = pairs; }

    bool isAtLimit() const { return m_pairsLeft == 0; }

    /// False when that needs more pairs than allowed. Cost: that of the pairs of elements whose
    /// boxes come near.
    bool find(const Strands& strands, double tolerance, const Scope& scope);

    /// Whether anything was found but that elements end at common points.
    bool foundAny() const { return !m_stops.empty() || m_turnsBack; }
    std::size_t stopCount() const { return m_stops.size(); }
    Index endVertex(Index element) const { return m_endVertex[element]; }
    std::size_t vertexCount() const { return m_isMet.size(); }
    Vec2 vertex(Index v) const;
    /// True for vertices that something else comes near, and for the ends of open strands.
    bool isMet(Index v) const { return m_isMet[v] != 0; }
    const std::vector<Vec2>& points() const { return m_points; }
    /// Where elements of which no two follow each other come within four tolerances of each other
    /// without meeting.
    const std::vector<Vec2>& nearMisses() const { return m_nearMisses; }
    /// The stops of an element, from its start to its end: firstStop(e) up to firstStop(e + 1).
    Index firstStop(Index element) const { return m_firstStop[element]; }
    const std::vector<Stop>& stops() const { return m_stops; }

private:
    void prepare(const Strands& strands);
    void raiseBoxes(const Scope& scope);
    bool takePair();
    bool meetPairs(const Scope& scope);
    bool meetMoved(const std::vector<std::uint8_t>& moved);
    const Box& boxOf(Index element) const;
    const Carrier& carrier(Index element);
    void meet(Index i, Index j);
    void meetBackAndForth(Index i, Index j);
    void meetBetween(Index i, Index j, bool areNeighbours);
    bool stopAtEnds(Index ends, Index on);
    void stopBoth(Index i, Index j, Vec2 p);
    void noteNearMiss(Index i, Index j);
    bool meetInTwoEnds() const;
    bool isNear(const Carrier& c, Vec2 p) const;
    bool isNearCommonEnd(const Element& a, const Element& b, Vec2 p) const;
    bool isVertexOf(Index v, Index element) const {
        return v == element || v == m_endVertex[element];
    }
    void stopAtShallow(Index split);
    void addStop(Index element, Index point, Vec2 p);
    void sortStops();

    const Strands* m_strands = nullptr;
    double m_tolerance = 0.0;
    std::uint64_t m_pairsLeft = UINT64_MAX;
    double m_shallow = 0.0;  ///< the sine of a crossing that is called shallow
    bool m_turnsBack = false;
    BoxRow m_boxes;
    BoxRow m_otherBoxes;
    std::vector<Vec2> m_contacts;     ///< of the pair in hand, ends that are on both
    std::vector<Carrier> m_carriers;  ///< of elements that were asked for it
    std::vector<std::uint8_t> m_hasCarrier;
    std::vector<Index> m_endVertex;
    std::vector<std::uint8_t> m_isMet;
    double m_reach = 0.0;  ///< by which boxes are grown
    std::vector<Vec2> m_nearMisses;
    std::vector<Vec2> m_points;
    std::vector<Index> m_shallowPoints;  ///< where elements cross at a small angle
    std::vector<Stop> m_found;
    std::vector<Stop> m_stops;
    std::vector<Index> m_firstStop;
};

}  // namespace gmregion
