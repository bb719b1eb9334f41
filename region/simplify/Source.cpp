// SPDX-License-Identifier: MIT
#include "region/simplify/Source.h"

#include <algorithm>
#include <cmath>

#include "region/simplify/Directions.h"

namespace gmregion {

namespace {

/// Where the ends of arcs were rounded, so were the directions of their joints; two arcs at one
/// joint, each off by a quarter, jump by half of what counts as none.
constexpr double kBendShare = 0.25;
constexpr double kLargest = 1e12;
constexpr double kRoundingShare = 1.0 / 17592186044416.0;  // 2^-44

/// By how much the points of an arc may move when its start moves by `gap`, in similar shape.
double moveOf(const Element& e, double gap) {
    const double b = std::fabs(e.bulge);
    return b > 1.0 ? gap * (1.0 + b * b) / (2.0 * b) : gap;
}

void appendPieces(const Element& e, std::uint32_t source, double slack,
                  std::vector<Piece>& pieces) {
    if (std::fabs(e.bulge) <= 1.0) {
        pieces.push_back(pieceOf(e, source));
        pieces.back().slack = slack;
        return;
    }
    const Parts parts = halved(e);
    for (const Element& half : {parts.first, parts.second}) {
        pieces.push_back(pieceOf(half, source));
        pieces.back().slack = slack;
        pieces.back().part = half.sp == e.sp ? Part::kFirstHalf : Part::kSecondHalf;
        pieces.back().wholeBulge = e.bulge;
    }
}

}  // namespace

Reason faultOf(Point p) {
    if (!std::isfinite(p.x) || !std::isfinite(p.y)) return Reason::kNotFinite;
    return std::max(std::fabs(p.x), std::fabs(p.y)) <= kLargest ? Reason::kNone
                                                                : Reason::kOutOfRange;
}

Refusal limitsFor(const SimplifyOptions& options, double largest, Limits& limits) {
    limits.rounding = largest * kRoundingShare;
    limits.tolerance = options.tolerance;
    limits.corner = options.corner;
    limits.smooth = options.smooth;
    limits.bend = kBendShare * options.smooth;
    const bool isExact = options.tolerance == 0.0;
    if (!(options.tolerance >= limits.rounding || isExact) || !(options.tolerance >= 0.0) ||
        !(options.tolerance <= kLargest))
        return {Reason::kTolerance, {}, 0};
    if (!(options.corner > 0.0 && options.corner <= 1.0) ||
        !(options.smooth >= 0.0 && options.smooth <= options.corner))
        return {Reason::kOutOfRange, {}, 0};
    return {};
}

Refusal measure(const Paths& paths, double& largest) {
    largest = 0.0;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        for (const Element& e : paths[i]) {
            for (const Point p : {e.sp, e.ep}) {
                const Reason reason = faultOf(p);
                if (reason != Reason::kNone)
                    return {reason, reason == Reason::kNotFinite ? Point{} : p, i};
                largest = std::max({largest, std::fabs(p.x), std::fabs(p.y)});
            }
            if (!std::isfinite(e.bulge)) return {Reason::kNotFinite, e.sp, i};
            if (std::fabs(e.bulge) > kLargest) return {Reason::kOutOfRange, e.sp, i};
        }
    }
    return {};
}

// Halves move together.
void endAt(Vec2 p, std::vector<Piece>& pieces) {
    Piece last = pieces.back();
    // By the points: the length of a gap far below rounding is 0.
    if (p == last.e.ep) return;
    const double gap = lengthOf(p - last.e.ep);
    Element whole{last.e.sp, p, last.e.bulge};
    pieces.pop_back();
    if (last.part == Part::kSecondHalf) {
        whole = {pieces.back().e.sp, p, last.wholeBulge};
        pieces.pop_back();
    }
    appendPieces(whole, last.first, last.slack + moveOf(whole, gap), pieces);
}

Refusal takePath(const PathView& path, std::size_t number, const Limits& limits, Chain& chain) {
    chain.clear();
    chain.closed = path.closed;
    if (path.size() == 0) return {};
    const double widest = std::max(limits.tolerance, limits.rounding);
    Vec2 at = path.first->sp;
    Vec2 before = at;
    for (std::size_t i = 0; i < path.size(); ++i) {
        const Element& e = path.first[i];
        if (!(lengthOf(e.sp - before) <= widest)) return {Reason::kGap, before, number};
        before = e.ep;
        if (lengthOf(e.ep - at) <= limits.rounding || e.sp == e.ep) continue;
        const double slack = moveOf(e, lengthOf(e.sp - at));
        appendPieces({at, e.ep, e.bulge}, static_cast<std::uint32_t>(i), slack, chain.pieces);
        at = e.ep;
    }
    const Vec2 end = path.closed ? path.first->sp : before;
    if (!(lengthOf(end - before) <= widest)) return {Reason::kGap, before, number};
    if (chain.pieces.empty()) return {};
    endAt(end, chain.pieces);
    for (const Piece& piece : chain.pieces) {
        if (!(piece.slack <= widest)) return {Reason::kGap, piece.e.sp, number};
    }
    // What was no longer than the gap that it was closed over has no length any more.
    const auto isPoint = [](const Piece& piece) { return piece.e.sp == piece.e.ep; };
    chain.pieces.erase(std::remove_if(chain.pieces.begin(), chain.pieces.end(), isPoint),
                       chain.pieces.end());
    return {};
}

}  // namespace gmregion
