// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>

#include "gmregion/Questions.h"

#include "part/clean/CleanJob.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
using gmregion::FillRule;
using gmregion::kPi;
using gmregion::Vec2;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

double cleanedArea(const std::vector<Path>& contours, std::optional<FillRule> rule) {
    const CleanResult cleaned = cleanPart(contours, {rule, 0.0, 0.0});
    EXPECT_FALSE(cleaned.result.refusal);
    return area(cleaned.result.regions);
}

}  // namespace

TEST(Clean, RulesSayWhatIsCovered) {
    // Two squares that overlap and a hole that reaches out of one of them into the other.
    const std::vector<Path> contours = {rectangle({0, 0}, {10, 10}), rectangle({8, 0}, {18, 10}),
                                        rectangle({2, 2}, {5, 5})};
    EXPECT_NEAR(cleanedArea(contours, std::nullopt), 180.0 - 9.0, 1e-6);
    EXPECT_NEAR(cleanedArea(contours, FillRule::kNonZero), 180.0, 1e-6);
    EXPECT_NEAR(cleanedArea(contours, FillRule::kEvenOdd), 160.0 - 9.0, 1e-6);
    EXPECT_NEAR(cleanedArea({reversed(contours[0])}, FillRule::kPositive), 0.0, 1e-12);
    // By nesting, a contour that crosses itself is filled, whatever the sense of its lobes.
    const Path bow = polygon({{0, 0}, {10, 10}, {10, 0}, {0, 10}});
    EXPECT_NEAR(cleanedArea({bow}, std::nullopt), 50.0, 1e-6);
}

TEST(Clean, RunsAreFittedWithinTheDistanceAndTheRestIsCounted) {
    std::vector<Vec2> round;
    for (int i = 0; i < 90; ++i)
        round.push_back({20.0 + 5.0 * std::cos(i * kPi / 45.0), 5.0 * std::sin(i * kPi / 45.0)});
    const std::vector<Path> contours = {polygon(round), rectangle({0, -10}, {30, 10}),
                                        polygon({{0, 20}, {5, 20}}, false)};
    const CleanResult plain = cleanPart(contours, {});
    EXPECT_EQ(plain.result.regions.elements().size(), 94U);
    EXPECT_EQ(plain.left, 1U);
    const CleanResult fitted = cleanPart(contours, {std::nullopt, 0.0, 0.02});
    EXPECT_EQ(fitted.unfitted, 94U);
    EXPECT_LE(fitted.result.regions.elements().size(), 8U);
    EXPECT_EQ(fitted.result.regions.loops().size(), 2U);
    EXPECT_NEAR(area(fitted.result.regions), area(plain.result.regions), 0.02 * 10.0 * kPi);
}
