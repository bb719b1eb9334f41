// SPDX-License-Identifier: MIT
/// @file
/// From loose pieces to the chain of one result.
///
/// Pieces that bound one result start where others end, up to rounding, so a chain grows by the
/// piece that starts at its end. Where several do, one that leads on is preferred to a dead end;
/// the choice is never taken back, so that where results touch each other a piece may go to the
/// wrong one. A chain starts at the smallest identifier, for results in the order of the source.
///
/// Pieces are found by two indexes made once, by identifier and by the cell of the start point;
/// what has been taken is passed over. Where many pieces start at one point, each joint there looks
/// at all of them.
#include "kernel/contour/offset/Chaining.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace gmkernel_detail {

namespace {

/// The end of a chain and the start of the next piece lie nearer than this, in length units.
double jointGap() {
    constexpr double kTolerances = 3.0;
    return kTolerances * GmBase::m_scdPrec;
}

/// Pieces below this length are left out of the results, in length units.
constexpr double kShortestPiece = 0.001;

}  // namespace

Chaining::Chaining(std::vector<Piece const*> pieces)
    : m_pieces(std::move(pieces)),
      m_left(m_pieces.size()),
      m_taken(m_pieces.size(), false),
      m_byId(m_pieces.size()),
      m_starts(jointGap()) {
    for (std::size_t number = 0; number < m_pieces.size(); ++number)
        m_starts.add(startOf(curve(number)), number);
    m_starts.order();
    std::iota(m_byId.begin(), m_byId.end(), std::size_t{0});
    std::stable_sort(m_byId.begin(), m_byId.end(),
                     [this](std::size_t a, std::size_t b) { return id(a) < id(b); });
}

Chaining::Chain Chaining::takeChain() {
    Numbers numbers = growBackward(takeFirst());
    growForward(numbers);
    Chain chain;
    for (const std::size_t number : numbers) {
        if (!(lengthOf(curve(number)) < kShortestPiece)) chain.push_back(m_pieces[number]);
    }
    return chain;
}

void Chaining::take(std::size_t number) {
    m_taken[number] = true;
    --m_left;
}

/// The piece with the smallest identifier, the first of equals.
std::size_t Chaining::takeFirst() {
    while (m_taken[m_byId[m_first]])
        ++m_first;
    take(m_byId[m_first]);
    return m_byId[m_first];
}

/// One walk through the pieces with the identifier of the first one.
Chaining::Numbers Chaining::growBackward(std::size_t first) {
    const int smallest = id(first);
    Numbers chain{first};
    for (std::size_t i = m_first; i < m_byId.size() && id(m_byId[i]) == smallest; ++i) {
        const std::size_t number = m_byId[i];
        if (m_taken[number]) continue;
        Vec3 const& start = startOf(curve(chain.back()));
        if (!isSamePoint(endOf(curve(number)), start)) continue;
        take(number);
        chain.push_back(number);
    }
    std::reverse(chain.begin(), chain.end());
    return chain;
}

/// Goes on by the only piece that starts at the end, or of several by the first that leads on to
/// another piece, else by the first.
void Chaining::growForward(Numbers& chain) {
    while (true) {
        collectStartsAt(endOf(curve(chain.back())), m_next);
        if (m_next.empty()) return;
        std::size_t next = m_next.front();
        if (m_next.size() > 1) {
            const auto found = std::find_if(m_next.begin(), m_next.end(),
                                            [this](std::size_t number) { return leadsOn(number); });
            if (found != m_next.end()) next = *found;
        }
        take(next);
        chain.push_back(next);
    }
}

bool Chaining::startsAt(std::size_t number, Vec3 const& p) const {
    // The start of an arc may lie so far off its circle that it is outside the box.
    return !m_taken[number] && boxOf(planePoint(p)).overlaps(m_pieces[number]->reach()) &&
           distance(startOf(curve(number)), p) < jointGap();
}

/// The pieces left that start at a point, in the order of the list.
void Chaining::collectStartsAt(Vec3 const& p, Numbers& numbers) const {
    m_starts.collectNear(p, numbers);
    const auto isElsewhere = [&](std::size_t number) { return !startsAt(number, p); };
    numbers.erase(std::remove_if(numbers.begin(), numbers.end(), isElsewhere), numbers.end());
}

bool Chaining::leadsOn(std::size_t number) {
    collectStartsAt(endOf(curve(number)), m_further);
    return !m_further.empty();
}

bool hasOffset(Chaining::Chain const& chain) {
    return std::any_of(chain.begin(), chain.end(),
                       [](Piece const* piece) { return !isAuxiliary(piece->role()); });
}

}  // namespace gmkernel_detail
