// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <vector>

#include "part/kernel/BoxedCurve.h"
#include "part/kernel/CornerRoom.h"
#include "part/kernel/PathConversion.h"
#include "region/search/BoxRow.h"

namespace gmpart {

/// What a corner becomes, and what the value means.
enum class CornerKind {
    kRounding,         ///< a tangent arc of this radius
    kChamferDistance,  ///< a chamfer that starts and ends at this distance from the corner
    kChamferLength     ///< a chamfer of this length
};

/// A path as curves of the kernel, which puts transitions into its corners one by one.
class CornerBreaker {
public:
    /// @param path a contour of the drawing
    /// @param own its number there
    CornerBreaker(const Path& path, std::size_t own);

    /// Why the path is refused; then no corner can be broken.
    KernelRefusal refusal() const { return m_refusal; }

    /// The path without the elements that are too short for the kernel; its joints are the corners.
    const Path& source() const { return m_source.path; }

    /// Puts a transition into the corner where the element `index` of the source ends. False, and
    /// nothing has changed, where it does not fit between its two elements, meets another part of
    /// the contour, or `room` does not allow it. Cost: logarithmic, and what is near.
    bool breakCorner(std::size_t index, CornerKind kind, double value, const CornerRoom& room);

    /// The path with what has been done so far.
    Path result() const;

private:
    /// A curve of the contour as it stands; those that transitions have used up are gone.
    struct Link {
        BoxedCurve curve;
        std::size_t previous = 0;
        std::size_t next = 0;

        bool isGone() const { return !curve.curve; }
    };

    std::size_t transitionBehind(std::size_t element) const { return m_links.size() / 2 + element; }
    bool meetsOwn(const BoxedCurve& made, double reach,
                  const std::array<std::size_t, 4>& neighbours) const;

    std::size_t m_own;
    SimplifiedPath m_source;
    KernelRefusal m_refusal = KernelRefusal::kNone;
    std::vector<Link> m_links;  ///< the elements, then the transitions behind each
    gmregion::BoxRow m_boxes;   ///< of the elements as they were
};

}  // namespace gmpart
