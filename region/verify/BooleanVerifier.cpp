// SPDX-License-Identifier: MIT
/// @file
/// Booleans, checked by areas and by points.
///
/// Beside the boundaries of operands and result, on both sides of the middle of every piece, the
/// windings of the operands say what must be covered. A point within some tolerances of a boundary
/// of an operand is not asked. Every piece of the result must have its ends and its middle on
/// boundaries of the operands.
///
/// The area of the common part comes from the operands alone: their elements are cut at each other,
/// and those parts that lie inside the other operand sweep it, parts that both share being counted
/// once, and not at all where the operands lie to different sides. The areas of all four
/// combinations follow by inclusion and exclusion.
#include "region/verify/BooleanVerifier.h"

#include <algorithm>
#include <cmath>

#include "region/plane/Crossing.h"
#include "region/plane/ElementHalves.h"
#include "region/plane/ElementWinding.h"
#include "region/plane/Measures.h"
#include "region/verify/LoopCheck.h"

namespace gmregion {

namespace {

/// In tolerances: how far beside the true boundary that of a result may be.
constexpr double kMargin = 4.0;
/// In margins: how far beside a boundary points are asked.
constexpr double kBeside = 4.0;

bool covers(Combination combination, bool first, bool second) {
    switch (combination) {
        case Combination::kUnion:
            return first || second;
        case Combination::kIntersection:
            return first && second;
        case Combination::kDifference:
            return first && !second;
        case Combination::kSymmetricDifference:
            return first != second;
    }
    return false;
}

double sweptArea(const LoopsView& view, Vec2 about) {
    double twice = 0.0;
    for (const Element& e : *view.elements)
        twice += sweptTwice(e, about);
    return 0.5 * twice;
}

double lengthOf(const LoopsView& view) {
    double sum = 0.0;
    for (const Element& e : *view.elements)
        sum += lengthAlong(e);
    return sum;
}

/// The parts of a piece between its crossings with others, and where others end on it.
std::vector<Element> partsOf(const BoundaryPiece& piece, const Box& box,
                             const BoundaryIndex& others, double within) {
    std::vector<std::pair<double, Vec2>> cuts{{0.0, piece.sp}, {1.0, piece.ep}};
    const auto add = [&](Vec2 crossing) {
        // Where both run along each other crossings are anywhere; on the piece they do no harm.
        // The foot from far away is rounded, its own foot is not.
        const Vec2 p = footOn(piece.carrier, footOn(piece.carrier, crossing));
        const double place = placeOn(piece, p);
        if (place > 0.0 && place < 1.0) cuts.emplace_back(place, p);
    };
    others.boxes().visitOverlapping(box.grown(within), [&](std::size_t i) {
        const BoundaryPiece& other = others.pieces()[i];
        for (const Vec2 p : crossings(piece.carrier, other.carrier))
            add(p);
        if (std::fabs(signedDistance(piece.carrier, other.sp)) <= within) add(other.sp);
    });
    std::sort(cuts.begin(), cuts.end(),
              [](const auto& a, const auto& b) { return a.first < b.first; });
    std::vector<Element> parts;
    for (std::size_t i = 1; i < cuts.size(); ++i) {
        const Vec2 a = cuts[i - 1].second;
        const Vec2 b = cuts[i].second;
        if (a == b) continue;
        parts.push_back({a, b, piece.bulge == 0.0 ? 0.0 : bulgeBetween(piece.carrier, a, b)});
    }
    return parts;
}

}  // namespace

void BooleanVerifier::verify(const LoopsView& first, const LoopsView& second,
                             Combination combination, const LoopsView& result, double tolerance,
                             FaultList& faults) {
    m_combination = combination;
    m_tolerance = tolerance;
    m_margin = kMargin * tolerance;
    m_faults = &faults;
    m_first.take(first);
    m_second.take(second);
    m_result.take(result);
    checkLoops(result, m_result, tolerance, faults);
    for (const BoundaryPiece& piece : m_result.pieces())
        checkResultPiece(piece);
    for (const BoundaryPiece& piece : m_first.pieces())
        checkBeside(piece);
    for (const BoundaryPiece& piece : m_second.pieces())
        checkBeside(piece);
    checkAreas(first, second, result);
}

bool BooleanVerifier::isWanted(Vec2 p) const {
    return covers(m_combination, m_first.windingAbout(p) > 0, m_second.windingAbout(p) > 0);
}

/// Whether no boundary of an operand is so near that windings might be the other's.
bool BooleanVerifier::isClear(Vec2 p) const {
    return m_first.nearest(p, m_margin).piece == kNone &&
           m_second.nearest(p, m_margin).piece == kNone;
}

void BooleanVerifier::checkPoint(Vec2 p, std::size_t element) {
    if (!isClear(p)) return;
    if (m_result.windingAbout(p) == (isWanted(p) ? 1 : 0)) return;
    const BoundaryIndex::Near near = m_result.nearest(p, 1e100);
    m_faults->add(FaultKind::kWinding, p, near.piece == kNone ? 0.0 : near.distance, element);
}

void BooleanVerifier::checkBeside(const BoundaryPiece& piece) {
    const Vec2 p = middleOf(piece);
    const Vec2 normal = sideOf(piece.carrier, p).gradient;
    checkPoint(p + (kBeside * m_margin) * normal, piece.element);
    checkPoint(p - (kBeside * m_margin) * normal, piece.element);
}

void BooleanVerifier::checkResultPiece(const BoundaryPiece& piece) {
    for (const Vec2 p : {piece.sp, middleOf(piece)}) {
        const BoundaryIndex::Near onFirst = m_first.nearest(p, 1e100);
        const BoundaryIndex::Near onSecond = m_second.nearest(p, 1e100);
        const double away = std::min(onFirst.distance, onSecond.distance);
        if (away > m_margin) m_faults->add(FaultKind::kForeign, p, away, piece.element);
    }
    checkBeside(piece);
}

/// The middle of a part, or that of a half of it where its own is on another boundary: a part that
/// only touches the boundary there lies beside it elsewhere.
Vec2 BooleanVerifier::pointOff(const Element& part, const BoundaryIndex& other) const {
    const Vec2 middle = middleOf(part);
    if (!other.isAnyNear(middle, m_tolerance)) return middle;
    for (const Element& half : halvesOf(part)) {
        const Vec2 p = middleOf(half);
        if (!other.isAnyNear(p, m_tolerance)) return p;
    }
    return middle;
}

/// What the pieces of one operand that lie inside the other sweep.
double BooleanVerifier::commonArea(const BoundaryIndex& inner, const BoundaryIndex& outer,
                                   bool withShared, Vec2 about) const {
    double twice = 0.0;
    for (std::size_t i = 0; i < inner.pieces().size(); ++i) {
        for (const Element& part : partsOf(inner.pieces()[i], inner.boxes()[i], outer, m_margin)) {
            const Vec2 p = pointOff(part, outer);
            const BoundaryIndex::Near near = outer.nearest(p, m_tolerance);
            bool counts = false;
            if (near.piece == kNone) {
                counts = outer.windingAbout(p) > 0;
            } else {
                const Vec2 own = sideOf(inner.pieces()[i].carrier, p).gradient;
                const Vec2 other = sideOf(outer.pieces()[near.piece].carrier, near.at).gradient;
                counts = withShared && dot(own, other) > 0.0;
            }
            if (counts) twice += sweptTwice(part, about);
        }
    }
    return 0.5 * twice;
}

void BooleanVerifier::checkAreas(const LoopsView& first, const LoopsView& second,
                                 const LoopsView& result) {
    const Vec2 about = !first.elements->empty()    ? first.elements->front().sp
                       : !second.elements->empty() ? second.elements->front().sp
                                                   : Vec2{};
    const double a = sweptArea(first, about);
    const double b = sweptArea(second, about);
    const double common =
        commonArea(m_first, m_second, true, about) + commonArea(m_second, m_first, false, about);
    double wanted = common;
    if (m_combination == Combination::kUnion) wanted = a + b - common;
    if (m_combination == Combination::kDifference) wanted = a - common;
    if (m_combination == Combination::kSymmetricDifference) wanted = a + b - 2.0 * common;
    const double off = std::fabs(sweptArea(result, about) - wanted);
    const double allowed = 2.0 * m_margin * (lengthOf(first) + lengthOf(second) + m_margin);
    if (off > allowed) m_faults->add(FaultKind::kArea, about, off, 0);
}

}  // namespace gmregion
