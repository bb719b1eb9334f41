// SPDX-License-Identifier: MIT
/// @file
/// Offsets of paths to one side.
///
/// The boundary of a thickened path consists of what lies on its right, in the direction of travel,
/// of what lies on its left, against it, and of the half circles about its ends. Each of its runs
/// knows the element that it is made of, there or on the way back; so one side is what is left when
/// the other one and the half circles are taken out.
#include "gmregion/Parallels.h"

#include <algorithm>
#include <cmath>

#include "region/link/PieceWriter.h"
#include "region/offset/OffsetAttempts.h"
#include "region/operations/Scratch.h"
#include "region/overlay/Intake.h"

namespace gmregion {

namespace {

void clear(Parallels& parallels) {
    parallels.parts.clear();
    parallels.elements.clear();
    parallels.origins.clear();
    parallels.marginal.clear();
    parallels.refusal = {};
}

bool refuse(Parallels& parallels, const Refusal& refusal) {
    clear(parallels);
    parallels.refusal = refusal;
    return false;
}

/// Writes one side of the boundary of a path that is thickened.
class SideWriter {
public:
    SideWriter(const Scratch& scratch, const MadeOf& madeOf, bool onLeft, Parallels& parallels)
        : m_scratch(scratch.overlay),
          m_madeOf(madeOf),
          m_elements(scratch.offset.source.elements()),
          m_turn(static_cast<Index>(m_elements.size() / 2)),
          m_isOpen(scratch.offset.source.isThereAndBack(0)),
          m_onLeft(onLeft),
          m_parallels(parallels),
          m_writer(parallels.elements, m_scratch.arrangement.tolerance()) {}

    void write() {
        for (std::size_t loop = 0; loop < m_scratch.loops.size(); ++loop)
            gather(loop);
        std::stable_sort(m_chains.begin(), m_chains.end(), [](const Chain& a, const Chain& b) {
            if (a.start != b.start) return a.start < b.start;
            return a.squared < b.squared;
        });
        for (const Chain& chain : m_chains)
            writeChain(chain);
    }

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

    /// Whether a piece lies on the side wanted, and not about an end.
    bool isWanted(Index tag) const {
        const Index source = m_madeOf.sources[tag];
        const bool isLast = source + 1 == m_turn || source + 1 == 2 * m_turn;
        const bool isEnd = m_isOpen && isLast && m_madeOf.kinds[tag] == OriginKind::kCorner;
        return !isEnd && (source >= m_turn) == m_onLeft;
    }

    /// The steps of a loop, and the chains of those that are wanted.
    void gather(std::size_t loop) {
        m_loop.clear();
        const Arrangement& arrangement = m_scratch.arrangement;
        for (const Half* half = m_scratch.loops.begin(loop); half != m_scratch.loops.end(loop);
             ++half) {
            const Run& run = arrangement.runs()[runOf(*half)];
            for (Index i = 0; i < run.last - run.first; ++i) {
                const bool back = leavesEnd(*half);
                const StrandElement& e =
                    arrangement.pieces()[back ? run.last - 1 - i : run.first + i];
                m_loop.push_back({back ? Element{e.ep, e.sp, -e.bulge} : Element(e), e.tag});
            }
        }
        const auto unwanted = std::find_if(m_loop.begin(), m_loop.end(),
                                           [this](const Step& s) { return !isWanted(s.tag); });
        const bool isWhole = unwanted == m_loop.end();
        if (!isWhole) std::rotate(m_loop.begin(), unwanted, m_loop.end());
        bool goesOn = false;
        for (const Step& step : m_loop) {
            const bool wanted = isWanted(step.tag);
            if (wanted && !goesOn)
                m_chains.push_back({m_steps.size(), m_steps.size(), isWhole, 0, 0.0});
            if (wanted) addStep(step);
            goesOn = wanted;
        }
    }

