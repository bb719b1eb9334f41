// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/link/Fans.h"

namespace gmregion {

/// Closed loops out of chosen runs, each passing a node once at most.
class Loops {
public:
    /// Begins with no run chosen.
    void begin(const Arrangement& arrangement, Fans& fans);
    /// Chooses a run, in its direction or against it; what is covered lies on its left then.
    void choose(Index run, bool backward) { m_choice[run] = backward ? kBackward : kForward; }
    bool isChosen(Index run) const { return m_choice[run] != kOut; }

    /// Links what was chosen. At a node the one that arrives goes on with the next one clockwise,
    /// so that no two loops cross. False when a node has more or fewer that arrive than leave,
    /// which is told by `conflict()`. Cost: linear; fans of nodes that several pass are sorted.
    bool link();

    std::size_t size() const { return m_ends.size(); }
    /// The runs of a loop in its order, each as it leaves.
    const Half* begin(std::size_t loop) const {
        return m_steps.data() + (loop == 0 ? 0 : m_ends[loop - 1]);
    }
    const Half* end(std::size_t loop) const { return m_steps.data() + m_ends[loop]; }
    Vec2 conflict() const { return m_conflict; }

private:
    enum Choice : std::uint8_t { kOut, kForward, kBackward };

    bool isLeaving(Half half) const {
        return m_choice[runOf(half)] == (leavesEnd(half) ? kBackward : kForward);
    }
    bool isArriving(Half half) const {
        return m_choice[runOf(half)] == (leavesEnd(half) ? kForward : kBackward);
    }
    bool checkNodes();
    Half nextAfter(Half step);
    Half leavingRun(Index run) const { return leaving(run, m_choice[run] == kBackward); }
    bool trace(Half start);
    void cutOff(std::size_t from);

    const Arrangement* m_arrangement = nullptr;
    Fans* m_fans = nullptr;
    std::vector<std::uint8_t> m_choice;
    std::vector<std::uint8_t> m_passes;  ///< how many chosen runs leave each node, 2 for more
    std::vector<std::uint8_t> m_isSorted;
    std::vector<std::uint8_t> m_isUsed;
    std::vector<Half> m_way;          ///< of the loop that is being traced
    std::vector<Index> m_placeOnWay;  ///< of each node, kNone where it is not on the way
    std::vector<Half> m_steps;
    std::vector<Index> m_ends;
    Vec2 m_conflict;
};

}  // namespace gmregion
