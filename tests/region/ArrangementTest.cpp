// SPDX-License-Identifier: MIT
#include "region/nodes/Arrangement.h"

#include <gtest/gtest.h>

#include <cmath>
#include <map>
#include <random>
#include <vector>

#include "region/plane/Crossing.h"

namespace {

using namespace gmregion;

std::vector<Element> polygon(const std::vector<Vec2>& corners) {
    std::vector<Element> loop;
    for (std::size_t i = 0; i < corners.size(); ++i)
        loop.push_back({corners[i], corners[(i + 1) % corners.size()], 0});
    return loop;
}

std::vector<Element> square(double x, double y, double side) {
    return polygon({{x, y}, {x + side, y}, {x + side, y + side}, {x, y + side}});
}

void append(std::vector<Element>& all, const std::vector<Element>& loop) {
    all.insert(all.end(), loop.begin(), loop.end());
}

/// Twice the area swept from the origin along an element, the segment of an arc included.
double doubledArea(const Element& e) {
    const double half = std::atan(e.bulge) * 2.0;
    const double chord = distance(e.sp, e.ep);
    if (e.bulge == 0.0) return cross(e.sp, e.ep);
    const double r = chord / (2.0 * std::sin(half));
    return cross(e.sp, e.ep) + r * r * (2.0 * half - std::sin(2.0 * half));
}

Element elementOf(const Arrangement& arrangement, const Edge& edge) {
    return {arrangement.nodes()[edge.from], arrangement.nodes()[edge.to], edge.bulge};
}

/// What every arrangement of closed loops holds.
void expectSound(const Arrangement& arrangement, const std::vector<Element>& elements,
                 double tolerance) {
    std::map<std::size_t, int> balance;
    double area = 0.0;
    double length = 0.0;
    for (const Edge& edge : arrangement.edges()) {
        ASSERT_LT(edge.from, edge.to);
        balance[edge.from] += edge.multiplicity;
        balance[edge.to] -= edge.multiplicity;
        area += edge.multiplicity * doubledArea(elementOf(arrangement, edge));
    }
    for (const auto& [node, sum] : balance)
        EXPECT_EQ(sum, 0) << "node " << node;
    for (const Element& e : elements) {
        area -= doubledArea(e);
        length += gmregion::length(e);
    }
    EXPECT_NEAR(area, 0.0, 8.0 * tolerance * length);
}

/// No two edges cross away from their nodes.
void expectPlanar(const Arrangement& arrangement, double tolerance) {
    const std::vector<Edge>& edges = arrangement.edges();
    for (std::size_t i = 0; i < edges.size(); ++i) {
        for (std::size_t j = 0; j < i; ++j) {
            for (const Vec2 p :
                 crossings(elementOf(arrangement, edges[i]), elementOf(arrangement, edges[j]))) {
                double nearest = HUGE_VAL;
                for (const std::size_t node :
                     {edges[i].from, edges[i].to, edges[j].from, edges[j].to})
                    nearest = std::min(nearest, distance(p, arrangement.nodes()[node]));
                EXPECT_LT(nearest, 20.0 * tolerance) << i << " " << j;
            }
        }
    }
}

}  // namespace

TEST(Arrangement, CutsCrossingSquaresAndMergesSharedSides) {
    Arrangement arrangement(1e-6);
    std::vector<Element> elements = square(0, 0, 2);
    append(elements, square(1, 1, 2));
    arrangement.assign(elements);
    EXPECT_EQ(arrangement.nodes().size(), 10u);
    EXPECT_EQ(arrangement.edges().size(), 12u);
    expectSound(arrangement, elements, 1e-6);

    elements = square(0, 0, 2);
    append(elements, square(2, 0.5, 1));  // on the right side of the first
    arrangement.assign(elements);
    EXPECT_EQ(arrangement.nodes().size(), 8u);
    EXPECT_EQ(arrangement.edges().size(), 9u);
    int cancelled = 0;
    for (const Edge& edge : arrangement.edges()) {
        if (edge.multiplicity != 0) continue;
        ++cancelled;
        EXPECT_EQ(edge.last - edge.first, 2u) << "both squares run along it";
    }
    EXPECT_EQ(cancelled, 1);
}

