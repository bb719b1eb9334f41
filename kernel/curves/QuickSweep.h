// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "kernel/curves/kernels/PlainArc.h"
#include "kernel/values/PlanePoint.h"

namespace gmkernel_detail {

/// Directions next to the end of a sweep are not decided: what is three times the tolerance within
/// which points are equal, in length units.
constexpr double kEndMargin = 3e-4;

/// A point that stands for an exact one.
struct QuickPoint {
    PlanePoint p;
    double error;  ///< what it may be off beside the rounding of its coordinates, in length units
};

/// The sweep of an arc by the directions of its stored angles, for deciding without angles which
/// directions it passes over.
class QuickSweep {
public:
    QuickSweep() = default;
    /// Cost: two sines and cosines.
    explicit QuickSweep(PlainArc const& arc);

    /// To be called when an end of the arc was moved.
    void startMoved(PlainArc const& arc);
    void endMoved(PlainArc const& arc);

    /// The directions of the stored angles, up to rounding.
    PlanePoint start() const { return m_start; }
    PlanePoint end() const { return m_end; }

    /// Does the sweep pass over a unit direction, as the order of angles tells it? Nothing next to
    /// the ends of the sweep, where rounding or a tolerance decides.
    std::optional<bool> passes(PlanePoint direction) const;

    /// The halving point of the arc; nothing where its ends are next to each other.
    std::optional<QuickPoint> halvingPoint(PlainArc const& arc) const;

private:
    enum class Kind { kUnknown, kFull, kNarrow, kWide };

    void classify(PlainArc const& arc);
    bool isNextTo(PlanePoint a, PlanePoint b) const;

    Kind m_kind = Kind::kUnknown;
    bool m_clockwise = false;
    double m_margin = 0.0;  ///< of the sines of angles to the ends
    PlanePoint m_start{};
    PlanePoint m_end{};
};

}  // namespace gmkernel_detail
