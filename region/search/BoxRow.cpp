// SPDX-License-Identifier: MIT
#include "region/search/BoxRow.h"

#include <algorithm>

namespace gmregion {

void BoxRow::begin(std::size_t count) {
    m_boxes.clear();
    m_ends.clear();
    m_boxes.reserve(count + count / 7 + 8);
}

void BoxRow::assign(const std::vector<Box>& boxes) {
    begin(boxes.size());
    m_boxes.insert(m_boxes.end(), boxes.begin(), boxes.end());
    finish();
}

void BoxRow::finish() {
    if (m_boxes.empty()) return;
    m_ends.push_back(m_boxes.size());
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
