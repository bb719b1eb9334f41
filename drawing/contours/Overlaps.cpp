// SPDX-License-Identifier: MIT
/// @file
/// Elements that run along each other.
///
/// The longest element of all stays whole; of every other one the ranges are taken away over which
/// those before it run along it. Such a range is bounded by the ends of either element, so between
/// two bounds a look at the middle tells. That takes elements on one line or circle; those that are
/// only near to each other, within the tolerance, count there, too.

#include "drawing/contours/Overlaps.h"

#include <algorithm>
#include <cmath>
#include <numeric>
#include <optional>
#include <string_view>
#include <utility>

#include "region/search/BoxRow.h"

namespace gmdrawing {

using gmpart::kPi;
using gmpart::Path;
using gmregion::Box;
using gmregion::BoxRow;
using gmregion::Element;
using gmregion::Vec2;

namespace {

using Range = std::pair<double, double>;

/// An element and what of it nothing before it covers, as fractions of its length.
struct Piece {
    Element element;
    std::size_t path = 0;
    std::string_view layer;
    bool fixed = false;  ///< of a closed path
    double length = 0.0;
    std::vector<Range> left = {{0.0, 1.0}};
};

/// Where the point of an element nearest to p lies along it, 0 to 1.
double fractionAt(const Element& e, Vec2 p) {
    const Vec2 q = nearestPoint(e, p);
    if (!isArc(e)) {
        const Vec2 along = e.ep - e.sp;
        return std::clamp(dot(q - e.sp, along) / dot(along, along), 0.0, 1.0);
    }
    if (q == e.ep) return 1.0;
    const Vec2 m = centre(e);
    const double turn = std::atan2(cross(e.sp - m, q - m), dot(e.sp - m, q - m));
    const double total = sweep(e);
    const double positive = turn * total < 0.0 ? turn + std::copysign(2.0 * kPi, total) : turn;
    return std::clamp(positive / total, 0.0, 1.0);
}

Element partOf(const Element& e, const Range& range) {
    Element part{range.first > 0.0 ? pointAt(e, range.first) : e.sp,
                 range.second < 1.0 ? pointAt(e, range.second) : e.ep,
                 std::tan(std::atan(e.bulge) * (range.second - range.first))};
    if (!isArc(e)) part.bulge = 0.0;
    return part;
}

/// The ranges of `e` that run along `other`.
std::vector<Range> covered(const Element& e, const Element& other, double tolerance) {
    std::vector<double> bounds;
    for (const double t : {0.0, 1.0}) {
        if (distance(other, pointAt(e, t)) < tolerance) bounds.push_back(t);
    }
    for (const Vec2 p : {other.sp, other.ep}) {
        if (distance(e, p) < tolerance) bounds.push_back(fractionAt(e, p));
    }
    std::sort(bounds.begin(), bounds.end());
    std::vector<Range> ranges;
    for (std::size_t i = 0; i + 1 < bounds.size(); ++i) {
        const Vec2 middle = pointAt(e, 0.5 * (bounds[i] + bounds[i + 1]));
        if (distance(other, middle) < tolerance) ranges.emplace_back(bounds[i], bounds[i + 1]);
    }
    return ranges;
}

/// Takes a range away from others; what remains of these and is no longer than `least` goes, too.
void takeAway(std::vector<Range>& left, const Range& gone, double least) {
    std::vector<Range> remaining;
    for (const Range& range : left) {
        for (const Range& rest : {Range{range.first, std::min(range.second, gone.first)},
                                  Range{std::max(range.first, gone.second), range.second}}) {
            if (rest.second - rest.first > least) remaining.push_back(rest);
        }
    }
    left = std::move(remaining);
}

class OverlapTrimmer {
public:
    OverlapTrimmer(const std::vector<Path>& paths, double tolerance) : m_tolerance(tolerance) {
        std::vector<Box> boxes;
        for (std::size_t i = 0; i < paths.size(); ++i) {
            for (const Element& e : paths[i].elements) {
                m_pieces.push_back({e, i, paths[i].layer, paths[i].closed, length(e)});
                boxes.push_back(boundingBox(e).grown(tolerance));
            }
        }
        m_boxes.assign(boxes);
    }

    std::size_t trim() {
        std::size_t trimmed = 0;
        const std::vector<std::size_t> ranks = ranksByLength();
        for (std::size_t i = 0; i < m_pieces.size(); ++i) {
            Piece& piece = m_pieces[i];
            if (piece.fixed) continue;
            m_boxes.visitOverlapping(m_boxes[i], [&](std::size_t other) {
                const bool counts = ranks[other] < ranks[i] && m_pieces[other].layer == piece.layer;
                if (counts) cutBy(m_pieces[other].element, piece);
            });
            trimmed += isCut(piece) ? 1 : 0;
        }
        return trimmed;
    }

    /// The paths with those that were cut replaced by what is left of their elements.
    std::vector<Path> trimmedPaths(const std::vector<Path>& paths) const {
        std::vector<bool> cut(paths.size(), false);
        for (const Piece& piece : m_pieces)
            cut[piece.path] = cut[piece.path] || isCut(piece);
        std::vector<Path> result;
        std::size_t piece = 0;
        for (std::size_t i = 0; i < paths.size(); ++i) {
            const std::size_t end = piece + paths[i].elements.size();
            if (!cut[i]) result.push_back(paths[i]);
            for (; piece < end; ++piece) {
                if (cut[i]) appendLeft(m_pieces[piece], paths[i].layer, result);
            }
        }
        return result;
    }

private:
    static bool isCut(const Piece& piece) {
        return piece.left.size() != 1 || piece.left.front() != Range{0.0, 1.0};
    }

    /// Elements that stay come first, then the longer ones.
    std::vector<std::size_t> ranksByLength() const {
        std::vector<std::size_t> order(m_pieces.size());
        std::iota(order.begin(), order.end(), std::size_t{0});
        std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
            if (m_pieces[a].fixed != m_pieces[b].fixed) return m_pieces[a].fixed;
            return m_pieces[a].length > m_pieces[b].length;
        });
        std::vector<std::size_t> ranks(order.size());
        for (std::size_t rank = 0; rank < order.size(); ++rank)
            ranks[order[rank]] = rank;
        return ranks;
    }

    void cutBy(const Element& other, Piece& piece) const {
        const double least = m_tolerance / piece.length;
        for (const Range& range : covered(piece.element, other, m_tolerance)) {
            if (range.second - range.first > 2.0 * least) takeAway(piece.left, range, least);
        }
    }

    static void appendLeft(const Piece& piece, const std::string& layer,
                           std::vector<Path>& result) {
        for (const Range& range : piece.left)
            result.push_back({{partOf(piece.element, range)}, false, layer});
    }

    double m_tolerance;
    std::vector<Piece> m_pieces;
    BoxRow m_boxes;
};

}  // namespace

std::size_t trimOverlaps(std::vector<Path>& paths, double tolerance) {
    OverlapTrimmer trimmer(paths, tolerance);
    const std::size_t trimmed = trimmer.trim();
    if (trimmed > 0) paths = trimmer.trimmedPaths(paths);
    return trimmed;
}

}  // namespace gmdrawing
