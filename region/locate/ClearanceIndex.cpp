// SPDX-License-Identifier: MIT
/// @file
/// How far things are from paths.
///
/// A first distance, from the start of the element, bounds the box in which to look; every shorter
/// one found bounds what is measured after it.

#include <algorithm>
#include <cmath>
#include <utility>
#include <vector>

#include "gmregion/Clearance.h"

#include "region/locate/BoundaryIndex.h"
#include "region/plane/ElementBox.h"
#include "region/plane/ElementDistance.h"
#include "region/plane/ElementHalves.h"

namespace gmregion {

namespace {

constexpr double kLargest = 1e100;

bool isUsable(Vec2 p) {
    return std::fabs(p.x) <= kLargest && std::fabs(p.y) <= kLargest;
}

bool isUsable(const Element& e) {
    return isUsable(e.sp) && isUsable(e.ep) && std::fabs(e.bulge) <= kLargest && e.sp != e.ep;
}

}  // namespace

struct ClearanceIndex::Store {
    BoundaryIndex index;
    /// Of the elements that are indexed, their paths and their numbers there.
    std::vector<std::pair<std::size_t, std::size_t>> sources;

    Clearance clearance(const Approach& way, std::size_t piece) const {
        const auto& [path, element] = sources[index.pieces()[piece].element];
        return {way.onFirst, way.onSecond, way.distance, path, element};
    }
    void shorten(const Element& half, std::optional<Clearance>& best, double limit) const;
};

/// Looks for a shorter way from an element that turns by half a turn at the most.
void ClearanceIndex::Store::shorten(const Element& half, std::optional<Clearance>& best,
                                    double limit) const {
    const BoundaryIndex::Near first = index.nearest(half.sp, best ? best->distance : limit);
    if (first.piece != kNone) {
        best = clearance({half.sp, first.at, first.distance}, first.piece);
    }
    const double reach = best ? best->distance : limit;
    const Carrier carrier = carrierOf(half);
    const Box about = boxAbout(half);
    index.boxes().visitOverlapping(about.grown(reach), [&](std::size_t i) {
        const BoundaryPiece& piece = index.pieces()[i];
        const double least = best ? best->distance : limit;
        if (!about.grown(least).overlaps(index.boxes()[i])) return;
        const Approach way = nearestBetween(half, carrier, piece, piece.carrier);
        if (way.distance < least || (!best && way.distance <= least)) best = clearance(way, i);
    });
}

ClearanceIndex::ClearanceIndex(const Paths& paths) : m_store(std::make_unique<Store>()) {
    std::vector<Element> elements;
    for (std::size_t path = 0; path < paths.size(); ++path) {
        const PathView view = paths[path];
        for (std::size_t i = 0; i < view.size(); ++i) {
            if (!isUsable(view.first[i])) continue;
            elements.push_back(view.first[i]);
            m_store->sources.emplace_back(path, i);
        }
    }
    const std::vector<Index> ends{static_cast<Index>(elements.size())};
    m_store->index.take(LoopsView{&elements, &ends});
}

ClearanceIndex::~ClearanceIndex() = default;
ClearanceIndex::ClearanceIndex(ClearanceIndex&& other) noexcept = default;
ClearanceIndex& ClearanceIndex::operator=(ClearanceIndex&& other) noexcept = default;

std::optional<Clearance> ClearanceIndex::of(const Element& e, double limit) const {
    std::optional<Clearance> best;
    if (!isUsable(e) || !(limit >= 0.0)) return best;
    visitHalves(e, [&](const Element& half) {
        if (half.sp != half.ep) m_store->shorten(half, best, limit);
    });
    return best;
}

std::optional<Clearance> ClearanceIndex::of(Point p, double limit) const {
    if (!isUsable(p) || !(limit >= 0.0)) return std::nullopt;
    const BoundaryIndex::Near near = m_store->index.nearest(p, limit);
    if (near.piece == kNone) return std::nullopt;
    return m_store->clearance({p, near.at, near.distance}, near.piece);
}

}  // namespace gmregion
