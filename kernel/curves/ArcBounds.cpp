// SPDX-License-Identifier: MIT
/// @file
/// The bounding rectangle of an arc.
///
/// An arc reaches one of the four axis directions when it passes over it. With all angles shifted
/// so that the direction lies on the seam of (-180, 180], a clockwise arc passes it when its start
/// angle is the smaller one, a counter-clockwise arc when its end angle is.
#include <algorithm>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmRect.h"

namespace {

bool crossesSeam(double start, double end, GmBase::eRotDir rot) {
    switch (rot) {
        case GmBase::eRotCW:
            return start < end;
        case GmBase::eRotCCW:
            return end < start;
        default:
            return false;
    }
}

// Shifts of an angle in (-180, 180] that move an axis direction onto the seam.
double plusXOnSeam(double a) {
    return a > 0.0 ? a - 180.0 : a + 180.0;
}
double minusYOnSeam(double a) {
    return a > -90.0 ? a - 90.0 : a + 270.0;
}
double plusYOnSeam(double a) {
    return a < 90.0 ? a + 90.0 : a - 270.0;
}

}  // namespace

GmRect GmArc::BoundingRect() const {
    return BoundingRect(false);
}

GmRect GmArc::BoundingRect(bool bIgnoreFullCircle) const {
    if (!bIgnoreFullCircle && IsFullCircle()) return GmCircle::BoundingRect();

    double minX = std::min(m_SP.X(), m_EP.X());
    double maxX = std::max(m_SP.X(), m_EP.X());
    double minY = std::min(m_SP.Y(), m_EP.Y());
    double maxY = std::max(m_SP.Y(), m_EP.Y());
    const double s = SAngDeg();
    const double e = EAngDeg();
    if (crossesSeam(s, e, m_eDir)) minX = m_M.X() - m_dR;
    if (crossesSeam(plusXOnSeam(s), plusXOnSeam(e), m_eDir)) maxX = m_M.X() + m_dR;
    if (crossesSeam(minusYOnSeam(s), minusYOnSeam(e), m_eDir)) minY = m_M.Y() - m_dR;
    if (crossesSeam(plusYOnSeam(s), plusYOnSeam(e), m_eDir)) maxY = m_M.Y() + m_dR;
    return GmRect(GmPoint(minX, minY), GmPoint(maxX, maxY));
}
