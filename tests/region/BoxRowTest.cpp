// SPDX-License-Identifier: MIT
#include "region/search/BoxRow.h"

#include <gtest/gtest.h>

#include <cmath>
#include <random>
#include <set>
#include <utility>
#include <vector>

#include "region/plane/ElementBox.h"

namespace {

using namespace gmregion;
using Pairs = std::set<std::pair<std::size_t, std::size_t>>;

double unit(std::mt19937& engine) {
    return double(engine()) / double(std::mt19937::max());
}

/// The boxes of a walk that comes back to itself now and then.
std::vector<Box> boxesOfAWalk(std::mt19937& engine, std::size_t count) {
    std::vector<Box> boxes;
    Vec2 at{0, 0};
    for (std::size_t i = 0; i < count; ++i) {
        const Vec2 to = at + Vec2{2 * unit(engine) - 1, 2 * unit(engine) - 0.9};
        Box box;
        box.include(at);
        box.include(to);
        boxes.push_back(box);
        at = i % 40 == 39 ? Vec2{0, 0} : to;
    }
    return boxes;
}

/// Every two boxes that overlap, by looking at all.
Pairs overlappingPairs(const std::vector<Box>& boxes) {
    Pairs pairs;
    for (std::size_t i = 0; i < boxes.size(); ++i) {
        for (std::size_t j = i + 1; j < boxes.size(); ++j) {
            if (boxes[i].overlaps(boxes[j])) pairs.emplace(i, j);
        }
    }
    return pairs;
}

std::vector<std::size_t> overlapping(const std::vector<Box>& boxes, const Box& probe) {
    std::vector<std::size_t> hit;
    for (std::size_t i = 0; i < boxes.size(); ++i) {
        if (boxes[i].overlaps(probe)) hit.push_back(i);
    }
    return hit;
}

/// A segment or an arc, flat or up to half a turn, to either side.
Element anyElement(std::mt19937& engine) {
    Element e{{unit(engine), unit(engine)}, {unit(engine), unit(engine)}, 0};
    if (engine() % 4 != 0) e.bulge = std::pow(10.0, -9.0 * unit(engine));
    if (engine() % 2 == 0) e.bulge = -e.bulge;
    return e;
}

bool holdsPointsOf(const Box& box, const Element& e) {
    for (int k = 0; k <= 20; ++k) {
        const Vec2 p = pointAt(e, 0.05 * k);
        if (!box.holds(Box{p, p})) return false;
    }
    return true;
}

}  // namespace

TEST(BoxRow, VisitsEveryPairAndEveryBoxThatOverlapsOnce) {
    std::mt19937 engine(2);
    BoxRow row;
    for (const std::size_t count : {0u, 1u, 2u, 7u, 8u, 9u, 64u, 65u, 300u, 513u}) {
        const std::vector<Box> boxes = boxesOfAWalk(engine, count);
        row.assign(boxes);
        ASSERT_EQ(row.size(), count);
        Pairs found;
        std::size_t visits = 0;
        row.visitPairs([&](std::size_t i, std::size_t j) {
            found.emplace(i, j);
            ++visits;
            return true;
        });
        EXPECT_EQ(found, overlappingPairs(boxes)) << count;
        EXPECT_EQ(visits, found.size()) << count;

        const Box probe{{0, 0}, {1, 2}};
        std::vector<std::size_t> hit;
        row.visitOverlapping(probe, [&](std::size_t i) { hit.push_back(i); });
        EXPECT_EQ(hit, overlapping(boxes, probe)) << "in the order of the row";
    }
}

TEST(ElementBox, HoldsTheElementAndLittleMore) {
    std::mt19937 engine(3);
    for (int i = 0; i < 20000; ++i) {
        const Element e = anyElement(engine);
        const Box box = boxAbout(e);
        const double chord = length(e.ep - e.sp);
        EXPECT_TRUE(holdsPointsOf(box.grown(1e-14 * (1.0 + chord)), e)) << i << " " << e.bulge;
        const bool flat = std::fabs(e.bulge) < 0.1;
        const double margin = flat ? 0.501 * std::fabs(e.bulge) * chord : 0.0;
        EXPECT_TRUE(boundingBox(e).grown(margin + 1e-13 * (1.0 + chord)).holds(box))
            << i << " " << e.bulge;
    }
}
