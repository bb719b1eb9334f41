// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

namespace gmmachining {

/// Which contours may be cut next: those that hold no other one, closed or open, that is still to
/// be cut. So holes come before the outline that holds them, as long as the part is held fast.
class CutOrder {
public:
    /// `holders` has for every contour the indices of the contours round it (`enclosingPaths`).
    explicit CutOrder(std::vector<std::vector<std::size_t>> holders);

    /// Indices in increasing order; none when all is cut.
    std::vector<std::size_t> ready() const;

    /// Takes a ready contour out of the order.
    void finish(std::size_t contour);

private:
    std::vector<std::vector<std::size_t>> m_holders;
    std::vector<std::size_t> m_heldUncut;  ///< contours inside that are still to be cut
    std::vector<bool> m_finished;
};

}  // namespace gmmachining
