// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>

#include "gmkernel/GmPoint.h"

namespace gmkernel_detail {

/// The points that an intersection kernel found, at most N, in the kernel's order.
template <std::size_t N>
class Hits {
public:
    void add(GmPoint const& p) { m_points[m_count++] = p; }
    GmPoint const* begin() const { return m_points.data(); }
    GmPoint const* end() const { return m_points.data() + m_count; }

private:
    std::array<GmPoint, N> m_points;
    std::size_t m_count = 0;
};

}  // namespace gmkernel_detail
