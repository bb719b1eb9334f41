// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <utility>
#include <vector>

#include "region/model/Box.h"

namespace gmregion {

/// Boxes in a row, for finding those that overlap a box or each other.
///
/// Level upon level, every eight neighbours have a box about them, in one array without sorting.
/// That is quick where neighbours in the row are neighbours in the plane, as along a path. Memory
/// is kept from one row to the next.
class BoxRow {
public:
    /// Begins a row in place of the one before, for so many boxes.
    void begin(std::size_t count);
    /// Appends a box to the row that was begun.
    void add(const Box& box) { m_boxes.push_back(box); }
    /// Ends the row; from here on it can be searched. Cost: linear.
    void finish();
    /// Takes the boxes of a row in place of those before. Cost: linear.
    void assign(const std::vector<Box>& boxes);

    std::size_t size() const { return m_ends.empty() ? 0 : m_ends.front(); }
    const Box& operator[](std::size_t index) const { return m_boxes[index]; }
    /// The box about all; empty for an empty row.
    Box bounds() const { return size() > 0 ? boxOf(top(), 0) : Box{}; }

    /// Calls visit(index) for the boxes that overlap a box, in the order of the row.
    template <class Visit>
    void visitOverlapping(const Box& box, const Visit& visit) const {
        if (size() > 0) visitUnder(top(), 0, box, visit);
    }

    /// Whether isWanted(index) holds for one of the boxes that overlap a box; asked in the order of
    /// the row until one does.
    template <class IsWanted>
    bool anyOverlapping(const Box& box, const IsWanted& isWanted) const {
        return size() > 0 && anyUnder(top(), 0, box, isWanted);
    }

    /// Goes from a point to the left, x falling, for what adds up along the way: calls
    /// whole(first, last) for ranges of the row whose boxes lie left of the point, and one(index)
    /// for boxes that hold it; not for those above, below and to the right. Cost: mostly
    /// logarithmic.
    template <class Whole, class One>
    void castLeft(Vec2 from, const Whole& whole, const One& one) const {
        if (size() > 0) castUnder(top(), 0, from, whole, one);
    }

    /// Looks from a point to the left, x falling: calls hitAt(index), which answers the x of a hit
    /// or -infinity, for boxes at the height of the point, rightmost first, as long as they reach
    /// farther right than the rightmost hit so far. Cost: mostly logarithmic.
    template <class HitAt>
    void lookLeft(Vec2 from, const HitAt& hitAt) const {
        double rightmost = -HUGE_VAL;
        if (size() > 0) leftUnder(top(), 0, from, rightmost, hitAt);
    }

    /// Calls visit(index) for boxes near a point, nearer ones first where that costs nothing, until
    /// all others are farther off than the limit. Distances are squared; visit returns the limit
    /// from there on, which must not grow.
    template <class Visit>
    void visitNear(Vec2 p, double limit, const Visit& visit) const {
        if (size() > 0) nearUnder(top(), 0, p, limit, visit);
    }

    /// Calls visit(i, j) once for every two boxes of the row that overlap, i < j, in an order that
    /// depends on the boxes alone, until it answers false; whether it never did. Cost: the number
    /// of boxes, and of pairs near each other.
    template <class Visit>
    bool visitPairs(const Visit& visit) const {
        return size() == 0 || pairsUnder(top(), 0, visit);
    }

    /// Calls visit(i, j) for the boxes i of this row and j of another that overlap, until it
    /// answers false; whether it never did.
    template <class Visit>
    bool visitPairsWith(const BoxRow& other, const Visit& visit) const {
        return size() == 0 || other.size() == 0 ||
               pairsAcross(top(), 0, other, other.top(), 0, visit);
    }

private:
    static constexpr std::size_t kBits = 3;  ///< two to that power have a box about them

    std::size_t top() const { return m_ends.size() - 1; }
    std::size_t beginOf(std::size_t level) const { return level == 0 ? 0 : m_ends[level - 1]; }
    std::size_t countOf(std::size_t level) const { return m_ends[level] - beginOf(level); }
    const Box& boxOf(std::size_t level, std::size_t index) const {
        return m_boxes[beginOf(level) + index];
    }
    /// Behind the last of those that a box of a level is about.
    std::size_t endUnder(std::size_t level, std::size_t index) const {
        return std::min((index + 1) << kBits, countOf(level - 1));
    }

    template <class Visit>
    void visitUnder(std::size_t level, std::size_t index, const Box& box,
                    const Visit& visit) const {
        if (!boxOf(level, index).overlaps(box)) return;
        if (level == 0) {
            visit(index);
            return;
        }
        for (std::size_t i = index << kBits; i < endUnder(level, index); ++i)
            visitUnder(level - 1, i, box, visit);
    }

    template <class IsWanted>
    bool anyUnder(std::size_t level, std::size_t index, const Box& box,
                  const IsWanted& isWanted) const {
        if (!boxOf(level, index).overlaps(box)) return false;
        if (level == 0) return isWanted(index);
        for (std::size_t i = index << kBits; i < endUnder(level, index); ++i) {
            if (anyUnder(level - 1, i, box, isWanted)) return true;
        }
        return false;
    }

