// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "part/offset/PartOffset.h"

namespace gmpart {

/// The contours that have no regions, offset by themselves.
class OpenOffset {
public:
    /// @param contours of the drawing; must stay
    /// @param which the numbers of those that have no regions
    /// @param tolerance see partTolerance()
    OpenOffset(const std::vector<Path>& contours, std::vector<std::size_t> which, double tolerance);

    /// Appends the offsets at the distance: beside the contours for the right and the left, round
    /// them else; the contours themselves where the distance is none.
    void append(std::size_t pass, double distance, const OffsetRequest& request,
                PartOffsets& offsets) const;

private:
    using Group = std::vector<std::size_t>;

    void copyAll(std::size_t pass, PartOffsets& offsets) const;
    void runBeside(std::size_t pass, double distance, const OffsetRequest& request,
                   PartOffsets& offsets) const;
    void runRound(std::size_t pass, double distance, const OffsetRequest& request,
                  const Group& group, PartOffsets& offsets) const;
    gmregion::Paths heapOf(const Group& group) const;

    const std::vector<Path>& m_contours;
    Group m_which;
    double m_tolerance;
};

}  // namespace gmpart
