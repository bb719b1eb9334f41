// SPDX-License-Identifier: MIT
/// @file
/// From loose paths to contours.
///
/// Ends are joined in pairs first, all over the drawing (`joinEnds`); then every piece has at most
/// one follower at either end, and walking along them cannot go wrong: open chains from their free
/// ends, what is left is rings. A joined contour gets a start and a sense of its own, so that the
/// order in which a drawing holds its pieces does not matter. Crossing contours are not taken
/// apart. Nearly linear in the elements.

#include "drawing/contours/ChainBuilder.h"

#include <algorithm>
#include <optional>

#include "drawing/contours/Duplicates.h"
#include "drawing/contours/Junctions.h"
#include "drawing/contours/Overlaps.h"
#include "part/model/Area.h"
#include "part/model/ShortElements.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Element;
using gmregion::Vec2;

namespace {

/// A contour and the index of its earliest piece in the drawing.
struct OrderedContour {
    std::size_t earliest;
    Path path;
};

std::size_t dropShort(std::vector<Path>& paths, double shortest) {
    std::size_t dropped = 0;
    for (Path& path : paths) {
        const std::size_t before = path.elements.size();
        dropped += before - dropShortElements(path, shortest).size();
    }
    const auto empty = [](const Path& path) { return path.elements.empty(); };
    paths.erase(std::remove_if(paths.begin(), paths.end(), empty), paths.end());
    return dropped;
}

/// Start and sense that depend on the course of a joined contour only.
Path canonical(Path path) {
    if (!path.closed) {
        return path.elements.back().ep < path.elements.front().sp ? reversed(path) : path;
    }
    if (signedArea(path) < 0.0) path = reversed(path);
    const auto leftmost =
        std::min_element(path.elements.begin(), path.elements.end(),
                         [](const Element& a, const Element& b) { return a.sp < b.sp; });
    std::rotate(path.elements.begin(), leftmost, path.elements.end());
    return path;
}

/// Walks along joined ends and collects the pieces into chains.
class Walk {
public:
    Walk(std::vector<Path> pieces, double tolerance, MendReport& mended)
        : m_mended(mended),
          m_pieces(std::move(pieces)),
          m_joined(joinEnds(m_pieces, tolerance)),
          m_used(m_pieces.size(), false) {}

    /// Chains with the index of their earliest piece. Open chains are walked from a free end;
    /// what is left then are rings.
    std::vector<OrderedContour> chains() {
        std::vector<OrderedContour> result;
        for (PathEnd end = 0; end < m_joined.size(); ++end) {
            if (!m_joined[end] && !m_used[pathOf(end)]) result.push_back(chainFrom(end));
        }
        for (std::size_t i = 0; i < m_pieces.size(); ++i) {
            if (!m_used[i]) result.push_back(chainFrom(startOf(i)));
        }
        return result;
    }

private:
    OrderedContour chainFrom(PathEnd first) {
        OrderedContour chain{pathOf(first), {{}, false, m_pieces[pathOf(first)].layer}};
        std::size_t pieces = 0;
        std::optional<PathEnd> end = first;
        while (end && !m_used[pathOf(*end)]) {
            const std::size_t piece = pathOf(*end);
            append(chain.path, isStart(*end) ? m_pieces[piece] : reversed(m_pieces[piece]));
            chain.earliest = std::min(chain.earliest, piece);
            m_used[piece] = true;
            ++pieces;
            end = m_joined[otherEnd(*end)];
        }
        chain.path.closed = end.has_value();
        countGaps(chain.path);
        meetEnds(chain.path);
        if (pieces > 1) chain.path = canonical(std::move(chain.path));
        return chain;
    }

    static void append(Path& chain, const Path& piece) {
        chain.elements.insert(chain.elements.end(), piece.elements.begin(), piece.elements.end());
    }

    void countGaps(const Path& chain) {
        const std::vector<Element>& elements = chain.elements;
        for (std::size_t i = chain.closed ? 0 : 1; i < elements.size(); ++i) {
            const Vec2 before = elements[i == 0 ? elements.size() - 1 : i - 1].ep;
            if (elements[i].sp == before) continue;
            ++m_mended.gaps;
            m_mended.largestGap = std::max(m_mended.largestGap, distance(before, elements[i].sp));
        }
    }

    MendReport& m_mended;
    std::vector<Path> m_pieces;
    std::vector<std::optional<PathEnd>> m_joined;
    std::vector<bool> m_used;
};

/// The contours of all paths in drawing order; closed paths are contours as they stand.
std::vector<Path> joinOpenPaths(std::vector<Path> paths, double tolerance, MendReport& mended) {
    std::vector<OrderedContour> contours;
    std::vector<Path> open;
    std::vector<std::size_t> placeInDrawing;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        if (paths[i].closed) {
            contours.push_back({i, std::move(paths[i])});
        } else {
            open.push_back(std::move(paths[i]));
            placeInDrawing.push_back(i);
        }
    }
    for (OrderedContour& chain : Walk(std::move(open), tolerance, mended).chains()) {
        contours.push_back({placeInDrawing[chain.earliest], std::move(chain.path)});
    }
    std::sort(contours.begin(), contours.end(),
              [](const auto& a, const auto& b) { return a.earliest < b.earliest; });
    std::vector<Path> result;
    for (OrderedContour& contour : contours)
        result.push_back(std::move(contour.path));
    return result;
}

}  // namespace

ChainResult buildChains(std::vector<Path> paths, double tolerance, double shortest) {
    ChainResult result;
    result.shortElements = dropShort(paths, shortest);
    result.duplicates = dropDuplicates(paths);
    result.contours = joinOpenPaths(std::move(paths), tolerance, result.mended);
    result.mended.overlaps = trimOverlaps(result.contours, tolerance);
    if (result.mended.overlaps > 0) {
        result.contours = joinOpenPaths(std::move(result.contours), tolerance, result.mended);
    }
    // Ends that were moved to meet may have left an element too short.
    result.shortElements += dropShort(result.contours, shortest);
    return result;
}

}  // namespace gmdrawing
