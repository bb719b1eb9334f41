// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>

#include "drawing/curves/CurveFit.h"
#include "drawing/curves/EllipseArcs.h"
#include "drawing/curves/FitSpline.h"
#include "drawing/curves/Nurbs.h"
#include "drawing/curves/Shape.h"

using namespace gmdrawing;
using namespace gmregion;
using gmpart::Path;

namespace {

constexpr double kTolerance = 0.01;

/// The largest distance of many points of the curves from the path, and of the path from them.
double deviation(const std::vector<Bezier>& curves, const std::vector<Element>& elements) {
    constexpr int kSamples = 400;
    Path drawn;
    for (const Bezier& curve : curves) {
        Vec2 last = curve.front().p;
        for (int i = 1; i <= kSamples; ++i) {
            const Vec2 p = pointAt(curve, static_cast<double>(i) / kSamples).at;
            drawn.elements.push_back({last, p});
            last = p;
        }
    }
    const Path path{elements, false, ""};
    double farthest = 0.0;
    for (const Element& e : drawn.elements)
        farthest = std::max(farthest, distance(path, e.sp));
    for (const Element& e : elements) {
        for (int i = 0; i <= 20; ++i)
            farthest = std::max(farthest, distance(drawn, pointAt(e, i / 20.0)));
    }
    return farthest;
}

Bezier cubic(Vec2 a, Vec2 b, Vec2 c, Vec2 d) {
    return {{a}, {b}, {c}, {d}};
}

/// A row of curves and how many elements suffice for it.
struct FitCase {
    const char* name;
    std::vector<Bezier> curves;
    std::size_t most;
};

std::vector<FitCase> fitCases() {
    return {
        {"half an ellipse", ellipseArc({{0, 0}, {30, 0}, {0, 15}}, 0.0, kPi), 14},
        {"a needle", ellipseArc({{5, 5}, {100, 20}, {-0.02, 0.1}}, 0.3, 6.0), 60},
        {"thinner than the tolerance", ellipseArc({{0, 0}, {100, 0}, {0, 1e-3}}, 0.0, 5.0), 8},
        {"an arc of a circle", ellipseArc({{1, 2}, {7, 0}, {0, 7}}, 1.0, 4.0), 2},
        {"two bends", {cubic({0, 0}, {30, 40}, {20, -40}, {50, 0})}, 40},
        {"a loop", {cubic({0, 0}, {120, 80}, {-70, 80}, {50, 0})}, 30},
        {"a cusp", {cubic({0, 0}, {50, 50}, {0, 50}, {50, 0})}, 30},
        {"handles of no length", {cubic({0, 0}, {0, 0}, {50, 20}, {50, 20})}, 4},
        {"one handle", {cubic({0, 0}, {0, 0}, {30, 40}, {50, 0})}, 20},
        {"back and forth", {cubic({0, 0}, {60, 0}, {-10, 0}, {50, 0})}, 8},
        {"straight", {cubic({0, 0}, {10, 5}, {20, 10}, {30, 15})}, 1},
        {"a corner between two",
         {cubic({0, 0}, {10, 10}, {20, 10}, {30, 0}), cubic({30, 0}, {40, 10}, {50, 10}, {60, 0})},
         20},
        {"far from the origin", ellipseArc({{1e6, -2e6}, {30, 0}, {0, 15}}, 0.0, kPi), 14},
        {"tiny", ellipseArc({{0, 0}, {1e-3, 0}, {0, 5e-4}}, 0.0, kPi), 2},
    };
}

}  // namespace

TEST(CurveFit, StaysWithinTheToleranceBothWaysAndKeepsTheEnds) {
    for (const FitCase& c : fitCases()) {
        SCOPED_TRACE(c.name);
        const auto elements = fitted(c.curves, false, kTolerance);
        ASSERT_TRUE(elements);
        ASSERT_FALSE(elements->empty());
        EXPECT_LE(deviation(c.curves, *elements), kTolerance * 1.001);
        EXPECT_LE(elements->size(), c.most);
        EXPECT_TRUE(elements->front().sp == c.curves.front().front().p);
        EXPECT_TRUE(elements->back().ep == c.curves.back().back().p);
    }
}

