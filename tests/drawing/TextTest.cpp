// SPDX-License-Identifier: MIT
#include "drawing/Text.h"

#include <gtest/gtest.h>

#include <limits>

using namespace gmdrawing;

TEST(Text, NumbersAreWrittenShortAndReadBack) {
    EXPECT_EQ(formatReal(-0.0), "0");
    EXPECT_EQ(formatReal(0.1), "0.1");
    EXPECT_EQ(formatFixed(-0.00001, 4), "0.0000");
    EXPECT_EQ(parseReal(formatReal(1.0 / 3.0, 17)), 1.0 / 3.0);
    EXPECT_EQ(formatFixed(std::numeric_limits<double>::max(), 4).size(), 309U + 5U);
}