    template <class Whole, class One>
    void castUnder(std::size_t level, std::size_t index, Vec2 from, const Whole& whole,
                   const One& one) const {
        const Box& box = boxOf(level, index);
        if (box.low.y > from.y || box.high.y < from.y || box.low.x > from.x) return;
        if (box.high.x < from.x) {
            const std::size_t bits = kBits * level;
            whole(index << bits, std::min((index + 1) << bits, size()));
        } else if (level == 0) {
            one(index);
        } else {
            for (std::size_t i = index << kBits; i < endUnder(level, index); ++i)
                castUnder(level - 1, i, from, whole, one);
        }
    }

    template <class HitAt>
    void leftUnder(std::size_t level, std::size_t index, Vec2 from, double& rightmost,
                   const HitAt& hitAt) const {
        if (level == 0) {
            rightmost = std::max(rightmost, hitAt(index));
            return;
        }
        std::array<std::size_t, std::size_t{1} << kBits> order{};
        std::size_t count = 0;
        for (std::size_t i = index << kBits; i < endUnder(level, index); ++i) {
            const Box& box = boxOf(level - 1, i);
            if (box.low.y > from.y || box.high.y < from.y || box.low.x > from.x) continue;
            std::size_t at = count++;
            for (; at > 0 && boxOf(level - 1, order[at - 1]).high.x < box.high.x; --at)
                order[at] = order[at - 1];
            order[at] = i;
        }
        for (std::size_t k = 0; k < count; ++k) {
            if (boxOf(level - 1, order[k]).high.x < rightmost) return;
            leftUnder(level - 1, order[k], from, rightmost, hitAt);
        }
    }

    static double squaredDistance(const Box& box, Vec2 p) {
        const double dx = std::max({box.low.x - p.x, p.x - box.high.x, 0.0});
        const double dy = std::max({box.low.y - p.y, p.y - box.high.y, 0.0});
        return dx * dx + dy * dy;
    }

    template <class Visit>
    void nearUnder(std::size_t level, std::size_t index, Vec2 p, double& limit,
                   const Visit& visit) const {
        if (level == 0) {
            limit = visit(index);
            return;
        }
        std::array<std::pair<double, std::size_t>, std::size_t{1} << kBits> under;
        std::size_t count = 0;
        for (std::size_t i = index << kBits; i < endUnder(level, index); ++i) {
            const double distance = squaredDistance(boxOf(level - 1, i), p);
            if (distance <= limit) under[count++] = {distance, i};
        }
        std::sort(under.begin(), under.begin() + count);
        for (std::size_t i = 0; i < count; ++i) {
            if (under[i].first <= limit) nearUnder(level - 1, under[i].second, p, limit, visit);
        }
    }

    /// The pairs of which both are under one box.
    template <class Visit>
    bool pairsUnder(std::size_t level, std::size_t index, const Visit& visit) const {
        if (level == 0) return true;
        const std::size_t end = endUnder(level, index);
        for (std::size_t i = index << kBits; i < end; ++i) {
            if (!pairsUnder(level - 1, i, visit)) return false;
            for (std::size_t j = i + 1; j < end; ++j) {
                if (!pairsBetween(level - 1, i, j, visit)) return false;
            }
        }
        return true;
    }

    /// The pairs of which one is under the one box and the other under the other, of one level.
    template <class Visit>
    bool pairsBetween(std::size_t level, std::size_t a, std::size_t b, const Visit& visit) const {
        if (!boxOf(level, a).overlaps(boxOf(level, b))) return true;
        if (level == 0) return visit(a, b);
        for (std::size_t i = a << kBits; i < endUnder(level, a); ++i) {
            if (!boxOf(level - 1, i).overlaps(boxOf(level, b))) continue;
            for (std::size_t j = b << kBits; j < endUnder(level, b); ++j) {
                if (!pairsBetween(level - 1, i, j, visit)) return false;
            }
        }
        return true;
    }

    template <class Visit>
    bool pairsAcross(std::size_t level, std::size_t index, const BoxRow& other,
                     std::size_t otherLevel, std::size_t otherIndex, const Visit& visit) const {
        if (!boxOf(level, index).overlaps(other.boxOf(otherLevel, otherIndex))) return true;
        if (level == 0 && otherLevel == 0) return visit(index, otherIndex);
        const bool isThis = level >= otherLevel;
        const std::size_t first = (isThis ? index : otherIndex) << kBits;
        const std::size_t end =
            isThis ? endUnder(level, index) : other.endUnder(otherLevel, otherIndex);
        for (std::size_t i = first; i < end; ++i) {
            const bool goesOn =
                isThis ? pairsAcross(level - 1, i, other, otherLevel, otherIndex, visit)
                       : pairsAcross(level, index, other, otherLevel - 1, i, visit);
            if (!goesOn) return false;
        }
        return true;
    }

    std::vector<Box> m_boxes;         ///< the row, then level after level what stands over it
    std::vector<std::size_t> m_ends;  ///< behind the last box of each level
};

}  // namespace gmregion
