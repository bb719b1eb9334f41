// SPDX-License-Identifier: MIT
/// @file
/// The loops of a set as contours of the kernel.
///
/// The kernel counts points as one within its length tolerance, a set within one that is usually
/// far finer. So what is too short is taken out first, then the loop is begun where an offset of
/// the kernel would begin, and at last pieces of one arc become one arc. Linear in the elements.

#include "gmbridge/SetContours.h"

#include <algorithm>
#include <cmath>
#include <tuple>

#include "bridge/ArcCentre.h"
#include "gmbridge/Curves.h"
#include "gmkernel/GmArc.h"

namespace gmbridge {

using gmregion::Element;
using gmregion::Origin;
using gmregion::OriginKind;
using gmregion::Point;
using gmregion::RegionSet;

namespace {

/// An element of a loop and what it comes from.
struct Piece {
    Element element;
    Origin origin;
    std::optional<ContourElement> source;

    long id() const { return source ? source->id : 0; }
};

using Pieces = std::vector<Piece>;

double chordOf(const Element& e) {
    return std::hypot(e.ep.x - e.sp.x, e.ep.y - e.sp.y);
}

/// Ends a tolerance apart in both coordinates may be told apart, but not after they have moved.
bool isShort(const Element& e) {
    return chordOf(e) < 2.0 * GmBase::m_scdPrec;
}

Pieces piecesOf(const gmregion::Parallels& parallels, const gmregion::ParallelPart& part,
                const ContourPaths& sources) {
    Pieces pieces;
    for (std::size_t i = part.first; i < part.last; ++i) {
        const Element& e = parallels.elements[i];
        const Origin& origin = parallels.origins[i];
        pieces.push_back({e, origin, sources.sourceOf(e, origin)});
    }
    return pieces;
}

Pieces piecesOf(const RegionSet& set, const gmregion::Loop& loop, const ContourPaths& sources,
                bool reversed) {
    Pieces pieces;
    for (std::size_t i = loop.first; i < loop.last; ++i)
        pieces.push_back({set.elements()[i], *set.origins(i).begin(), sources.sourceOf(set, i)});
    if (!reversed) return pieces;
    std::reverse(pieces.begin(), pieces.end());
    for (Piece& piece : pieces)
        piece.element = {piece.element.ep, piece.element.sp, -piece.element.bulge};
    return pieces;
}

/// Takes out what is short: the piece behind starts where the short one started, so that a row of
/// them does not add up. The ends stay where they are.
/// @returns where something was taken out
std::vector<GmPoint> takeOutShort(Pieces& pieces) {
    std::vector<GmPoint> places;
    Pieces kept;
    const Point end = pieces.back().element.ep;
    Point sp = pieces.front().element.sp;
    for (Piece& piece : pieces) {
        piece.element.sp = sp;
        if (isShort(piece.element)) {
            places.push_back(kernelPoint(sp));
            continue;
        }
        sp = piece.element.ep;
        kept.push_back(piece);
    }
    while (!kept.empty() && kept.back().element.ep != end) {
        Element& last = kept.back().element;
        last.ep = end;
        if (!isShort(last)) break;
        places.push_back(kernelPoint(last.sp));
        kept.pop_back();
    }
    pieces = std::move(kept);
    return places;
}

/// The same of a loop, where the longest piece comes first, so that it is there to stay. Leaves
/// nothing of a loop that is then no loop any more.
std::vector<GmPoint> takeOutShortOfLoop(Pieces& pieces) {
    const auto isShorter = [](const Piece& a, const Piece& b) {
        return chordOf(a.element) < chordOf(b.element);
    };
    std::rotate(pieces.begin(), std::max_element(pieces.begin(), pieces.end(), isShorter),
                pieces.end());
    std::vector<GmPoint> places = takeOutShort(pieces);
    const bool isFold =
        pieces.size() == 2 && pieces.front().element.bulge == -pieces.back().element.bulge;
    if (pieces.size() < 2 || isFold) pieces.clear();
    return places;
}

/// Whether a piece goes on with the arc of the piece before it.
bool goesOn(const Piece& before, const Piece& piece) {
    if (!(before.element.bulge * piece.element.bulge > 0.0)) return false;
    if (before.origin.kind != piece.origin.kind) return false;
    if (before.source && piece.source) {
        return before.source->contour == piece.source->contour &&
               before.source->index == piece.source->index;
    }
    return !before.source && !piece.source && before.origin.path == piece.origin.path &&
           before.origin.element == piece.origin.element;
}

/// Begins a loop with the lowest identifier, where the pieces that carry it begin, of several such
/// places at the first in its source; within an arc only where all is one arc.
void beginAtLowest(Pieces& pieces) {
    using Rank = std::tuple<bool, long, bool, std::int64_t, std::uint32_t>;
    const auto rank = [&](std::size_t i) {
        const Piece& piece = pieces[i];
        const Piece& before = pieces[i == 0 ? pieces.size() - 1 : i - 1];
        return Rank{goesOn(before, piece), piece.id(), before.id() == piece.id(), piece.origin.path,
                    piece.origin.element};
    };
    std::size_t lowest = 0;
    for (std::size_t i = 1; i < pieces.size(); ++i) {
        if (rank(i) < rank(lowest)) lowest = i;
    }
    std::rotate(pieces.begin(), pieces.begin() + static_cast<std::ptrdiff_t>(lowest), pieces.end());
}

/// The arc that pieces of it make together; null where the kernel would take it for a full circle
/// that it is not.
std::unique_ptr<GmCurve> joinedArc(const Piece* first, const Piece* last) {
    const Point sp = first->element.sp;
    const Point ep = (last - 1)->element.ep;
    if (sp != ep && kernelPoint(sp) == kernelPoint(ep)) return nullptr;
    const Piece* const longest = std::max_element(first, last, [](const Piece& a, const Piece& b) {
        return chordOf(a.element) < chordOf(b.element);
    });
    const auto rot = first->element.bulge > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW;
    return std::make_unique<GmArc>(kernelPoint(sp), kernelPoint(ep),
                                   kernelPoint(centreOf(longest->element)), rot);
}

void append(GmContour& contour, const GmCurve& curve, const Piece& piece) {
    if (!contour.AddElement(curve, false, piece.id())) return;
    const auto last = static_cast<int>(contour.ElementCount() - 1);
    contour.GetContElement(last)->bInserted = piece.origin.kind == OriginKind::kCorner;
}

std::unique_ptr<GmContour> contourOf(const Pieces& pieces) {
    auto contour = std::make_unique<GmContour>();
    const Piece* const end = pieces.data() + pieces.size();
    for (const Piece* first = pieces.data(); first != end;) {
        const Piece* last = first + 1;
        while (last != end && goesOn(*(last - 1), *last))
            ++last;
        const auto joined = last - first > 1 ? joinedArc(first, last) : nullptr;
        if (joined) append(*contour, *joined, *first);
        for (; !joined && first != last; ++first)
            append(*contour, *curveOf(first->element), *first);
        first = last;
    }
    return contour;
}

/// Appends a loop or a curve as a contour, or as lost.
void append(SetContours& result, Pieces& pieces, bool isLoop, std::size_t region, bool hole) {
    const GmPoint at = kernelPoint(pieces.front().element.sp);
    const std::vector<GmPoint> places = isLoop ? takeOutShortOfLoop(pieces) : takeOutShort(pieces);
    if (pieces.empty()) {
        result.lost.push_back(at);
        return;
    }
    if (isLoop) beginAtLowest(pieces);
    result.closedUp.insert(result.closedUp.end(), places.begin(), places.end());
    result.loops.push_back({contourOf(pieces), region, hole});
}

}  // namespace

SetContours contoursOf(const RegionSet& set, const ContourPaths& sources,
                       GmBase::eRotDir outlines) {
    SetContours result;
    for (const gmregion::Loop& loop : set.loops()) {
        Pieces pieces = piecesOf(set, loop, sources, outlines == GmBase::eRotCW);
        append(result, pieces, true, loop.region, loop.hole);
    }
    return result;
}

SetContours contoursOf(const gmregion::Parallels& parallels, const ContourPaths& sources) {
    SetContours result;
    for (const gmregion::ParallelPart& part : parallels.parts) {
        Pieces pieces = piecesOf(parallels, part, sources);
        append(result, pieces, part.closed, result.loops.size(), false);
    }
    return result;
}

}  // namespace gmbridge