TEST(Arrangement, SharesArcsAndTouchesOnce) {
    const double tolerance = 1e-7;
    Arrangement arrangement(tolerance);
    const std::vector<Element> circle{{{1, 0}, {-1, 0}, 1}, {{-1, 0}, {1, 0}, 1}};
    std::vector<Element> twice = circle;
    append(twice, {{{0, 1}, {0, -1}, 1}, {{0, -1}, {0, 1}, 1}});  // the same, begun elsewhere
    arrangement.assign(twice);
    EXPECT_EQ(arrangement.nodes().size(), 4u);
    ASSERT_EQ(arrangement.edges().size(), 4u);
    for (const Edge& edge : arrangement.edges())
        EXPECT_EQ(std::abs(edge.multiplicity), 2);
}

TEST(Arrangement, SharesOneNodeWhereACircleTouchesASide) {
    const double tolerance = 1e-7;
    Arrangement arrangement(tolerance);
    const auto expectShared = [&](double gap, std::size_t nodes, std::size_t edges) {
        std::vector<Element> touching{{{1, 0}, {-1, 0}, 1}, {{-1, 0}, {1, 0}, 1}};
        append(touching, square(-3, 1 + gap, 6));
        arrangement.assign(touching);
        EXPECT_EQ(arrangement.nodes().size(), 6 + nodes) << gap;
        EXPECT_EQ(arrangement.edges().size(), 6 + edges) << gap;
        expectSound(arrangement, touching, tolerance);
    };
    expectShared(0.0, 1, 2);
    expectShared(0.9e-7, 1, 2);
    expectShared(1.1e-7, 0, 0);
    expectShared(-0.9e-7, 2, 3);  // the circle reaches over, along an edge that is both
}

TEST(Arrangement, FindsWhereElementsTouch) {
    std::mt19937 engine(9);
    const auto unit = [&engine] {
        return 2.0 * double(engine()) / double(std::mt19937::max()) - 1;
    };
    const double tolerance = 1e-7;
    for (int i = 0; i < 3000; ++i) {
        // Two elements that pass a point in one direction and bend apart from it.
        const Vec2 point{5 * unit(), 5 * unit()};
        const double direction = kPi * unit();
        const auto passing = [&](double curvature, Vec2 at) {
            const auto reached = [&](double length) {
                const double half = 0.5 * curvature * length;
                const double chord =
                    std::fabs(half) < 1e-9 ? length : length * std::sin(half) / half;
                return at + chord * Vec2{std::cos(direction + half), std::sin(direction + half)};
            };
            const double before = 0.2 + std::fabs(unit());
            const double after = 0.2 + std::fabs(unit());
            return Element{reached(-before), reached(after),
                           std::tan(0.25 * curvature * (before + after))};
        };
        const double gap = 3e-7 * std::fabs(unit());
        const Vec2 left{-std::sin(direction), std::cos(direction)};
        const double curvature = unit();
        const Element a = passing(curvature - 0.3 - std::fabs(unit()), point);
        const Element b = passing(curvature, point + gap * left);
        if (std::fabs(gap - tolerance) < 1e-9) continue;
        Arrangement arrangement(tolerance);
        arrangement.assign({a, b});
        EXPECT_EQ(arrangement.nodes().size(), gap < tolerance ? 5u : 4u) << i << " " << gap;
    }
}

TEST(Arrangement, IsBalancedAndPlanarOnRandomLoops) {
    std::mt19937 engine(8);
    const auto unit = [&engine] {
        return 2.0 * double(engine()) / double(std::mt19937::max()) - 1;
    };
    for (int trial = 0; trial < 150; ++trial) {
        const double tolerance = std::pow(10.0, -5.0 - double(engine() % 5));
        std::vector<Element> elements;
        for (int loop = 0; loop < 3; ++loop) {
            std::vector<Vec2> corners;
            for (int i = 0; i < 6; ++i) {
                const bool onGrid = engine() % 3 == 0;
                corners.push_back(onGrid ? Vec2{double(engine() % 4), double(engine() % 4)}
                                         : Vec2{2 + 2 * unit(), 2 + 2 * unit()});
                if (i > 0 && corners[std::size_t(i)] == corners[std::size_t(i) - 1])
                    corners.pop_back(), --i;
            }
            std::vector<Element> path = polygon(corners);
            for (Element& e : path) {
                if (engine() % 2 == 0) e.bulge = unit();
            }
            for (const Element& e : path) {
                if (distance(e.sp, e.ep) > 0.0) elements.push_back(e);
            }
        }
        Arrangement arrangement(tolerance);
        arrangement.assign(elements);
        expectSound(arrangement, elements, tolerance);
        expectPlanar(arrangement, tolerance);
    }
}
