// SPDX-License-Identifier: MIT
#include "kernel/curves/BoxLevels.h"

#include <gtest/gtest.h>

#include <cmath>
#include <random>
#include <vector>

namespace {

using namespace gmkernel_detail;

class BoxRows : public testing::Test {
protected:
    double coordinate() { return double(m_engine() % 1000U) / 10.0; }

    CurveBox box() {
        const double left = coordinate();
        const double bottom = coordinate();
        return {left, left + coordinate() / 20.0, bottom, bottom + coordinate() / 20.0};
    }

    /// What a look at every box finds.
    std::vector<std::size_t> found(CurveBox const& query, std::size_t first) const {
        std::vector<std::size_t> numbers;
        for (std::size_t i = first; i < m_row.size(); ++i) {
            if (query.overlaps(m_row[i])) numbers.push_back(i);
        }
        return numbers;
    }

    std::mt19937 m_engine{3};
    std::vector<CurveBox> m_row;
};

}  // namespace

TEST_F(BoxRows, FindWhatALookAtEveryBoxFindsInTheSameOrder) {
    BoxLevels levels;
    std::size_t total = 0;
    for (int step = 0; step < 2000; ++step) {
        m_row.push_back(box());
        if (step % 97 == 0) m_row.back().left = std::nan("");
        levels.append(m_row.back());
        const std::size_t changed = m_engine() % m_row.size();
        const CurveBox other = box();
        if (step % 3 == 0) {
            m_row[changed].include(other);
            levels.include(changed, other);
        } else if (step % 7 == 0) {
            m_row[changed] = other;
            levels.replace(changed, other);
        }
        const std::size_t first = m_engine() % (m_row.size() + 1);
        const CurveBox query = box();
        std::vector<std::size_t> numbers;
        const bool stopped = levels.visitUntil(query, first, [&](std::size_t i) {
            numbers.push_back(i);
            return false;
        });
        ASSERT_FALSE(stopped);
        ASSERT_EQ(numbers, found(query, first)) << step;
        total += numbers.size();
        if (numbers.empty()) continue;
        ASSERT_TRUE(
            levels.visitUntil(query, first, [&](std::size_t i) { return i == numbers.back(); }));
    }
    EXPECT_GT(total, 1000U);
}
