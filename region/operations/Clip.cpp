// SPDX-License-Identifier: MIT
/// @file
/// Paths cut by a set.
///
/// They are laid over the boundary as strands that count nothing. So the windings on both sides of
/// a path's run are those of the set, and are carried about the nodes like all others; a run that
/// coincides with one of the boundary counts as that one.
#include "gmregion/Clip.h"

#include <algorithm>

#include "region/link/PieceWriter.h"
#include "region/operations/Scratch.h"
#include "region/overlay/Intake.h"
#include "region/overlay/Overlay.h"

namespace gmregion {

namespace {

void clear(Clipping& clipping) {
    clipping.parts.clear();
    clipping.elements.clear();
    clipping.origins.clear();
    clipping.refusal = {};
}

bool refuse(Clipping& clipping, const Refusal& refusal) {
    clear(clipping);
    clipping.refusal = refusal;
    return false;
}

/// Writes the parts of strands that are cut and whose windings are known.
class PartWriter {
public:
    PartWriter(const OverlayScratch& scratch, Clipping& clipping)
        : m_scratch(scratch),
          m_arrangement(scratch.arrangement),
          m_clipping(clipping),
          m_writer(clipping.elements, scratch.arrangement.tolerance()) {}

    /// Runs of a strand stand from one number up to another one.
    void write(const Strand& strand, Index firstRun, Index lastRun) {
        const Index count = lastRun - firstRun;
        Index start = 0;
        if (strand.closed) {
            while (start < count && placeOf(firstRun + start) == placeOf(lastRun - 1))
                ++start;
        }
        // A closed path that is nowhere cut stays whole, from its first run.
        const bool isWhole = strand.closed && start == count;
        for (Index i = 0; i < count; ++i)
            append(firstRun + (start + i) % count, i == 0);
        m_clipping.parts.back().closed = isWhole;
    }

private:
    Place placeOf(Index run) const {
        const Index standIn = m_scratch.fans.standIn(run);
        if (!(m_scratch.fans.weight(standIn) == Weight{})) return Place::kOnBoundary;
        return m_scratch.windings.onLeft(standIn).a > 0 ? Place::kInside : Place::kOutside;
    }

    void append(Index run, bool begins) {
        const Place place = placeOf(run);
        const Index next = static_cast<Index>(m_clipping.elements.size());
        if (begins || m_clipping.parts.back().place != place) {
            m_clipping.parts.push_back({next, next, false, place});
            m_writer.begin();
        }
        const Run& r = m_arrangement.runs()[run];
        for (Index i = r.first; i < r.last; ++i) {
            const StrandElement& piece = m_arrangement.pieces()[i];
            if (m_writer.append(piece, piece.tag))
                m_clipping.origins.push_back(m_scratch.origins[piece.tag]);
        }
        m_clipping.parts.back().last = static_cast<Index>(m_clipping.elements.size());
    }

    const OverlayScratch& m_scratch;
    const Arrangement& m_arrangement;
    Clipping& m_clipping;
    PieceWriter m_writer;
};

/// Writes the parts of all strands that count nothing.
void writeParts(const OverlayScratch& scratch, Clipping& clipping) {
    PartWriter writer(scratch, clipping);
    const auto& runs = scratch.arrangement.runs();
    Index run = 0;
    for (const Strand& strand : scratch.arrangement.strandsCut()) {
        const Index first = run;
        while (run < runs.size() && runs[run].first < strand.last)
            ++run;
        if (strand.weight == Weight{}) writer.write(strand, first, run);
    }
}

bool clipOnce(OverlayScratch& scratch, double tolerance, Index split, Care care,
              Clipping& clipping) {
    Arrangement& arrangement = scratch.arrangement;
    if (!arrangement.settle(tolerance, split, care)) {
        const Reason reason = arrangement.isAtLimit() ? Reason::kWorkLimit : Reason::kUnsettled;
        return refuse(clipping, {reason, {}, 0});
    }
    scratch.fans.build(arrangement);
    if (!scratch.windings.find(arrangement, scratch.fans))
        return refuse(clipping, {Reason::kUncertified, scratch.windings.conflict(), 0});
    clear(clipping);
    writeParts(scratch, clipping);
    return true;
}

}  // namespace

bool clip(const Paths& paths, const RegionSet& set, Workspace& workspace, Clipping& clipping) {
    OverlayScratch& scratch = workspace.begin().overlay;
    const Extent extent = extentOf(paths);
    if (extent.refusal) return refuse(clipping, extent.refusal);
    const double asked = std::max(set.tolerance(), extent.largest * kFinestTolerance);
    const double tolerance = set.empty() ? toleranceFor(extent, set.tolerance()) : asked;
    for (const OverlayAttempt& attempt : kOverlayAttempts) {
        Strands& strands = scratch.arrangement.strands();
        strands.clear();
        scratch.origins.clear();
        takeSet(set, {1, 0}, 0, strands);
        const Index split = static_cast<Index>(strands.elements.size());
        const Refusal refusal =
            takePaths(paths, tolerance, false, Weight{}, strands, scratch.origins);
        if (refusal) return refuse(clipping, refusal);
        if (clipOnce(scratch, attempt.share * tolerance, split, attempt.care, clipping))
            return true;
    }
    return false;
}

Clipping clip(const Paths& paths, const RegionSet& set) {
    Workspace workspace;
    Clipping clipping;
    clip(paths, set, workspace, clipping);
    return clipping;
}

}  // namespace gmregion
