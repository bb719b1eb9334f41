// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>

#include "kernel/values/Vec3.h"

namespace gmkernel_detail {

/// The points that an intersection kernel found, at most N, in the kernel's order.
template <std::size_t N>
class Hits {
public:
    void add(Vec3 const& p) { m_points[m_count++] = p; }
    Vec3 const* begin() const { return m_points.data(); }
    Vec3 const* end() const { return m_points.data() + m_count; }

private:
    std::array<Vec3, N> m_points;
    std::size_t m_count = 0;
};

}  // namespace gmkernel_detail
