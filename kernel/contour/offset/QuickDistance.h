// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "gmkernel/GmCurve.h"

namespace gmkernel_detail {

/// A point of the plane in plain numbers.
struct PlanePoint {
    double x;
    double y;
};

/// A source element in plain numbers, for telling quickly whether a point is nearer to it than a
/// threshold, as `Distance` would tell it.
class QuickDistance {
public:
    explicit QuickDistance(GmCurve const& element);

    /// The height at which points are compared with the element.
    double z() const { return m_z; }

    /// Nothing where the answer depends on rounding or on a tolerance, or where the element is of
    /// another kind; then `Distance` has to be asked. The point is known to about 1e-13 of its
    /// size.
    std::optional<bool> isNearer(PlanePoint p, double threshold) const;

private:
    enum class Kind { kUnknown, kSegment, kArc };

    void takeSegment(GmCurve const& element);
    void takeArc(GmCurve const& element);
    std::optional<double> toSegment(PlanePoint p) const;
    std::optional<double> toArc(PlanePoint p) const;
    std::optional<bool> sweeps(PlanePoint direction) const;
    bool isBesideEnd(PlanePoint p) const;
    double toEnds(PlanePoint p) const;

    Kind m_kind = Kind::kUnknown;
    double m_z = 0.0;
    double m_size = 0.0;  ///< what the rounding of its coordinates goes by
    PlanePoint m_sp{};
    PlanePoint m_ep{};
    PlanePoint m_first{};  ///< of a segment its direction, of an arc that of the start of its sweep
    PlanePoint m_second{};  ///< of an arc the direction of the end, counter-clockwise
    PlanePoint m_centre{};
    double m_radius = 0.0;
    double m_length = 0.0;  ///< of a segment
    bool m_full = false;    ///< the arc counts as a full circle
};

/// The z coordinate of a stretch or an arc; not a number where it is not the same all along.
double heightOf(GmCurve const& curve);

/// The halving point of an arc, up to rounding; nothing for other curves, and for sweeps next to
/// half and full circles.
std::optional<PlanePoint> quickHalvingPoint(GmCurve const& curve);

}  // namespace gmkernel_detail
