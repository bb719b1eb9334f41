// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "kernel/curves/PlainCurve.h"
#include "kernel/curves/QuickSweep.h"

namespace gmkernel_detail {

/// A source element in plain numbers, for telling quickly whether a point is nearer to it than a
/// threshold, as `Distance` would tell it.
class QuickDistance {
public:
    explicit QuickDistance(GmCurve const& element);

    /// The height at which points are compared with the element.
    double z() const { return m_z; }

    /// Nothing where the answer depends on rounding or on a tolerance, or where the element is of
    /// another kind; then `Distance` has to be asked. Beside its error the point is known to about
    /// 1e-13 of its size.
    std::optional<bool> isNearer(QuickPoint const& point, double threshold) const;

private:
    enum class Kind { kUnknown, kSegment, kArc };

    void take(PlainSegment const& segment);
    void take(PlainArc const& arc);
    std::optional<double> toSegment(PlanePoint p) const;
    std::optional<double> toArc(QuickPoint const& point) const;
    bool isBesideEnd(PlanePoint p) const;
    double toEnds(PlanePoint p) const;

    Kind m_kind = Kind::kUnknown;
    double m_z = 0.0;
    double m_size = 0.0;  ///< what the rounding of its coordinates goes by
    PlanePoint m_sp{};
    PlanePoint m_ep{};
    PlanePoint m_direction{};  ///< of a segment
    double m_length = 0.0;     ///< of a segment
    PlanePoint m_centre{};
    double m_radius = 0.0;
    QuickSweep m_sweep;
};

/// The z coordinate of a curve; not a number where it is not the same all along.
double heightOf(PlainCurve const& curve);

}  // namespace gmkernel_detail
