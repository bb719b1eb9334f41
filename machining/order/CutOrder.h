// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

namespace gmmachining {

/// Which units may be cut next: those that hold no other one that is still to be cut. So holes come
/// before the outline that holds them, as long as the part is held fast.
class CutOrder {
public:
    /// `holders` has for every unit those that it lies in directly (`holdersOfUnits`).
    explicit CutOrder(std::vector<std::vector<std::size_t>> holders);

    /// Indices in increasing order; none when all is cut. All that are left where none can be
    /// first, since they hold each other.
    std::vector<std::size_t> ready() const;

    /// Takes a ready unit out of the order.
    void finish(std::size_t unit);

private:
    std::vector<std::vector<std::size_t>> m_holders;
    std::vector<std::size_t> m_heldUncut;  ///< units inside that are still to be cut
    std::vector<bool> m_finished;
};

}  // namespace gmmachining
