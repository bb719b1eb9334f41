// SPDX-License-Identifier: MIT
/// @file
/// The longest fits, one after the other.
///
/// From a vertex, the run that one arc stands for is made twice as long until no arc fits, and then
/// the longest is found by halving. Noise lets a run fail whose double fits, most where it is
/// short; so one failure does not end it. Where joints are tangent two arcs are tried as well, and
/// taken if they get farther than one arc after another. No arc goes over a corner.
///
/// The longest fit takes the first bit of what follows along: a long segment and the first chords
/// of the rounding behind it become one arc of huge radius, and what is left for the last fit may
/// be a chord across the tolerance. So, last to first, the longest fit from behind is sought as
/// well; the vertex may be anywhere between both, and of some places there that with the least jump
/// is taken. That is where the roundings begin, and where arcs are nearly tangent.
#include "region/simplify/LongestFit.h"

#include <algorithm>
#include <cmath>

#include "region/simplify/Biarc.h"
#include "region/simplify/CircleFit.h"
#include "region/simplify/Joints.h"

namespace gmregion {

namespace {

/// What stands for a run: one or two pieces.
struct Span {
    std::size_t from = 0;
    std::size_t to = 0;
    std::size_t count = 0;
    std::array<Piece, 2> pieces;
};

/// After how many failures to stop, with nothing that fits so far and otherwise.
constexpr std::size_t kFirstFailures = 8;
constexpr std::size_t kLaterFailures = 2;
/// How many places are tried for a vertex between two fits.
constexpr std::size_t kPlaces = 8;

/// The tangent of half the angle between two unit directions.
double jumpOf(Vec2 a, Vec2 b) {
    const double along = 1.0 + dot(a, b);
    return along > 0.0 ? std::fabs(cross(a, b)) / along : HUGE_VAL;
}

class Fitter {
public:
    Fitter(const Chain& chain, const Limits& limits) : m_chain(chain), m_limits(limits) {}

    /// The spans from one vertex to another, none over a corner.
    std::vector<Span> fitted(std::size_t from, std::size_t to) const;

private:
    PieceRun runOf(std::size_t from, std::size_t to) const { return {m_chain, m_limits, from, to}; }
    Span oneArc(std::size_t from, std::size_t to) const;
    Span twoArcs(std::size_t from, std::size_t to) const;
    Span longestArc(std::size_t from, std::size_t end) const;
    Span next(std::size_t from, std::size_t end) const;
    std::size_t endOfStretch(std::size_t from, std::size_t to) const;
    bool isCorner(std::size_t joint) const {
        return m_chain.joints[joint].kind == JointKind::kCorner;
    }
    void balance(Span& before, Span& behind) const;

