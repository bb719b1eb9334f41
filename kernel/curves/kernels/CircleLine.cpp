// SPDX-License-Identifier: MIT
#include "kernel/curves/kernels/CircleLine.h"

#include "gmkernel/GmVec.h"

namespace gmkernel_detail {

Hits<2> crossCircleSlope(GmPoint const& m, double r, double k, double d) {
    Hits<2> hits;
    const double c0 = d + k * m.X() - m.Y();
    const double a = k * k + 1.0;
    const double b = 2.0 * k * c0;
    const double c = c0 * c0 - r * r;
    const double discriminant = b * b - 4.0 * a * c;
    if (!(discriminant >= 0.0)) return hits;

    const double sign = b < 0.0 ? -1.0 : 1.0;
    const double q = -0.5 * (b + sign * std::sqrt(discriminant));
    if (!(std::fabs(q) >= GmBase::m_scdPrecSqr)) return hits;

    const double x1 = m.X() + q / a;
    const double x2 = m.X() + c / q;
    const GmPoint p1(x1, k * x1 + d, m.Z());
    const GmPoint p2(x2, k * x2 + d, m.Z());
    if (p1 == p2) return hits;
    hits.add(p1);
    hits.add(p2);
    return hits;
}

GmPoint footOnCircle(GmPoint const& m, double r, double k, double side) {
    const GmVec normal = GmVec(-k, 1.0, 0.0) / std::sqrt(k * k + 1.0);
    return side > 0.0 ? GmPoint(m + r * normal) : GmPoint(m - r * normal);
}

}  // namespace gmkernel_detail
