// SPDX-License-Identifier: MIT
#include "region/nodes/NodeClusters.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <numeric>
#include <random>
#include <vector>

#include "region/plane/Nearest.h"

namespace {

using namespace gmregion;

/// Points on a coarse grid with noise of about the tolerance, in chains, and equal ones.
std::vector<Vec2> nearPoints(std::mt19937& engine, std::size_t count, double tolerance,
                             Vec2 about) {
    const auto unit = [&engine] { return double(engine()) / double(std::mt19937::max()); };
    std::vector<Vec2> points;
    for (std::size_t i = 0; i < count; ++i) {
        const Vec2 grid{double(engine() % 7), double(engine() % 5)};
        const Vec2 noise{tolerance * (6 * unit() - 3), tolerance * (2 * unit() - 1)};
        points.push_back(engine() % 9 == 0 && i > 0 ? points[i / 2] : about + grid + noise);
    }
    return points;
}

}  // namespace

TEST(NodeClusters, MoveNoPointFarAndKeepNodesApart) {
    std::mt19937 engine(4);
    for (int trial = 0; trial < 60; ++trial) {
        const double tolerance = std::pow(10.0, -double(engine() % 9) - 1);
        const Vec2 about = engine() % 2 == 0 ? Vec2{0, 0} : Vec2{-123.4, 5e4};
        const std::vector<Vec2> points = nearPoints(engine, 400, tolerance, about);
        NodeClusters clusters;
        clusters.assign(points, tolerance);
        const double rounding = 1e-11;
        for (std::size_t i = 0; i < points.size(); ++i) {
            const Vec2 node = clusters.nodes()[clusters.nodeOf(i)];
            ASSERT_LE(distance(node, points[i]), tolerance + rounding);
        }
        for (std::size_t i = 0; i < clusters.nodes().size(); ++i) {
            for (std::size_t j = 0; j < i; ++j)
                ASSERT_GT(distance(clusters.nodes()[i], clusters.nodes()[j]), tolerance - rounding);
        }
    }
}

TEST(NodeClusters, DoNotDependOnTheOrderOfThePoints) {
    std::mt19937 engine(5);
    const std::vector<Vec2> points = nearPoints(engine, 500, 0.05, {3, -2});
    NodeClusters clusters;
    clusters.assign(points, 0.05);
    std::vector<std::size_t> order(points.size());
    std::iota(order.begin(), order.end(), std::size_t{0});
    std::shuffle(order.begin(), order.end(), engine);
    std::vector<Vec2> shuffled;
    for (const std::size_t i : order)
        shuffled.push_back(points[i]);
    NodeClusters again;
    again.assign(shuffled, 0.05);
    ASSERT_EQ(again.nodes(), clusters.nodes());
    for (std::size_t i = 0; i < order.size(); ++i)
        EXPECT_EQ(again.nodeOf(i), clusters.nodeOf(order[i]));
    again.assign({}, 0.05);
    EXPECT_TRUE(again.nodes().empty());
}

TEST(NodeClusters, AChainOfNearPointsStaysAChain) {
    std::vector<Vec2> chain;
    for (int i = 0; i < 1000; ++i)
        chain.push_back({0.009 * i, 0});
    NodeClusters clusters;
    clusters.assign(chain, 0.01);
    EXPECT_EQ(clusters.nodes().size(), 500u) << "two by two";
}

TEST(Nearest, IsTheNearestPointOfTheElement) {
    std::mt19937 engine(6);
    const auto unit = [&engine] {
        return 2.0 * double(engine()) / double(std::mt19937::max()) - 1;
    };
    for (int i = 0; i < 20000; ++i) {
        Element e{{unit(), unit()}, {unit(), unit()}, 0};
        if (engine() % 3 != 0) e.bulge = unit();
        if (distance(e.sp, e.ep) < 1e-3) continue;
        const Vec2 p{2 * unit(), 2 * unit()};
        const Vec2 nearest = nearestOn(e, carrierOf(e), p);
        EXPECT_NEAR(distance(nearest, p), distance(e, p), 1e-11) << i;
        EXPECT_NEAR(distance(e, nearest), 0.0, 1e-11) << i;
    }
}