TEST(CurveFit, ArcsOfSmoothCurvesAreTangent) {
    const std::vector<Bezier> ellipse = ellipseArc({{0, 0}, {30, 0}, {0, 15}}, 0.4, 2 * kPi);
    const auto elements = fitted(ellipse, true, kTolerance);
    ASSERT_TRUE(elements);
    EXPECT_LE(elements->size(), 28U);
    for (std::size_t i = 0; i < elements->size(); ++i) {
        const Element& next = (*elements)[(i + 1) % elements->size()];
        EXPECT_TRUE((*elements)[i].ep == next.sp);
        EXPECT_LT(std::abs(cross(tangentEnd((*elements)[i]), tangentStart(next))), 2e-3);
    }
}

TEST(CurveFit, CurvesOfMixedSizesAreFittedSoon) {
    // Far control points and weights: slow where another is fast.
    const std::vector<Bezier> hard = {cubic({0, 0}, {1e8, 30}, {20, -30}, {50, 0}),
                                      cubic({50, 0}, {1e8, 3}, {1e8, 3}, {0, 9}),
                                      {{{0, 9}}, {{7, 3}, 1e8}, {{1e6, 3}, 1e-8}, {{5, 9}}}};
    for (const Bezier& curve : hard) {
        const auto elements = fitted({curve}, false, kTolerance);
        ASSERT_TRUE(elements);
        EXPECT_LE(elements->size(), 60U);
        EXPECT_TRUE(elements->back().ep == curve.back().p);
    }
}

TEST(CurveFit, NothingForWhatHasNoFit) {
    EXPECT_FALSE(fitted({cubic({0, 0}, {NAN, 0}, {1, 1}, {2, 0})}, false, kTolerance));
    EXPECT_FALSE(fitted({cubic({1e13, 0}, {1e13, 5}, {0, 5}, {0, 0})}, false, kTolerance));
    EXPECT_FALSE(fitted({cubic({1e9, 0}, {1e9, 5}, {1e9 - 9, 5}, {0, 0})}, false, 1e-9));
    const auto point = fitted({cubic({3, 3}, {3, 3}, {3, 3}, {3, 3})}, false, kTolerance);
    EXPECT_TRUE(point && point->empty());
}

TEST(Nurbs, CirclesOfControlPointsAreExact) {
    const double w = std::sqrt(0.5);
    const Nurbs circle{2,
                       {0, 0, 0, 1, 1, 2, 2, 3, 3, 4, 4, 4},
                       {{{5, 0}},
                        {{5, 5}, w},
                        {{0, 5}},
                        {{-5, 5}, w},
                        {{-5, 0}},
                        {{-5, -5}, w},
                        {{0, -5}},
                        {{5, -5}, w},
                        {{5, 0}}}};
    ASSERT_STREQ(faultOf(circle), "");
    const std::vector<Bezier> pieces = bezierPieces(circle);
    ASSERT_EQ(pieces.size(), 4U);
    for (const Bezier& curve : pieces) {
        for (const double t : {0.0, 0.2, 0.7, 1.0})
            EXPECT_NEAR(length(pointAt(curve, t).at), 5.0, 1e-12);
    }
}

TEST(Nurbs, UniformKnotsJoinSmoothly) {
    // No knot is repeated, not even at the ends: the curve starts inside its first span.
    const Nurbs spline{
        3, {-3, -2, -1, 0, 1, 2, 3, 4, 5}, {{{0, 0}}, {{1, 3}}, {{2, -1}}, {{3, 4}}, {{4, 0}}}};
    ASSERT_STREQ(faultOf(spline), "");
    const std::vector<Bezier> pieces = bezierPieces(spline);
    ASSERT_EQ(pieces.size(), 2U);
    const Vec2 start = pieces[0].front().p;
    EXPECT_NEAR(start.x, 1.0, 1e-12);
    EXPECT_NEAR(start.y, (0.0 + 4.0 * 3.0 - 1.0) / 6.0, 1e-12);
    EXPECT_NEAR(length(pointAt(pieces[0], 1.0).direction - pointAt(pieces[1], 0.0).direction), 0.0,
                1e-12);
}

