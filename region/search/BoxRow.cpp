// SPDX-License-Identifier: MIT
#include "region/search/BoxRow.h"

#include <algorithm>

namespace gmregion {

void BoxRow::assign(const std::vector<Box>& boxes) {
    m_boxes.assign(boxes.begin(), boxes.end());
    m_ends.clear();
    if (boxes.empty()) return;
    m_ends.push_back(boxes.size());
    while (countOf(top()) > 1) {
        const std::size_t end = m_ends.back();
        for (std::size_t first = beginOf(top()); first < end; first += std::size_t{1} << kBits) {
            Box about = m_boxes[first];
            for (std::size_t i = first + 1; i < std::min(first + (std::size_t{1} << kBits), end);
                 ++i)
                about.include(m_boxes[i]);
            m_boxes.push_back(about);
        }
        m_ends.push_back(m_boxes.size());
    }
}

}  // namespace gmregion
