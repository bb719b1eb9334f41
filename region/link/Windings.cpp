// SPDX-License-Identifier: MIT
#include "region/link/Windings.h"

#include <algorithm>

#include "region/plane/ElementBox.h"
#include "region/plane/ElementWinding.h"

namespace gmregion {

namespace {

/// In tolerances: pieces that are long beside what nodes move.
constexpr double kLong = 1024.0;

double squaredChord(const Element& e) {
    return dot(e.ep - e.sp, e.ep - e.sp);
}

/// The longest piece of a run, the first of equal ones.
const StrandElement& longestPiece(const Arrangement& arrangement, Index run) {
    const Run& r = arrangement.runs()[run];
    Index longest = r.first;
    double length = -1.0;
    for (Index i = r.first; i < r.last; ++i) {
        const double squared = squaredChord(arrangement.pieces()[i]);
        if (!(squared > length)) continue;
        length = squared;
        longest = i;
    }
    return arrangement.pieces()[longest];
}

Weight times(Weight w, int n) {
    return {w.a * n, w.b * n};
}

}  // namespace

bool Windings::find(const Arrangement& arrangement, Fans& fans) {
    m_arrangement = &arrangement;
    m_fans = &fans;
    m_casts = 0;
    m_right.assign(arrangement.runs().size(), {});
    m_isKnown.assign(arrangement.runs().size(), 0);
    m_isDone.assign(arrangement.nodes().size(), 0);
    for (Index node = 0; node < fans.nodeCount(); ++node)
        fans.sort(node);
    // Parts are begun from runs that are long in comparison to the tolerance, where there are any.
    const double shortest = kLong * arrangement.tolerance();
    for (const double squared : {shortest * shortest, -1.0}) {
        for (Index run = 0; run < arrangement.runs().size(); ++run) {
            if (m_isKnown[run] != 0 || !fans.stands(run)) continue;
            if (squaredChord(longestPiece(arrangement, run)) <= squared) continue;
            if (!findPart(run)) return false;
        }
    }
    return true;
}

/// Finds the numbers of the part of the arrangement that a run belongs to.
bool Windings::findPart(Index run) {
    m_right[run] = castFrom(run);
    m_isKnown[run] = 1;
    if (m_arrangement->runs()[run].from == kNone) return true;
    m_longest = kNone;
    m_longestSquared = 0.0;
    if (!spreadFrom(run)) return false;
    if (m_longest == kNone || castFrom(m_longest) == m_right[m_longest]) return true;
    m_conflict = longestPiece(*m_arrangement, m_longest).sp;
    return false;
}

/// What lies on the right of a run, by a ray from the middle of its longest piece. Runs count with
/// the weights of their own strands, so that whole stretches of strands are passed by their ends;
/// those that are the same all count as the one that stands for them.
Weight Windings::castFrom(Index run) {
    if (m_casts++ == 0) raiseBoxes();
    const auto& pieces = m_arrangement->pieces();
    const auto& strands = m_arrangement->strandsCut();
    const StrandElement& e = longestPiece(*m_arrangement, run);
    const std::size_t own = static_cast<std::size_t>(&e - pieces.data());
    const Vec2 p = middleOf(e);
    Weight sum = times(m_fans->weight(run), windingRightOf(e));
    const auto passPart = [&](Index strand, std::size_t first, std::size_t last) {
        const int winding = windingOfChain(pieces[first].sp, pieces[last - 1].ep, p);
        sum = sum + times(strands[strand].weight, winding);
    };
    const auto passRange = [&](std::size_t first, std::size_t last) {
        m_strands.visitParts(first, last, passPart);
    };
    const auto passPiece = [&](std::size_t i) {
        const Index other = m_runOfPiece[i];
        if (i == own || (other != run && m_fans->standIn(other) == run)) return;
        sum = sum + times(m_arrangement->runs()[other].weight, windingOfStandIn(i, p));
    };
    m_boxes.castLeft(p, passRange, passPiece);
    return sum;
}

/// What a piece adds to a winding, or what the piece of the run that stands for its run does.
int Windings::windingOfStandIn(std::size_t piece, Vec2 p) const {
    const StrandElement& e = m_arrangement->pieces()[piece];
    const Index run = m_runOfPiece[piece];
    const Index standIn = m_fans->standIn(run);
    if (standIn == run) return windingOf(e, p);
    const Run& other = m_arrangement->runs()[standIn];
    const int winding = windingOf(m_arrangement->pieces()[other.first], p);
    return other.from == m_arrangement->runs()[run].from ? winding : -winding;
}

void Windings::raiseBoxes() {
    const auto& pieces = m_arrangement->pieces();
    m_boxes.begin(pieces.size());
    m_runOfPiece.resize(pieces.size());
    for (Index run = 0; run < m_arrangement->runs().size(); ++run) {
        const Run& r = m_arrangement->runs()[run];
        for (Index i = r.first; i < r.last; ++i) {
            m_runOfPiece[i] = run;
            m_boxes.add(boxAbout(pieces[i]).grown(m_arrangement->tolerance()));
        }
    }
    m_boxes.finish();
    m_strands.clear();
    for (const Strand& strand : m_arrangement->strandsCut())
        m_strands.endChain(strand.last);
}

bool Windings::spreadFrom(Index run) {
    m_waiting.clear();
    m_waiting.push_back(leaving(run, false));
    m_waiting.push_back(leaving(run, true));
    while (!m_waiting.empty()) {
        const Half half = m_waiting.back();
        m_waiting.pop_back();
        const Index node = m_fans->fromNode(half);
        if (m_isDone[node] != 0) continue;
        m_isDone[node] = 1;
        if (carryRound(node, half)) continue;
        m_conflict = m_arrangement->nodes()[node];
        return false;
    }
    return true;
}

/// Goes counter-clockwise once round a node from a half whose numbers are known.
bool Windings::carryRound(Index node, Half known) {
    const Fan fan = m_fans->at(node);
    std::size_t start = 0;
    while (fan.first[start] != known)
        ++start;
    const Index knownRun = runOf(known);
    // What lies clockwise of a half is on its right as it leaves.
    Weight between = leavesEnd(known) ? onRight(knownRun) : onLeft(knownRun);
    for (std::size_t step = 1; step < fan.size(); ++step) {
        const Half half = fan.first[(start + step) % fan.size()];
        if (!carryTo(half, between)) return false;
        between = leavesEnd(half) ? onRight(runOf(half)) : onLeft(runOf(half));
    }
    return between == (leavesEnd(known) ? onLeft(knownRun) : onRight(knownRun));
}

bool Windings::carryTo(Half half, Weight clockwiseOfIt) {
    const Index run = runOf(half);
    const Weight right = leavesEnd(half) ? clockwiseOfIt - m_fans->weight(run) : clockwiseOfIt;
    if (m_isKnown[run] != 0) return m_right[run] == right;
    m_isKnown[run] = 1;
    m_right[run] = right;
    const double squared = squaredChord(m_fans->firstPiece(half));
    if (squared > m_longestSquared) {
        m_longestSquared = squared;
        m_longest = run;
    }
    m_waiting.push_back(half ^ 1u);
    return true;
}

}  // namespace gmregion
