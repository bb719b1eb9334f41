// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/link/Fans.h"
#include "region/link/Loops.h"
#include "region/offset/OffsetSource.h"
#include "region/offset/RawParallels.h"

namespace gmregion {

/// Chooses the runs of raw parallels that bound the offset.
///
/// A run between nodes lies in the offset's boundary as a whole or not at all: one point of it is
/// asked whether anything of the source is nearer than what the run is the parallel of. Where the
/// answer is no clear one, the nodes decide: as many runs have to arrive as leave.
class RunChoice {
public:
    /// Chooses runs in `loops`. False when nodes do not come out even although the distances of the
    /// runs at hand leave no doubt; `conflict()` is a point near the place then.
    bool choose(const Arrangement& arrangement, Fans& fans, const OffsetSource& source,
                const RawParallels& raw, Loops& loops);
    Vec2 conflict() const { return m_conflict; }
    /// Points of the runs that leave a doubt, and of those that met their like from the other side.
    const std::vector<Vec2>& marginal() const { return m_marginal; }

private:
    /// What is known of a run.
    struct State {
        bool chosen = false;
        bool backward = false;
        bool doubtful = false;
        float excess = 0.0F;  ///< by how many tolerances something else of the source is nearer
    };

    State judge(Index run, const OffsetSource& source, const RawParallels& raw);
    double excessAt(Vec2 p, Index tag, const OffsetSource& source, const RawParallels& raw);
    const std::vector<Run>& runs() const { return m_arrangement->runs(); }
    Index start(Index run) const {
        return m_states[run].backward ? runs()[run].to : runs()[run].from;
    }
    Index end(Index run) const {
        return m_states[run].backward ? runs()[run].from : runs()[run].to;
    }
    void change(Index run);
    bool settleNodes();
    bool follow(Index node);
    Index findDoubtful(Index node) const;
    bool isRemedy(Index run, Index node) const;

    const Arrangement* m_arrangement = nullptr;
    Fans* m_fans = nullptr;
    std::vector<State> m_states;
    std::vector<int> m_surplus;  ///< of each node, chosen runs that leave less those that arrive
    std::vector<Vec2> m_marginal;
    Index m_guess = kNone;  ///< what of the source was near last
    Vec2 m_conflict;
};

}  // namespace gmregion
