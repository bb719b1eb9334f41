// SPDX-License-Identifier: MIT
#include "kernel/curves/kernels/CircleLine.h"

namespace gmkernel_detail {

Hits<2> crossCircleSlope(Vec3 const& m, double r, double k, double d) {
    Hits<2> hits;
    const double c0 = d + k * m.x - m.y;
    const double a = k * k + 1.0;
    const double b = 2.0 * k * c0;
    const double c = c0 * c0 - r * r;
    const double discriminant = b * b - 4.0 * a * c;
    if (!(discriminant >= 0.0)) return hits;

    const double sign = b < 0.0 ? -1.0 : 1.0;
    const double q = -0.5 * (b + sign * std::sqrt(discriminant));
    if (!(std::fabs(q) >= GmBase::m_scdPrecSqr)) return hits;

    const double x1 = m.x + q / a;
    const double x2 = m.x + c / q;
    const Vec3 p1{x1, k * x1 + d, m.z};
    const Vec3 p2{x2, k * x2 + d, m.z};
    if (isSamePoint(p1, p2)) return hits;
    hits.add(p1);
    hits.add(p2);
    return hits;
}

Vec3 footOnCircle(Vec3 const& m, double r, double k, double side) {
    const Vec3 normal = Vec3{-k, 1.0, 0.0} / std::sqrt(k * k + 1.0);
    return side > 0.0 ? m + r * normal : m - r * normal;
}

}  // namespace gmkernel_detail