    const Chain& m_chain;
    const Limits& m_limits;
};

/// Without pieces when nothing fits.
Span Fitter::oneArc(std::size_t from, std::size_t to) const {
    Span span{from, to, 0, {}};
    if (to == from + 1) {
        span.count = 1;
        span.pieces[0] = m_chain.pieces[from];
    } else if (const auto arc = fitArc(runOf(from, to))) {
        span.count = 1;
        span.pieces[0] = *arc;
    }
    return span;
}

Span Fitter::twoArcs(std::size_t from, std::size_t to) const {
    Span span{from, to, 0, {}};
    const bool isTangent = m_chain.joints[from].kind == JointKind::kTangent ||
                           m_chain.joints[to].kind == JointKind::kTangent;
    if (!isTangent) return span;
    if (const auto arcs = fitBiarc(runOf(from, to))) {
        span.count = 2;
        span.pieces = *arcs;
    }
    return span;
}

/// The longest span that `fit` makes of a number of pieces, from two up to `most`; without pieces
/// when there is none.
template <class Fit>
Span longest(std::size_t most, const Fit& fit) {
    Span best;
    std::size_t fits = 1;
    std::size_t fails = most + 1;
    std::size_t failures = 0;
    const auto tried = [&](std::size_t size) {
        const Span span = fit(size);
        if (span.count == 0) return false;
        best = span;
        fits = size;
        return true;
    };
    std::size_t size = std::min<std::size_t>(2, most);
    while (size > 1 && failures < (best.count == 0 ? kFirstFailures : kLaterFailures)) {
        if (tried(size)) {
            fails = most + 1;
            failures = 0;
        } else if (failures++ == 0) {
            fails = size;
        }
        if (size == most) break;
        size = std::min(2 * size, most);
    }
    while (fails - fits > 1) {
        size = fits + (fails - fits) / 2;
        if (!tried(size)) fails = size;
    }
    return best;
}

Span Fitter::longestArc(std::size_t from, std::size_t end) const {
    const Span span =
        longest(end - from, [&](std::size_t size) { return oneArc(from, from + size); });
    return span.count > 0 ? span : oneArc(from, from + 1);
}

Span Fitter::next(std::size_t from, std::size_t end) const {
    const Span single = longestArc(from, end);
    if (single.to == end) return single;
    const Span pair =
        longest(end - from, [&](std::size_t size) { return twoArcs(from, from + size); });
    if (pair.count == 0 || pair.to <= single.to + 1) return single;
    return longestArc(single.to, end).to >= pair.to ? single : pair;
}

/// The first vertex behind `from` that is a corner, `to` at the latest.
std::size_t Fitter::endOfStretch(std::size_t from, std::size_t to) const {
    std::size_t end = from + 1;
    while (end < to && !isCorner(end))
        ++end;
    return end;
}

std::vector<Span> Fitter::fitted(std::size_t from, std::size_t to) const {
    std::vector<Span> spans;
    while (from < to) {
        const std::size_t end = endOfStretch(from, to);
        while (from < end) {
            spans.push_back(next(from, end));
            from = spans.back().to;
        }
    }
    for (std::size_t i = spans.size(); i > 1; --i)
        balance(spans[i - 2], spans[i - 1]);
    return spans;
}

/// Moves the vertex between two spans to where the jump is least, of some places between the
/// longest fit from before and the longest from behind.
void Fitter::balance(Span& before, Span& behind) const {
    if (before.count != 1 || behind.count != 1 || isCorner(behind.from)) return;
    double least = jumpOf(before.pieces[0].endDir, behind.pieces[0].startDir);
    if (least <= m_limits.smooth) return;
    const std::size_t from = before.from;
    const std::size_t high = behind.from;
    const std::size_t to = behind.to;
    const Span back =
        longest(to - from - 1, [&](std::size_t size) { return oneArc(to - size, to); });
    const std::size_t low = back.count > 0 ? back.from : high;
    if (low >= high) return;
    std::size_t joint = high;
    for (std::size_t i = 0; i < kPlaces; ++i) {
        const std::size_t place = low + (high - low) * i / kPlaces;
        if (place == joint) continue;
        joint = place;
        const Span one = oneArc(from, joint);
        const Span two = oneArc(joint, to);
        if (one.count == 0 || two.count == 0) continue;
        const double jump = jumpOf(one.pieces[0].endDir, two.pieces[0].startDir);
        if (!(jump < least)) continue;
        least = jump;
        before = one;
        behind = two;
    }
}

std::size_t countOf(const std::vector<Span>& spans) {
    std::size_t count = 0;
    for (const Span& span : spans)
        count += span.count;
    return count;
}

std::size_t longestPiece(const Chain& chain) {
    std::size_t longest = 0;
    double most = 0.0;
    for (std::size_t i = 0; i < chain.pieces.size(); ++i) {
        const Vec2 chord = chain.pieces[i].e.ep - chain.pieces[i].e.sp;
        if (dot(chord, chord) <= most) continue;
        most = dot(chord, chord);
        longest = i;
    }
    return longest;
}

void append(const std::vector<Span>& spans, std::vector<Piece>& result) {
    for (const Span& span : spans)
        result.insert(result.end(), span.pieces.begin(),
                      span.pieces.begin() + std::ptrdiff_t(span.count));
}

/// A closed chain without corners: from its longest piece, and once more from the first vertex that
/// came out of that, which is one that the shape asks for.
void makeLoopFew(Chain& chain, const Limits& limits, std::vector<Piece>& result) {
    if (const auto circle = fitCircle(chain, limits)) {
        result.assign(circle->begin(), circle->end());
        return;
    }
    turnTo(chain, longestPiece(chain));
    const Fitter fitter(chain, limits);
    const std::vector<Span> spans = fitter.fitted(0, chain.pieces.size());
    turnTo(chain, spans.front().to % chain.pieces.size());
    const std::vector<Span> turned = fitter.fitted(0, chain.pieces.size());
    append(countOf(turned) <= countOf(spans) ? turned : spans, result);
}

}  // namespace

void makeFew(Chain& chain, const Limits& limits, std::vector<Piece>& result) {
    result.clear();
    const std::size_t corner = chain.closed ? firstCorner(chain) : 0;
    if (corner == chain.pieces.size()) {
        makeLoopFew(chain, limits, result);
        return;
    }
    if (chain.closed) turnTo(chain, corner);
    append(Fitter(chain, limits).fitted(0, chain.pieces.size()), result);
}

}  // namespace gmregion
