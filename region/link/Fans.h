// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "region/nodes/Arrangement.h"

namespace gmregion {

/// A run as it leaves one of its nodes: the number of the run, doubled, and one more when it leaves
/// from its end.
using Half = Index;

inline Half leaving(Index run, bool fromEnd) {
    return 2 * run + (fromEnd ? 1u : 0u);
}
inline Index runOf(Half half) {
    return half / 2;
}
inline bool leavesEnd(Half half) {
    return half % 2 != 0;
}

/// A range of halves.
struct Fan {
    Half* first;
    Half* last;
    Half* begin() const { return first; }
    Half* end() const { return last; }
    std::size_t size() const { return static_cast<std::size_t>(last - first); }
};

/// The runs about each node of an arrangement; runs that are the same made one.
///
/// Runs of one piece between the same nodes whose heights over their chord agree within the
/// tolerance are the same, lines and arcs alike: the first of them stands for all, with the sum of
/// their weights.
class Fans {
public:
    /// Cost: linear; in nodes of many runs that of sorting them.
    void build(const Arrangement& arrangement);

    std::size_t nodeCount() const { return m_first.size() - 2; }
    /// The halves that leave a node, without runs that another one stands for.
    Fan at(Index node) { return {m_halves.data() + m_first[node], m_halves.data() + m_last[node]}; }
    /// Sorts the halves that leave a node counter-clockwise; only the order round counts.
    void sort(Index node);

    Index fromNode(Half half) const;
    Index toNode(Half half) const;
    Weight weight(Index run) const { return m_runs[run].weight; }
    /// Whether the run stands for itself, not another one for it.
    bool stands(Index run) const { return standIn(run) == run; }
    /// The run that stands for a run.
    Index standIn(Index run) const { return m_runs[run].standIn; }
    /// Whether a run stands for runs of opposite sense.
    bool isTwoWay(Index run) const { return m_runs[run].twoWay; }
    /// The next run, of those for which the same run stands; kNone after the last.
    Index nextSame(Index run) const { return m_runs[run].nextSame; }
    /// The piece with which a half leaves its node, turned that way.
    Element firstPiece(Half half) const;

private:
    struct State {
        Weight weight;
        Index standIn;
        Index nextSame;
        bool twoWay;
    };

    void count();
    void mergeAt(Index node);
    void removeAbsorbed(Index node);
    void absorb(Half by, Half half);
    double height(Half half) const;
    bool isSingle(Half half) const;
    bool isBefore(Half a, Half b, double placeOfA, double placeOfB) const;

    const Arrangement* m_arrangement = nullptr;
    std::vector<Half> m_halves;
    std::vector<Index> m_first;  ///< where the halves of a node begin
    std::vector<Index> m_last;
    std::vector<State> m_runs;
    std::vector<double> m_places;
    std::vector<Half> m_same;
};

}  // namespace gmregion
