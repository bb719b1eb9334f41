// SPDX-License-Identifier: MIT
/// @file
/// Cutting from the inside out.
///
/// Every unit counts those inside it that are still to be cut, and is ready when there are none.
/// It does not choose among those that are ready. Cost: linear in the pairs that lie in one
/// another.

#include "machining/order/CutOrder.h"

#include <utility>

namespace gmmachining {

CutOrder::CutOrder(std::vector<std::vector<std::size_t>> holders)
    : m_holders(std::move(holders)),
      m_heldUncut(m_holders.size(), 0),
      m_finished(m_holders.size()) {
    for (const std::vector<std::size_t>& round : m_holders) {
        for (const std::size_t holder : round)
            ++m_heldUncut[holder];
    }
}

std::vector<std::size_t> CutOrder::ready() const {
    std::vector<std::size_t> found;
    for (std::size_t i = 0; i < m_holders.size(); ++i) {
        if (!m_finished[i] && m_heldUncut[i] == 0) found.push_back(i);
    }
    if (!found.empty()) return found;
    for (std::size_t i = 0; i < m_holders.size(); ++i) {
        if (!m_finished[i]) found.push_back(i);
    }
    return found;
}

void CutOrder::finish(std::size_t unit) {
    m_finished[unit] = true;
    for (const std::size_t holder : m_holders[unit])
        --m_heldUncut[holder];
}

}  // namespace gmmachining
