// SPDX-License-Identifier: MIT
#pragma once

#include "region/model/Element.h"

namespace gmregion {

/// The bulges of arcs over a chord that pass points within distances, and the one that passes
/// them best.
class BulgeRange {
public:
    /// Of all arcs from sp to ep, half turns at the most. The ends must differ.
    BulgeRange(Vec2 sp, Vec2 ep);

    /// Narrows to the arcs that pass p within t.
    void keepNear(Vec2 p, double t);
    /// Counts p for the best bulge.
    void weigh(Vec2 p);

    bool isEmpty() const { return !(m_low <= m_high); }
    bool holds(double bulge) const { return m_low <= bulge && bulge <= m_high; }
    double middle() const { return 0.5 * (m_low + m_high); }
    /// The bulge with the least sum of squared distances from the points that were weighed, as far
    /// as the range allows. Of points on one arc that arc's.
    double best() const;

private:
    /// A point in the frame of the chord.
    struct Place {
        double x;
        double y;
    };
    Place placeOf(Vec2 p) const;

    Vec2 m_sp;
    Vec2 m_along;
    double m_width;
    double m_low;
    double m_high;
    double m_weights = 0.0;
    double m_sum = 0.0;
};

}  // namespace gmregion
