// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/Parallels.h"
#include "region/link/PieceWriter.h"
#include "region/offset/MadeOf.h"
#include "region/offset/OffsetSource.h"
#include "region/overlay/OverlayScratch.h"

namespace gmregion {

/// Writes one side of the boundary of a path that is thickened.
class SideWriter {
public:
    /// Appends what lies on that side. Memory is kept from one call to the next.
    /// @param scratch holds the boundary, linked
    /// @param source the path, there and back
    /// @param madeOf what the runs of the boundary are made of
    void write(const OverlayScratch& scratch, const OffsetSource& source, const MadeOf& madeOf,
               bool onLeft, Parallels& parallels);

private:
    struct Step {
        Element element;
        Index tag;
    };
    struct Chain {
        std::size_t first;
        std::size_t last;
        bool closed;
        Index start;     ///< the number of the element beside which it begins
        double squared;  ///< of its start's distance from that element's start
    };

    bool isWanted(Index tag) const;
    void listSteps(std::size_t loop);
    void gather(std::size_t loop);
    void addStep(const Step& step);
    void writeChain(const Chain& chain, PieceWriter& writer, Parallels& parallels) const;

    const OverlayScratch* m_scratch = nullptr;
    const OffsetSource* m_source = nullptr;
    const MadeOf* m_madeOf = nullptr;
    Index m_turn = 0;  ///< the number of the first element on the way back
    bool m_onLeft = false;
    std::vector<Step> m_loop;
    std::vector<Step> m_steps;
    std::vector<Chain> m_chains;
};

}  // namespace gmregion
