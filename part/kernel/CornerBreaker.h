// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "gmkernel/GmContour.h"
#include "part/kernel/CornerRoom.h"
#include "part/kernel/PathConversion.h"

namespace gmpart {

/// What a corner becomes, and what the value means.
enum class CornerKind {
    kRounding,         ///< a tangent arc of this radius
    kChamferDistance,  ///< a chamfer that starts and ends at this distance from the corner
    kChamferLength     ///< a chamfer of this length
};

/// A path as a contour of the kernel, which puts transitions into its corners one by one.
class CornerBreaker {
public:
    explicit CornerBreaker(const Path& path);

    /// Why the path is refused; then no corner can be broken.
    KernelRefusal refusal() const { return m_refusal; }

    /// The path without the elements that are too short for the kernel; its joints are the corners.
    const Path& source() const { return m_source.path; }

    /// Puts a transition into the corner where the element `index` ends. False, and nothing has
    /// changed, where it does not fit between its two elements or `room` does not allow it. The
    /// indices behind a broken corner shift: break the last corner first.
    bool breakCorner(std::size_t index, CornerKind kind, double value, const CornerRoom& room);

    /// The path with what has been done so far.
    Path result() const;

private:
    SimplifiedPath m_source;
    GmContour m_contour;
    KernelRefusal m_refusal;
};

}  // namespace gmpart
