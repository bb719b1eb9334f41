// SPDX-License-Identifier: MIT
#include "region/offset/OffsetCheck.h"

#include <gtest/gtest.h>

#include <functional>

#include "region/bridge/OffsetByKernel.h"
#include "region/model/Placement.h"
#include "tests/support/PathShapes.h"

using namespace gmregion;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

using Results = std::vector<Path>;

/// Two lobes and a neck of width 4 between them, with a bay and rounded corners.
Path hourglass() {
    return {{{{0, 0}, {18, 0}},
             {{18, 0}, {20, 8}},
             {{20, 8}, {30, 8}},
             {{30, 8}, {32, 0}},
             {{32, 0}, {48, 0}},
             {{48, 0}, {50, 2}, 0.41421356237309503},
             {{50, 2}, {50, 20}},
             {{50, 20}, {32, 20}, 0.2},
             {{32, 20}, {30, 12}},
             {{30, 12}, {20, 12}},
             {{20, 12}, {18, 20}},
             {{18, 20}, {12, 20}},
             {{12, 20}, {6, 20}, -1.0},
             {{6, 20}, {0, 20}},
             {{0, 20}, {0, 0}}},
            true,
            "0"};
}

/// Away from upright and level sides, where the kernel has its corners.
Path turned(const Path& path) {
    return Placement::turning(0.3, {0, 0}).apply(path);
}

Results kernelResults(const Path& source, double d) {
    return offsetByKernel(source, d).results;
}

void removeElement(Path& path, std::size_t index) {
    path.elements.erase(path.elements.begin() + static_cast<std::ptrdiff_t>(index));
}

}  // namespace

TEST(OffsetCheck, SoundOffsetsPass) {
    // With -2 the neck is exactly two distances wide, with 3 the bay's radius is the distance.
    const Path ccw = turned(hourglass());
    const Path cw = reversed(ccw);
    for (const double d : {0.5, -0.5, 1.0, -1.9, -2.0, 2.0, -2.1, 3.0, -3.0, -6.0, 40.0, -40.0}) {
        EXPECT_EQ(checkOffset(ccw, d, kernelResults(ccw, d)), OffsetFault::kNone) << d;
        EXPECT_EQ(checkOffset(cw, -d, kernelResults(cw, -d)), OffsetFault::kNone) << d;
    }
    EXPECT_EQ(checkOffset(ccw, -40.0, {}), OffsetFault::kNone);
    EXPECT_EQ(checkOffset(circle({3, 4}, 5.0), -5.0, {}), OffsetFault::kNone);
    Path open = turned(hourglass());
    open.closed = false;
    open.elements.pop_back();
    for (const double d : {1.0, -1.0, 3.0, -3.0, 40.0}) {
        EXPECT_EQ(checkOffset(open, d, kernelResults(open, d)), OffsetFault::kNone) << d;
    }
}

TEST(OffsetCheck, DamageIsFound) {
    struct Damage {
        const char* name;
        std::function<void(Results&)> apply;
        OffsetFault fault;
    };
    const std::vector<Damage> damages = {
        {"moved",
         [](Results& results) {
             for (Element& e : results[0].elements)
                 e = {e.sp + Vec2{2e-3, 0}, e.ep + Vec2{2e-3, 0}, e.bulge};
         },
         OffsetFault::kDistance},
        {"an arc made straight",
         [](Results& results) {
             for (Element& e : results[0].elements)
                 e.bulge = 0.0;
         },
         OffsetFault::kDistance},
        {"a corner cut by 0.1",
         [](Results& results) {
             Element& e = results[0].elements[0];
             Element& next = results[0].elements[1];
             const Vec2 before = e.ep - 0.1 * tangentEnd(e);
             e = withEnds(e, e.sp, before);
             next = withEnds(next, before, next.ep);
         },
         OffsetFault::kDistance},
        {"opened",
         [](Results& results) {
             results[0].closed = false;
             results[0].elements.pop_back();
         },
         OffsetFault::kOpen},
        {"a loop missing", [](Results& results) { results.pop_back(); }, OffsetFault::kMissing},
        {"all missing", [](Results& results) { results.clear(); }, OffsetFault::kMissing},
        {"a piece missing", [](Results& results) { removeElement(results[0], 2); },
         OffsetFault::kMissing},
    };
    const Path source = turned(hourglass());
    const double d = -2.5;
    const Results sound = kernelResults(source, d);
    ASSERT_EQ(sound.size(), 2U);
    ASSERT_EQ(checkOffset(source, d, sound), OffsetFault::kNone);
    for (const Damage& damage : damages) {
        Results damaged = sound;
        damage.apply(damaged);
        EXPECT_EQ(checkOffset(source, d, damaged), damage.fault) << damage.name;
    }
    EXPECT_EQ(checkOffset(source, -d, sound), OffsetFault::kMissing) << "on the other side";
}

TEST(OffsetCheck, WhatTheKernelLeavesOutIsNoFaultWhileItIsTiny) {
    // Shrunk to a polygon of twelve sides of 8e-4, each too short for the kernel.
    const auto regular = [](int corners, double side) {
        std::vector<Vec2> points;
        for (int i = 0; i < corners; ++i) {
            const double angle = 2.0 * path_shapes::kPi * i / corners;
            const double r = 0.5 * side / std::sin(path_shapes::kPi / corners);
            points.push_back({r * std::cos(angle), r * std::sin(angle)});
        }
        return polygon(points);
    };
    const double perSide = 2.0 * std::tan(path_shapes::kPi / 12);  // of the inner radius
    EXPECT_EQ(checkOffset(regular(12, 8e-4 + 10.0 * perSide), -10.0, {}), OffsetFault::kNone);
    EXPECT_EQ(checkOffset(regular(12, 2e-3 + 10.0 * perSide), -10.0, {}), OffsetFault::kMissing);
    // Of forty such sides the loop is still a tiny one, of eighty no more.
    const auto lost = [&](int corners) {
        const double apothem = 10.0 + 0.5 * 8e-4 / std::tan(path_shapes::kPi / corners);
        const double side = 2.0 * apothem * std::tan(path_shapes::kPi / corners);
        return checkOffset(regular(corners, side), -10.0, {});
    };
    EXPECT_EQ(lost(40), OffsetFault::kNone);
    EXPECT_EQ(lost(80), OffsetFault::kMissing);
    // Many short pieces are no tiny loop.
    EXPECT_EQ(checkOffset(regular(2000, 9e-4), 0.05, {}), OffsetFault::kMissing);
    // Hooks of 8e-4 run round their tip in the other sense; nothing is asked for there.
    const Path hooked = polygon({{10, 0}, {10, 10}, {0, 10}, {0, 0}, {-6e-4, -5e-4}, {1e-4, 6e-4}});
    EXPECT_EQ(checkOffset(hooked, -1.0, {rectangle({1, 1}, {9, 9})}), OffsetFault::kNone);
}
