// SPDX-License-Identifier: MIT
#include "region/offset/CheckedOffset.h"

#include <gtest/gtest.h>

#include "region/offset/OffsetJob.h"
#include "tests/support/PathShapes.h"

using namespace gmregion;
using path_shapes::kPi;
using path_shapes::polygon;

namespace {

Path star(int tips, double outer, double inner) {
    std::vector<Vec2> corners;
    for (int i = 0; i < 2 * tips; ++i) {
        const double angle = 0.1 + kPi * i / tips;
        const double r = i % 2 == 0 ? outer : inner;
        corners.push_back({r * std::cos(angle), r * std::sin(angle)});
    }
    return polygon(corners);
}

const Path kCrossing = polygon({{0, 0}, {20, 12}, {20, 0}, {0, 10}});

struct Case {
    const char* name;
    Path source;
    double d;
};

/// Offsets over which the kernel stumbles.
std::vector<Case> stumblingBlocks() {
    return {
        {"sides tilted by 1e-6, an element of 2e-4",
         polygon({{0, 0}, {15, 0}, {15.0002, 0}, {30, 0}, {30.00003, 30}, {0.00003, 30}}), 2.0},
        {"a hook of 1.5e-3 at the start",
         polygon({{5, 11}, {5.0015, 11}, {0, 10}, {0, 0}, {10, 0}, {10, 10}}), 1.0},
        {"an outline of arcs about tips", star(5, 20.0, 5.0), 60.0},
        {"a hollow between tips", star(5, 60.0, 15.0), -9.0},
        {"scraps beside flat arcs",
         {{{{0, 0}, {27, -5}, -1.5e-4},
           {{27, -5}, {20, 22}, 1.2e-4},
           {{20, 22}, {4, 35}, -1.3e-4},
           {{4, 35}, {0, 0}, 3e-5}},
          true,
          "0"},
         17.0},
        {"flat arcs in line",
         {{{{0, 0}, {47, 2}, -3e-5},
           {{47, 2}, {25, 24}, 9e-5},
           {{25, 24}, {10, 39}, -3e-5},
           {{10, 39}, {0, 0}, 2e-4}},
          true,
          "0"},
         16.0},
    };
}

/// Every element of every result lies at the distance from the element that is its origin.
void expectOrigins(const KernelOffset& offset, const Path& source, double d) {
    ASSERT_EQ(offset.origins.size(), offset.results.size());
    for (std::size_t i = 0; i < offset.results.size(); ++i) {
        const Path& result = offset.results[i];
        ASSERT_EQ(offset.origins[i].size(), result.elements.size());
        for (std::size_t k = 0; k < result.elements.size(); ++k) {
            const Element& origin = source.elements.at(offset.origins[i][k]);
            EXPECT_NEAR(distance(origin, halvingPoint(result.elements[k])), std::abs(d), 2e-3);
        }
    }
}

void expectMended(const Path& source, double d) {
    const CheckedOffset checked = offsetChecked(source, d);
    EXPECT_EQ(checked.fault, OffsetFault::kNone);
    EXPECT_EQ(checkOffset(source, d, checked.offset.results), OffsetFault::kNone);
    for (const Path& result : checked.offset.results) {
        EXPECT_TRUE(result.closed);
        EXPECT_EQ(result.layer, source.layer);
        EXPECT_EQ(result.elements.back().ep, result.elements.front().sp);
    }
    expectOrigins(checked.offset, source, d);
}

bool kernelStumbles(const Path& source, double d) {
    return checkOffset(source, d, offsetByKernel(source, d).results) != OffsetFault::kNone;
}

}  // namespace

TEST(CheckedOffset, MendsWhatTheKernelGetsWrong) {
    for (const auto& [name, source, d] : stumblingBlocks()) {
        SCOPED_TRACE(name);
        const Path against = reversed(source);
        EXPECT_TRUE(kernelStumbles(source, d) || kernelStumbles(against, -d));
        expectMended(source, d);
        expectMended(against, -d);
    }
}

TEST(CheckedOffset, NamesTheFaultWhereNoAttemptPasses) {
    const CheckedOffset crossing = offsetChecked(kCrossing, -1.0);
    EXPECT_EQ(crossing.fault, OffsetFault::kOpen);
    EXPECT_GT(crossing.attempts, 1);
    EXPECT_FALSE(crossing.offset.results.empty());
    const Path undefined = polygon({{0, 0}, {std::nan(""), 0}, {1, 1}});
    EXPECT_NE(offsetChecked(undefined, 1.0).offset.refusal, Refusal::kNone);
    EXPECT_TRUE(offsetChecked({}, 1.0).offset.results.empty());
}

TEST(CheckedOffset, JobMarksResultsOfFaultyOffsetsOnly) {
    const auto offsets = offsetContours({reversed(kCrossing), star(5, 20, 5)}, {0, 0},
                                        {Side::kRight, {1.0, 60.0}}, [](auto, auto) {});
    EXPECT_EQ(offsets[0].faults.at(0).fault, OffsetFault::kOpen);
    EXPECT_TRUE(offsets[0].paths.at(0).doubtful);
    EXPECT_TRUE(offsets[1].faults.empty());
    ASSERT_EQ(offsets[1].paths.size(), 2U);
    EXPECT_FALSE(offsets[1].paths[0].doubtful || offsets[1].paths[1].doubtful);
}
