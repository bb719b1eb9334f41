// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "kernel/values/Vec3.h"

namespace gmkernel_detail {

/// Numbered start points in square cells, for finding those near a point without a look at all of
/// them. Points with a coordinate that is not finite are near nothing.
class StartCells {
public:
    /// Points nearer to each other than `reach`, positive, are found.
    explicit StartCells(double reach);

    void add(Vec3 const& start, std::size_t number);
    /// To be called once, when all points are added. Cost: that of sorting them.
    void order();

    /// The numbers of all points nearer than the reach, and of some beyond it, in increasing order.
    /// Cost: the logarithm of the number of points, and those that are found.
    void collectNear(Vec3 const& p, std::vector<std::size_t>& numbers) const;

private:
    struct Entry {
        double column;
        double row;
        std::size_t number;
    };

    static bool comesBefore(Entry const& a, Entry const& b);
    double cellOf(double coordinate) const;

    double m_reach;
    double m_width;
    std::vector<Entry> m_entries;
};

}  // namespace gmkernel_detail
