// SPDX-License-Identifier: MIT
/// @file
/// Whether a path lies in a region, decided by distances.
///
/// From the middle of a piece no point of it is farther away than half its length. So where the
/// boundary is farther, the whole piece is on the side of its middle; where it is not, the piece is
/// halved. The side is asked for only where the path has come by the boundary, since it cannot
/// change elsewhere.

#include "part/regions/Inside.h"

#include <algorithm>
#include <optional>

namespace gmpart {

using gmregion::BoundaryPoint;
using gmregion::Locator;
using gmregion::Place;

namespace {

class Inspection {
public:
    explicit Inspection(const Locator& outer) : m_outer(outer) {}

    /// False when a part of the element is outside.
    bool passes(const Element& e) { return passes({e, length(e)}, 0.0, 1.0); }
    bool foundInside() const { return m_foundInside; }

private:
    /// Parts of an element up to that fraction whose middle is on the boundary run along it, and
    /// are not divided further.
    static constexpr double kLongestAlong = 1.0 / 48.0;

    struct Measured {
        const Element& element;
        double length;
    };

    bool passes(const Measured& e, double from, double to) {
        const Vec2 p = pointAt(e.element, 0.5 * (from + to));
        const std::optional<BoundaryPoint> nearest = m_outer.nearest(p);
        if (!nearest) return false;
        const double half = 0.5 * (to - from) * e.length;
        if (nearest->distance > std::max(half, kKernelTolerance)) return isInside(p);
        m_place.reset();
        const bool isAlong = nearest->distance < kKernelTolerance && to - from < kLongestAlong;
        if (!isAlong && half > kKernelTolerance) {
            const double middle = 0.5 * (from + to);
            return passes(e, from, middle) && passes(e, middle, to);
        }
        return nearest->distance < kKernelTolerance || isInside(p);
    }

    bool isInside(Vec2 p) {
        if (!m_place) m_place = m_outer.where(p, 0.0);
        const bool inside = *m_place != Place::kOutside;
        m_foundInside = m_foundInside || inside;
        return inside;
    }

    const Locator& m_outer;
    std::optional<Place> m_place;  ///< of the path since it last came by the boundary
    bool m_foundInside = false;
};

}  // namespace

bool liesIn(const Path& path, const Locator& outer) {
    Inspection inspection(outer);
    const bool passed = std::all_of(path.elements.begin(), path.elements.end(),
                                    [&](const Element& e) { return inspection.passes(e); });
    return passed && inspection.foundInside();
}

}  // namespace gmpart
