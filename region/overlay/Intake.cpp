// SPDX-License-Identifier: MIT
#include "region/overlay/Intake.h"

#include <algorithm>
#include <cmath>

#include "region/plane/ElementBox.h"
#include "region/plane/ElementHalves.h"

namespace gmregion {

namespace {

/// Numbers above it are refused, bulges among them.
constexpr double kLargestBulge = 1e12;
constexpr double kDefaultShare = 1.0 / 1073741824.0;  // 2^-30

bool isFinite(const Element& e) {
    return std::isfinite(e.sp.x) && std::isfinite(e.sp.y) && std::isfinite(e.ep.x) &&
           std::isfinite(e.ep.y) && std::isfinite(e.bulge);
}

double largestOf(Vec2 p) {
    return std::max(std::fabs(p.x), std::fabs(p.y));
}

}  // namespace

Extent extentOf(const Paths& paths) {
    Extent extent;
    Box box;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        for (const Element& e : paths[i]) {
            // The square of a larger bulge may have no bits any more; no box would tell.
            const bool isTooBent = e.sp != e.ep && std::fabs(e.bulge) > kLargestBulge;
            const bool inRange =
                !isTooBent && std::max(largestOf(e.sp), largestOf(e.ep)) <= kLargestCoordinate;
            if (!isFinite(e) || !inRange) {
                const Reason reason = isFinite(e) ? Reason::kOutOfRange : Reason::kNotFinite;
                extent.refusal = {reason, isFinite(e) ? e.sp : Point{}, i};
                return extent;
            }
            if (e.sp != e.ep)
                visitHalves(e, [&](const Element& half) { box.include(boxAbout(half)); });
        }
    }
    if (box.isEmpty()) return extent;
    extent.size = std::max(box.size().x, box.size().y);
    if (extent.size > 0.0 && extent.size < kSmallestSize)
        extent.refusal = {Reason::kOutOfRange, box.low, 0};
    extent.largest = std::max(largestOf(box.low), largestOf(box.high));
    if (!(extent.largest <= 4.0 * kLargestCoordinate))
        extent.refusal = {Reason::kOutOfRange, {}, 0};
    return extent;
}

double toleranceFor(const Extent& extent, double asked) {
    if (asked != 0.0) return asked;
    return std::max(extent.size * kDefaultShare, extent.largest * kFinestTolerance);
}

Refusal checkedTolerance(const Extent& extent, double tolerance) {
    const bool isFineEnough = tolerance >= 0.0 && tolerance <= kLargestCoordinate;
    if (isFineEnough && tolerance >= extent.largest * kFinestTolerance) return {};
    return {Reason::kTolerance, {}, 0};
}

void appendElement(std::vector<StrandElement>& elements, const Element& e, Index tag) {
    if (e.sp == e.ep) return;
    visitHalves(e, [&](const Element& half) {
        StrandElement piece;
        static_cast<Element&>(piece) = half;
        piece.tag = tag;
        if (piece.sp != piece.ep) elements.push_back(piece);
    });
}

Refusal takePaths(const Paths& paths, double tolerance, bool wantClosed, Weight weight,
                  Strands& strands, std::vector<Origin>& origins) {
    auto& elements = strands.elements;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        const PathView path = paths[i];
        if (path.size() == 0) continue;
        if (wantClosed && !path.closed) return {Reason::kOpenPath, path.first->sp, i};
        const std::size_t count = path.size();
        for (std::size_t k = 0; k < count; ++k) {
            const Element& e = path.first[k];
            const Index tag = static_cast<Index>(origins.size());
            origins.push_back({path.id, static_cast<std::uint32_t>(k), OriginKind::kElement});
            appendElement(elements, e, tag);
            if (k + 1 == count && !path.closed) break;
            const Vec2 next = path.first[(k + 1) % count].sp;
            if (next == e.ep) continue;
            const Vec2 gap = next - e.ep;
            if (!(dot(gap, gap) <= tolerance * tolerance)) return {Reason::kGap, e.ep, i};
            appendElement(elements, {e.ep, next, 0.0}, tag);
        }
        strands.endStrand(path.closed, weight);
    }
    return {};
}

void takeSet(const RegionSet& set, Weight weight, Index firstTag, Strands& strands) {
    for (const Loop& loop : set.loops()) {
        for (Index i = loop.first; i < loop.last; ++i)
            appendElement(strands.elements, set.elements()[i], firstTag + i);
        strands.endStrand(true, weight);
    }
}

}  // namespace gmregion