TEST(Nurbs, FaultsAreNamed) {
    const Bezier points = {{{0, 0}}, {{1, 0}}, {{2, 1}}, {{3, 0}}};
    EXPECT_STREQ(faultOf({0, {0, 0, 0, 0}, points}), "its degree cannot be used");
    EXPECT_STREQ(faultOf({4, {0, 0, 0, 0, 1, 1, 1, 1, 1}, points}), "too few control points");
    EXPECT_STREQ(faultOf({3, {0, 0, 0, 0, 1, 1, 1}, points}), "not as many knots as needed");
    EXPECT_STREQ(faultOf({3, {0, 0, 0, 2, 1, 1, 1, 1}, points}), "its knots do not rise");
    EXPECT_STREQ(faultOf({3, {1, 1, 1, 1, 1, 1, 1, 1}, points}), "its knots do not rise");
    EXPECT_STREQ(faultOf({1, {0, 0, 1, 1, 2, 2}, points}), "its knots leave a gap");
    EXPECT_STREQ(
        faultOf({3, {0, 0, 0, 0, 1, 1, 1, 1}, {{{0, 0}}, {{1, 0}, 0.0}, {{2, 1}}, {{3, 0}}}}),
        "a weight is not above 0");
}

TEST(FitSpline, PassesThePointsWithoutAJumpOfCurvature) {
    for (const bool closed : {false, true}) {
        SCOPED_TRACE(closed);
        FitPoints fit{{{0, 0}, {10, 10}, {10, 10}, {25, -5}, {30, 8}, {12, 30}}};
        fit.closed = closed;
        const std::vector<Bezier> pieces = splineThrough(fit);
        ASSERT_EQ(pieces.size(), closed ? 5U : 4U);
        // The second derivative of a piece over a chord: 6 (a - 2 b + c) / chord^2.
        const auto bend = [](const Bezier& c, bool atEnd) {
            const double chord = distance(c.front().p, c.back().p);
            const Vec2 second =
                atEnd ? c[1].p - 2.0 * c[2].p + c[3].p : c[0].p - 2.0 * c[1].p + c[2].p;
            return (6.0 / (chord * chord)) * second;
        };
        for (std::size_t i = closed ? 0 : 1; i < pieces.size(); ++i) {
            const Bezier& before = pieces[(i + pieces.size() - 1) % pieces.size()];
            EXPECT_TRUE(before.back().p == pieces[i].front().p);
            EXPECT_LT(length(bend(before, true) - bend(pieces[i], false)), 1e-12);
        }
        if (closed) continue;
        EXPECT_LT(length(bend(pieces.front(), false)), 1e-12) << "runs out straight";
    }
    const FitPoints directed{{{0, 0}, {10, 0}, {20, 5}}, Vec2{0, 7}, Vec2{1, 1}};
    EXPECT_NEAR(pointAt(splineThrough(directed).front(), 0.0).direction.y, 1.0, 1e-12);
    EXPECT_NEAR(pointAt(splineThrough(directed).back(), 1.0).direction.x, std::sqrt(0.5), 1e-12);
    EXPECT_TRUE(splineThrough({{{1, 1}, {1, 1}}}).empty());
}

TEST(Shape, ArcsBecomeEllipsesWhereScalesDiffer) {
    // A slot: two lines, two half circles.
    const Shape slot{"polyline",
                     "0",
                     true,
                     {Element{{0, 0}, {20, 0}}, Element{{20, 0}, {20, 10}, 1.0},
                      Element{{20, 10}, {0, 10}}, Element{{0, 10}, {0, 0}, 1.0}}};
    const Placement wider = Placement::toAxes({1, 1}, {3, 0}, {0, 1});
    const auto path = placedPath(slot, wider, kTolerance);
    ASSERT_TRUE(path && path->closed);
    EXPECT_TRUE(path->elements.front().ep == (Vec2{61, 1}));
    EXPECT_FALSE(isArc(path->elements.front()));
    const double height = 10.0;
    EXPECT_NEAR(boundingBox(*path).high.x, 1.0 + 3.0 * (20.0 + 0.5 * height), kTolerance);
    for (std::size_t i = 0; i < path->elements.size(); ++i) {
        const Element& next = path->elements[(i + 1) % path->elements.size()];
        EXPECT_TRUE(path->elements[i].ep == next.sp);
    }
    const auto turned = placedPath(slot, Placement::toAxes({}, {0, 2}, {-2, 0}), kTolerance);
    ASSERT_TRUE(turned);
    EXPECT_EQ(turned->elements.size(), 4U) << "a similarity keeps arcs";
}
