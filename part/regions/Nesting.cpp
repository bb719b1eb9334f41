// SPDX-License-Identifier: MIT
/// @file
/// Which contours lie in which.
///
/// A sweep along the longer side of the drawing finds the contours whose boxes hold that of another
/// one. Of these the smallest is asked first whether it does; whatever holds a holder holds the
/// contour, too, and is not asked.

#include "part/regions/Nesting.h"

#include <algorithm>
#include <iterator>
#include <memory>
#include <numeric>

#include "part/regions/ContourRegions.h"
#include "part/regions/Inside.h"
#include "region/model/Box.h"

namespace gmpart {

using gmregion::Locator;
using gmregion::RegionSet;

namespace {

/// A contour as the search for holders sees it.
struct Extent {
    Box box;
    double area = 0.0;  ///< 0 for what can hold nothing
};

std::vector<Extent> extentsOf(const std::vector<Path>& contours,
                              const std::vector<RegionSet>& regions) {
    std::vector<Extent> extents;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        extents.push_back({boundingBox(contours[i]).grown(kKernelTolerance), area(regions[i])});
    }
    return extents;
}

/// Finds for every contour the larger ones whose boxes hold its own, within the tolerance.
class BoxSweep {
public:
    explicit BoxSweep(const std::vector<Extent>& extents)
        : m_extents(extents), m_alongX(isWide(extents)) {}

    std::vector<std::vector<std::size_t>> holdingBoxes() {
        std::vector<std::vector<std::size_t>> found(m_extents.size());
        const std::vector<std::size_t> order = byBegin();
        auto opening = order.begin();
        for (const std::size_t i : order) {
            const double place = low(m_extents[i]) + 2.0 * kKernelTolerance;
            closeBehind(low(m_extents[i]));
            for (; opening != order.end() && low(m_extents[*opening]) <= place; ++opening) {
                if (m_extents[*opening].area > 0.0) m_open.push_back(*opening);
            }
            std::copy_if(m_open.begin(), m_open.end(), std::back_inserter(found[i]),
                         [&](std::size_t other) { return mayHold(other, i); });
        }
        return found;
    }

private:
    static bool isWide(const std::vector<Extent>& extents) {
        Box all;
        for (const Extent& extent : extents)
            all.include(extent.box);
        return all.size().x > all.size().y;
    }
    double low(const Extent& e) const { return m_alongX ? e.box.low.x : e.box.low.y; }
    double high(const Extent& e) const { return m_alongX ? e.box.high.x : e.box.high.y; }

    std::vector<std::size_t> byBegin() const {
        std::vector<std::size_t> order(m_extents.size());
        std::iota(order.begin(), order.end(), std::size_t{0});
        std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
            return low(m_extents[a]) < low(m_extents[b]);
        });
        return order;
    }

    void closeBehind(double place) {
        const auto isBehind = [&](std::size_t i) { return high(m_extents[i]) < place; };
        m_open.erase(std::remove_if(m_open.begin(), m_open.end(), isBehind), m_open.end());
    }

    bool mayHold(std::size_t outer, std::size_t inner) const {
        return m_extents[outer].area > m_extents[inner].area &&
               m_extents[outer].box.grown(kKernelTolerance).holds(m_extents[inner].box);
    }

    const std::vector<Extent>& m_extents;
    bool m_alongX;
    std::vector<std::size_t> m_open;  ///< what can hold others and reaches to here
};

/// Chooses the holders among those whose boxes say that they may be, larger contours first.
class HolderChoice {
public:
    HolderChoice(const std::vector<Path>& contours, const std::vector<RegionSet>& regions)
        : m_contours(contours),
          m_regions(regions),
          m_extents(extentsOf(contours, regions)),
          m_locators(contours.size()),
          m_marks(contours.size(), contours.size()),
          m_nesting{std::vector<std::vector<std::size_t>>(contours.size()),
                    std::vector<std::size_t>(contours.size())} {}

    Nesting run() {
        std::vector<std::vector<std::size_t>> candidates = BoxSweep(m_extents).holdingBoxes();
        std::vector<std::size_t> order(m_contours.size());
        std::iota(order.begin(), order.end(), std::size_t{0});
        std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
            return m_extents[a].area > m_extents[b].area;
        });
        for (const std::size_t contour : order)
            findHolders(contour, std::move(candidates[contour]));
        return std::move(m_nesting);
    }

private:
    void findHolders(std::size_t contour, std::vector<std::size_t> candidates) {
        std::sort(candidates.begin(), candidates.end(), [&](std::size_t a, std::size_t b) {
            return m_extents[a].area < m_extents[b].area;
        });
        for (const std::size_t candidate : candidates) {
            if (m_marks[candidate] == contour) continue;
            if (!liesIn(m_contours[contour], locatorOf(candidate))) continue;
            m_nesting.holders[contour].push_back(candidate);
            m_nesting.depths[contour] += markWithHolders(candidate, contour);
        }
    }

    const Locator& locatorOf(std::size_t contour) {
        std::unique_ptr<Locator>& locator = m_locators[contour];
        if (!locator) locator = std::make_unique<Locator>(m_regions[contour]);
        return *locator;
    }

    /// Marks a holder of `contour` and all that hold it; the number of those newly marked.
    std::size_t markWithHolders(std::size_t holder, std::size_t contour) {
        std::size_t marked = 0;
        std::vector<std::size_t> pending{holder};
        while (!pending.empty()) {
            const std::size_t next = pending.back();
            pending.pop_back();
            if (m_marks[next] == contour) continue;
            m_marks[next] = contour;
            ++marked;
            const std::vector<std::size_t>& above = m_nesting.holders[next];
            pending.insert(pending.end(), above.begin(), above.end());
        }
        return marked;
    }

    const std::vector<Path>& m_contours;
    const std::vector<RegionSet>& m_regions;
    std::vector<Extent> m_extents;
    std::vector<std::unique_ptr<Locator>> m_locators;
    std::vector<std::size_t> m_marks;  ///< the contour that was last found to lie in each
    Nesting m_nesting;
};

}  // namespace

Nesting nestingOf(const std::vector<Path>& contours, const std::vector<RegionSet>& regions) {
    return HolderChoice(contours, regions).run();
}

Nesting nestingOf(const std::vector<Path>& contours) {
    return nestingOf(contours, contourRegions(contours, partTolerance(contours)));
}

}  // namespace gmpart
