// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <random>

#include "gmregion/CleanUp.h"
#include "gmregion/Clip.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

/// A square of 10 with a square hole of 4 in its middle.
RegionSet frame() {
    Paths heap;
    heap.add(rectangle(0, 0, 10, 10), true);
    heap.add(rectangle(3, 3, 4, 4), true);
    return cleanUp(heap, {FillRule::kEvenOdd, 0.0}).regions;
}

std::vector<Place> placesOf(const Clipping& clipping) {
    std::vector<Place> places;
    for (const ClippedPart& part : clipping.parts)
        places.push_back(part.place);
    return places;
}

double lengthOf(const Clipping& clipping, Place place) {
    double sum = 0.0;
    for (const ClippedPart& part : clipping.parts) {
        for (std::uint32_t i = part.first; i < part.last && part.place == place; ++i)
            sum += lengthAlong(clipping.elements[i]);
    }
    return sum;
}

TEST(Clip, CutsPathsWhereTheyEnterAndLeave) {
    Paths paths;
    paths.add(Elements{{{-1, 5}, {11, 5}, 0}}, false, 7);
    paths.add(Elements{{{-1, 0}, {5, 0}, 0}, {{5, 0}, {5, 2}, 0}}, false, 8);
    paths.add(circle({5, 5}, 1), true, 9);
    paths.add(circle({0, 5}, 1), true, 10);
    const Clipping clipping = clip(paths, frame());
    ASSERT_FALSE(clipping.refusal);
    using P = Place;
    EXPECT_EQ(placesOf(clipping),
              (std::vector<Place>{P::kOutside, P::kInside, P::kOutside, P::kInside, P::kOutside,
                                  P::kOutside, P::kOnBoundary, P::kInside,  // the second
                                  P::kOutside,                              // within the hole
                                  P::kInside, P::kOutside}));
    EXPECT_TRUE(clipping.parts[8].closed);
    EXPECT_FALSE(clipping.parts[9].closed);
    EXPECT_EQ(clipping.parts[9].last - clipping.parts[9].first, 2U);
    EXPECT_EQ(clipping.origins.front().path, 7);
    EXPECT_EQ(clipping.origins.back().path, 10);
    EXPECT_NEAR(lengthOf(clipping, P::kOnBoundary), 5.0, 1e-9);
    for (const ClippedPart& part : clipping.parts) {
        for (std::uint32_t i = part.first + 1; i < part.last; ++i)
            EXPECT_TRUE(clipping.elements[i].sp == clipping.elements[i - 1].ep);
    }
}

TEST(Clip, AgreesWithWindingsAndKeepsLengths) {
    std::mt19937 engine(17);
    Workspace workspace;
    Clipping clipping;
    for (int i = 0; i < 200; ++i) {
        Paths heap;
        heap.add(tangle(engine, 8, 10.0), true);
        const RegionSet set = cleanUp(heap).regions;
        Paths paths;
        Elements path = tangle(engine, 6, 10.0);
        double length = 0.0;
        for (const Element& e : path)
            length += lengthAlong(e);
        paths.add(path, i % 2 == 0);
        ASSERT_TRUE(clip(paths, set, workspace, clipping)) << i;
        double found = 0.0;
        for (const ClippedPart& part : clipping.parts) {
            for (std::uint32_t k = part.first; k < part.last; ++k) {
                found += lengthAlong(clipping.elements[k]);
                const bool inside = winding(set, middleOf(clipping.elements[k])) > 0;
                EXPECT_EQ(inside, part.place == Place::kInside) << i;
            }
        }
        EXPECT_NEAR(found, length, 1e-6);
    }
}

TEST(Clip, AnswersEmptySetsAndRefusesWhatIsNoPath) {
    Paths paths;
    paths.add(Elements{{{0, 0}, {1, 0}, 0}}, false);
    const Clipping outside = clip(paths, RegionSet{});
    ASSERT_EQ(outside.parts.size(), 1U);
    EXPECT_EQ(outside.parts.front().place, Place::kOutside);
    EXPECT_TRUE(clip(Paths{}, frame()).parts.empty());
    paths.add(Elements{{{0, 0}, {std::numeric_limits<double>::quiet_NaN(), 0}, 0}}, false);
    const Clipping refused = clip(paths, frame());
    EXPECT_EQ(refused.refusal.reason, Reason::kNotFinite);
    EXPECT_TRUE(refused.parts.empty());
}

}  // namespace