    void addStep(const Step& step) {
        m_steps.push_back(step);
        Chain& chain = m_chains.back();
        chain.last = m_steps.size();
        // On the way back the last step of the chain is where it begins along the path.
        if (!m_onLeft && chain.last != chain.first + 1) return;
        const Index number = m_madeOf.sources[step.tag];
        const SourceElement& beside = m_elements[number];
        const Vec2 away = m_onLeft ? step.element.ep - beside.ep : step.element.sp - beside.sp;
        chain.start = m_onLeft ? 2 * m_turn - 1 - number : number;
        chain.squared = dot(away, away);
    }

    void writeChain(const Chain& chain) {
        m_writer.begin();
        const auto begin = static_cast<std::uint32_t>(m_parallels.elements.size());
        for (std::size_t i = chain.first; i < chain.last; ++i) {
            const Step& step = m_steps[m_onLeft ? chain.first + chain.last - 1 - i : i];
            const Element& e = step.element;
            if (!m_writer.append(m_onLeft ? Element{e.ep, e.sp, -e.bulge} : e, step.tag)) continue;
            Origin origin = m_scratch.origins[m_madeOf.owners[step.tag]];
            origin.kind = m_madeOf.kinds[step.tag];
            m_parallels.origins.push_back(origin);
        }
        m_parallels.parts.push_back(
            {begin, static_cast<std::uint32_t>(m_parallels.elements.size()), chain.closed});
    }

    const OverlayScratch& m_scratch;
    const MadeOf& m_madeOf;
    const std::vector<SourceElement>& m_elements;  ///< there, then back
    Index m_turn;                                  ///< the first on the way back
    bool m_isOpen;
    bool m_onLeft;
    Parallels& m_parallels;
    PieceWriter m_writer;
    std::vector<Step> m_loop;
    std::vector<Step> m_steps;
    std::vector<Chain> m_chains;
};

/// Appends what lies beside one path.
bool appendParallels(Scratch& scratch, const Strands& path, double distance, double tolerance,
                     const OffsetOptions& options, Parallels& parallels) {
    Outcome& outcome = scratch.outcome;
    scratch.offset.source.take(path);
    if (scratch.offset.source.elements().empty()) return true;
    OriginSource origins;
    origins.list = &scratch.overlay.origins;
    const MadeOf* madeOf = offsetInAttempts(scratch.overlay, scratch.offset, origins,
                                            std::fabs(distance), tolerance, options, true, outcome);
    if (madeOf == nullptr) return refuse(parallels, outcome.refusal);
    parallels.marginal.insert(parallels.marginal.end(), outcome.marginal.begin(),
                              outcome.marginal.end());
    SideWriter(scratch, *madeOf, distance < 0.0, parallels).write();
    return true;
}

}  // namespace

bool makeParallels(const Paths& paths, double distance, double tolerance,
                   const OffsetOptions& options, Workspace& workspace, Parallels& parallels) {
    Scratch& scratch = workspace.begin();
    clear(parallels);
    const Extent extent = extentOf(paths);
    Refusal refusal = extent.refusal ? extent.refusal : checkedOffset(distance, options);
    const double coincident = toleranceFor(extent, tolerance);
    if (!refusal) refusal = checkedTolerance(extent, coincident);
    if (!refusal && extent.size > 0.0 && std::fabs(distance) <= 0.5 * coincident)
        refusal = {Reason::kTolerance, {}, 0};
    Strands& strands = scratch.paths;
    strands.clear();
    scratch.overlay.origins.clear();
    if (!refusal)
        refusal = takePaths(paths, coincident, false, {1, 0}, strands, scratch.overlay.origins);
    if (refusal) return refuse(parallels, refusal);
    OffsetOptions round = options;
    round.end = End::kRound;
    Strands& path = scratch.path;
    for (const Strand& strand : strands.strands) {
        path.clear();
        path.elements.assign(strands.elements.begin() + strand.first,
                             strands.elements.begin() + strand.last);
        path.endStrand(strand.closed, strand.weight);
        if (!appendParallels(scratch, path, distance, coincident, round, parallels)) return false;
    }
    return true;
}

Parallels makeParallels(const Paths& paths, double distance, const OffsetOptions& options) {
    Workspace workspace;
    Parallels parallels;
    makeParallels(paths, distance, 0.0, options, workspace, parallels);
    return parallels;
}

}  // namespace gmregion
