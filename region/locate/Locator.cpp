// SPDX-License-Identifier: MIT
#include <algorithm>
#include <cmath>

#include "gmregion/Questions.h"
#include "region/locate/BoundaryIndex.h"
#include "region/plane/ElementWinding.h"

namespace gmregion {

namespace {

/// Larger coordinates have no squares.
constexpr double kLargest = 1e100;
constexpr double kFarthest = 4.0 * kLargest;
constexpr double kOneAndRounding = 1.0 + 1.0 / 1099511627776.0;

bool isOfUse(Point p) {
    return std::fabs(p.x) <= kLargest && std::fabs(p.y) <= kLargest;
}

/// How often loops run round a point, those that do.
using LoopWindings = std::vector<std::pair<std::size_t, int>>;

LoopWindings windingsOfLoops(const BoundaryIndex& boundary, Point p) {
    LoopWindings sums;
    boundary.visitWindings(p, [&](Index loop, int winding) { sums.emplace_back(loop, winding); });
    std::sort(sums.begin(), sums.end());
    std::size_t count = 0;
    for (std::size_t i = 0; i < sums.size(); ++i) {
        if (count > 0 && sums[count - 1].first == sums[i].first)
            sums[count - 1].second += sums[i].second;
        else
            sums[count++] = sums[i];
    }
    sums.resize(count);
    sums.erase(
        std::remove_if(sums.begin(), sums.end(), [](const auto& s) { return s.second == 0; }),
        sums.end());
    return sums;
}

}  // namespace

struct Locator::Store {
    explicit Store(const RegionSet& of) : set(&of) { boundary.take(of); }

    /// The innermost loop about a point, another one left out; nothing when there is none.
    std::optional<std::size_t> innermost(Point p, std::optional<std::size_t> without) const;
    Point pointOf(std::size_t loop) const;

    const RegionSet* set;
    BoundaryIndex boundary;
};

std::optional<std::size_t> Locator::Store::innermost(Point p,
                                                     std::optional<std::size_t> without) const {
    std::optional<std::size_t> found;
    double least = HUGE_VAL;
    for (const auto& [loop, winding] : windingsOfLoops(boundary, p)) {
        if (loop == without) continue;
        const double size = std::fabs(area(*set, loopAlone(loop)));
        if (size >= least) continue;
        least = size;
        found = loop;
    }
    return found;
}

/// The middle of the longest element, which no other loop touches but by chance.
Point Locator::Store::pointOf(std::size_t loop) const {
    const Loop& range = set->loops()[loop];
    const auto first = set->elements().begin();
    const auto longest = std::max_element(
        first + range.first, first + range.last, [](const Element& a, const Element& b) {
            return dot(a.ep - a.sp, a.ep - a.sp) < dot(b.ep - b.sp, b.ep - b.sp);
        });
    return middleOf(*longest);
}

Locator::Locator(const RegionSet& set) : m_store(std::make_unique<Store>(set)) {}
Locator::~Locator() = default;
Locator::Locator(Locator&& other) noexcept = default;
Locator& Locator::operator=(Locator&& other) noexcept = default;

Place Locator::where(Point p, double within) const {
    if (!isOfUse(p)) return Place::kOutside;
    if (within >= 0.0) {
        // The square of a root may be above what it is the root of: compared is the root.
        const double limit = kOneAndRounding * std::min(within, kFarthest);
        const BoundaryIndex::Near near = m_store->boundary.nearest(p, limit);
        if (near.piece != kNone && near.distance <= within) return Place::kOnBoundary;
    }
    return m_store->boundary.windingAbout(p) > 0 ? Place::kInside : Place::kOutside;
}

Place Locator::where(Point p) const {
    return where(p, m_store->set->tolerance());
}

std::optional<BoundaryPoint> Locator::nearest(Point p) const {
    if (!isOfUse(p) || m_store->set->empty()) return std::nullopt;
    const BoundaryIndex::Near near = m_store->boundary.nearest(p, kFarthest);
    const BoundaryPiece& piece = m_store->boundary.pieces()[near.piece];
    return BoundaryPoint{near.at, near.distance, piece.element,
                         m_store->boundary.loopOf(near.piece)};
}

std::optional<double> Locator::signedDistance(Point p) const {
    const std::optional<BoundaryPoint> near = nearest(p);
    if (!near) return std::nullopt;
    return m_store->boundary.windingAbout(p) > 0 ? near->distance : -near->distance;
}

std::optional<std::size_t> Locator::regionAt(Point p) const {
    if (where(p, -1.0) != Place::kInside) return std::nullopt;
    const std::optional<std::size_t> loop = m_store->innermost(p, std::nullopt);
    if (!loop) return std::nullopt;
    return m_store->set->loops()[*loop].region;
}

std::optional<std::size_t> Locator::loopAbout(std::size_t loop) const {
    const auto& loops = m_store->set->loops();
    if (loop >= loops.size()) return std::nullopt;
    if (loops[loop].hole) return loopsOf(*m_store->set, loops[loop].region).first;
    return m_store->innermost(m_store->pointOf(loop), loop);
}

std::vector<std::size_t> Locator::regionsIn(std::size_t region) const {
    std::vector<std::size_t> found;
    const auto& loops = m_store->set->loops();
    for (std::size_t loop = 0; loop < loops.size(); ++loop) {
        if (loops[loop].hole || loops[loop].region == region) continue;
        const std::optional<std::size_t> about = loopAbout(loop);
        if (about && loops[*about].hole && loops[*about].region == region)
            found.push_back(loops[loop].region);
    }
    return found;
}

}  // namespace gmregion
