#include "Text.h"

#include <gtest/gtest.h>

#include <limits>

using namespace gmpath;

TEST(Text, RealsAreWholeAndFinite) {
    EXPECT_EQ(parseReal(" 1.5\r"), 1.5);
    EXPECT_EQ(parseReal("+2e3"), 2000.0);
    EXPECT_EQ(parseReal("-1,25"), -1.25);
    for (const char* bad :
         {"", "nan", "inf", "-inf", "1e999", "1.5x", "0x10", "+-1", "1 2", "--1"}) {
        EXPECT_FALSE(parseReal(bad).has_value()) << bad;
    }
}

TEST(Text, NumbersAreWrittenShortAndReadBack) {
    EXPECT_EQ(formatReal(-0.0), "0");
    EXPECT_EQ(formatReal(0.1), "0.1");
    EXPECT_EQ(formatFixed(-0.00001, 4), "0.0000");
    EXPECT_EQ(parseReal(formatReal(1.0 / 3.0, 17)), 1.0 / 3.0);
    EXPECT_EQ(formatFixed(std::numeric_limits<double>::max(), 4).size(), 309U + 5U);
}
