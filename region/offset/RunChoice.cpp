// SPDX-License-Identifier: MIT
/// @file
/// Which runs bound the offset.
///
/// The distance from the source, along the raw parallels, passes through the offset distance only
/// where the boundary of the offset is, which is made of raw parallels itself; so it does not
/// between nodes. A point of the boundary has nothing of the source nearer than the element that it
/// belongs to, and a point of any other run has. How much nearer is measured against that element,
/// not against the offset distance: nodes bend runs by up to the tolerance, and do not make them
/// wrong.
///
/// What is nearer by a small part of the tolerance or by a few tolerances is doubtful. Nodes that
/// are uneven then are settled by changing doubtful runs, one after the other along their way,
/// those first of which the least is known.
#include "region/offset/RunChoice.h"

#include <algorithm>
#include <cmath>

#include "region/plane/Carrier.h"
#include "region/plane/ElementWinding.h"

namespace gmregion {

namespace {

// By how many tolerances something else is nearer: up to the first that is rounding; up to kIn a
// run is in, beyond it out; between kSurelyIn and kSurelyOut there is doubt.
constexpr double kCertain = 1.0 / 1024.0;
constexpr double kSurelyIn = 1.0 / 16.0;
constexpr double kIn = 0.5;
constexpr double kSurelyOut = 4.0;

/// A point of an element by the share of its chord, 0..1, that lies before it.
Vec2 pointOf(const Element& e, double share) {
    const Vec2 chord = e.ep - e.sp;
    if (e.bulge == 0.0) return e.sp + share * chord;
    return footOn(carrierOf(e), e.sp + share * chord);
}

}  // namespace

bool RunChoice::choose(const Arrangement& arrangement, Fans& fans, const OffsetSource& source,
                       const RawParallels& raw, Loops& loops) {
    m_arrangement = &arrangement;
    m_fans = &fans;
    m_states.assign(runs().size(), {});
    m_surplus.assign(arrangement.nodes().size(), 0);
    m_marginal.clear();
    m_guess = kNone;
    for (Index run = 0; run < runs().size(); ++run) {
        if (!fans.stands(run)) continue;
        m_states[run] = judge(run, source, raw);
        const bool isNeck = fans.weight(run).a == 0;
        if (m_states[run].doubtful || (isNeck && m_states[run].chosen))
            m_marginal.push_back(middleOf(arrangement.pieces()[runs()[run].first]));
        if (isNeck) m_states[run] = {};
        if (!m_states[run].chosen || runs()[run].from == kNone) continue;
        ++m_surplus[start(run)];
        --m_surplus[end(run)];
    }
    if (!settleNodes()) return false;
    for (Index run = 0; run < runs().size(); ++run) {
        if (m_states[run].chosen) loops.choose(run, m_states[run].backward);
    }
    return true;
}

RunChoice::State RunChoice::judge(Index run, const OffsetSource& source, const RawParallels& raw) {
    const auto& pieces = m_arrangement->pieces();
    Index longest = runs()[run].first;
    double width = -1.0;
    for (Index i = runs()[run].first; i < runs()[run].last; ++i) {
        const Vec2 chord = pieces[i].ep - pieces[i].sp;
        if (!(dot(chord, chord) > width)) continue;
        width = dot(chord, chord);
        longest = i;
    }
    const StrandElement& piece = pieces[longest];
    double excess = excessAt(middleOf(piece), piece.tag, source, raw);
    if (excess > 2.0 * kCertain && excess < kSurelyOut) {
        // A run may come near the boundary in its middle, too: the clearest of several points
        // counts.
        for (const double place : {0.15, 0.3, 0.7, 0.85})
            excess = std::max(excess, excessAt(pointOf(piece, place), piece.tag, source, raw));
    }
    State state;
    state.excess = static_cast<float>(excess);
    state.chosen = excess <= kIn;
    state.doubtful = excess > kSurelyIn && excess < kSurelyOut;
    state.backward = m_fans->weight(run).a < 0;
    return state;
}

/// By how many tolerances something else of the source is nearer to a point of a parallel.
double RunChoice::excessAt(Vec2 p, Index tag, const OffsetSource& source, const RawParallels& raw) {
    const double tolerance = m_arrangement->tolerance();
    const double own = raw.ownDistance(source, tag, p);
    const double nearest =
        source.distanceBelow(p, own - kCertain * tolerance, own - kSurelyOut * tolerance, m_guess);
    return (own - nearest) / tolerance;
}

void RunChoice::change(Index run) {
    State& state = m_states[run];
    state.chosen = !state.chosen;
    state.doubtful = false;
    m_surplus[start(run)] += state.chosen ? 1 : -1;
    m_surplus[end(run)] -= state.chosen ? 1 : -1;
}

/// Makes every node even by changing doubtful runs.
bool RunChoice::settleNodes() {
    for (Index node = 0; node < m_surplus.size(); ++node) {
        while (m_surplus[node] != 0) {
            if (follow(node)) continue;
            m_conflict = m_arrangement->nodes()[node];
            return false;
        }
    }
    return true;
}

/// Changes doubtful runs on the way from an uneven node to the next one.
bool RunChoice::follow(Index node) {
    while (m_surplus[node] != 0) {
        const Index run = findDoubtful(node);
        if (run == kNone) return false;
        const Index other = start(run) == node ? end(run) : start(run);
        change(run);
        node = other;
    }
    return true;
}

/// The doubtful run that makes a node less uneven and of which the least is known.
Index RunChoice::findDoubtful(Index node) const {
    Index best = kNone;
    double least = HUGE_VAL;
    for (const Half half : m_fans->at(node)) {
        const Index run = runOf(half);
        const double known = std::fabs(m_states[run].excess - kIn);
        if (!m_states[run].doubtful || !isRemedy(run, node) || known >= least) continue;
        least = known;
        best = run;
    }
    return best;
}

/// Whether to choose a run, or not to any more, makes a node less uneven.
bool RunChoice::isRemedy(Index run, Index node) const {
    if (start(run) == end(run)) return false;
    const int byChange = (start(run) == node ? 1 : -1) * (m_states[run].chosen ? -1 : 1);
    return (m_surplus[node] > 0) == (byChange < 0);
}

}  // namespace gmregion
