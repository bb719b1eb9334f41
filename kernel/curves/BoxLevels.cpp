// SPDX-License-Identifier: MIT
#include "kernel/curves/BoxLevels.h"

namespace gmkernel_detail {

void BoxLevels::append(CurveBox const& box) {
    if (m_levels.empty()) m_levels.emplace_back();
    m_levels.front().push_back(box);
    for (std::size_t level = 1; m_levels[level - 1].size() > 1; ++level) {
        if (level == m_levels.size()) {
            if (m_levels[level - 1].size() <= (std::size_t{1} << kBits)) return;
            m_levels.emplace_back();
            m_levels[level].push_back(boxAbout(level, 0));
        }
        const std::size_t above = (m_levels[level - 1].size() - 1) >> kBits;
        if (above == m_levels[level].size()) {
            m_levels[level].push_back(CurveBox::empty());
        }
        m_levels[level][above].include(box);
    }
}

void BoxLevels::include(std::size_t index, CurveBox const& box) {
    for (std::vector<CurveBox>& level : m_levels) {
        level[index].include(box);
        index >>= kBits;
    }
}

void BoxLevels::replace(std::size_t index, CurveBox const& box) {
    m_levels.front()[index] = box;
    for (std::size_t level = 1; level < m_levels.size(); ++level) {
        index >>= kBits;
        m_levels[level][index] = boxAbout(level, index);
    }
}

CurveBox BoxLevels::boxAbout(std::size_t level, std::size_t index) const {
    std::vector<CurveBox> const& below = m_levels[level - 1];
    const std::size_t end = std::min((index + 1) << kBits, below.size());
    CurveBox box = CurveBox::empty();
    for (std::size_t i = index << kBits; i < end; ++i)
        box.include(below[i]);
    return box;
}

}  // namespace gmkernel_detail
