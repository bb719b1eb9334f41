// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <functional>
#include <vector>

#include "gmkernel/GmCurve.h"
#include "gmkernel/KxArray.h"
#include "kernel/contour/walk/GmContIntPoint.h"

namespace gmkernel_detail {

using CrossingArray = KxArray<GmContIntPoint*, GmContIntPoint*>;

/// The crossings between curves, numbered in the order in which they were found, and by the curve
/// that they leave.
class Crossings {
public:
    /// Adds the crossings at a common point of two curves with the numbers `ia` and `ib`: from
    /// either one onto the other. At a joint of elements only the element that arrives there is
    /// left, and only the one that starts there is entered.
    void AddBothWays(GmCurve const& a, int ia, GmCurve const& b, int ib, GmPoint const& p);
    int Count() const { return static_cast<int>(m_entries.size()); }
    GmContIntPoint& operator[](int number) { return entry(number).crossing; }

    /// Calls visit(number, crossing) for the crossings that leave a curve, in the order of their
    /// numbers. Cost: the number of these.
    template <class Visit>
    void VisitFrom(int curve, Visit const& visit) const {
        const std::size_t row = static_cast<std::size_t>(curve);
        int number = row < m_rows.size() ? m_rows[row].first : kNone;
        for (; number != kNone; number = entry(number).next)
            visit(number, entry(number).crossing);
    }

private:
    static constexpr int kNone = -1;

    struct Entry {
        GmContIntPoint crossing;
        int next = kNone;  ///< the next one that leaves the same curve
    };
    /// The crossings that leave one curve: where the links from one to the next begin and end.
    struct Row {
        int first = kNone;
        int last = kNone;
    };

    Entry& entry(int number) { return m_entries[static_cast<std::size_t>(number)]; }
    Entry const& entry(int number) const { return m_entries[static_cast<std::size_t>(number)]; }
    void Add(int from, int to, GmPoint const& p);

    std::vector<Entry> m_entries;
    std::vector<Row> m_rows;  ///< by the number of the curve, up to the last one that is left
};

/// Looks along a curve from `p` to its end for the nearest crossing that is not used and leaves the
/// curve `index`; at one place the last one answers. -1 when there is none, and for curves other
/// than segments and arcs. "Nearest" is told within 1e-4, in length units on segments and in
/// degrees on arcs. Cost: the number of crossings that leave the curve, with an array the number of
/// all.
int nextCrossing(GmPoint const& p, GmCurve const& curve, int index, Crossings const& crossings);
int nextCrossing(GmPoint const& p, GmCurve const& curve, int index, CrossingArray const& crossings);

/// The curves that a walk goes along, and what it does with the pieces.
struct WalkTrack {
    std::function<GmCurve const&(int index)> curveAt;
    /// The curve that the walk goes on with at the end of one.
    std::function<int(int index)> following;
    /// Takes up a piece; called after `following`.
    std::function<void(GmCurve& piece)> append;
    int curveCount = 0;
};

/// Walks from a crossing along the curves and over every crossing that comes, until it is back at
/// the first one. Marks crossings as used. False when it does not come back within as many steps as
/// there are pairs of curves and crossings, or goes past more curves than there are without a
/// crossing: it would then go round for ever.
bool walkLoop(Crossings& crossings, int start, WalkTrack const& track);

}  // namespace gmkernel_detail
