// SPDX-License-Identifier: MIT
#include "region/plane/Crossing.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <optional>
#include <random>
#include <vector>

namespace {

using namespace gmregion;

constexpr double kEpsilon = std::numeric_limits<double>::epsilon();

class Draw {
public:
    explicit Draw(unsigned seed) : m_engine(seed) {}

    double between(double low, double high) {
        return low + (high - low) * (double(m_engine()) / double(std::mt19937::max()));
    }
    double power(double low, double high) { return std::pow(10.0, between(low, high)); }
    bool chance(unsigned n) { return m_engine() % n == 0; }

private:
    std::mt19937 m_engine;
};

/// The point that is reached from x along a circle, in extended digits.
struct Reached {
    long double x;
    long double y;
};
Reached along(Vec2 x, long double direction, long double curvature, long double length) {
    const long double half = 0.5L * curvature * length;
    const long double chord = std::fabs(half) < 1e-9L ? length : length * std::sin(half) / half;
    return {x.x + chord * std::cos(direction + half), x.y + chord * std::sin(direction + half)};
}

/// An element through a point, in a direction, from flat to nearly half a turn.
struct Through {
    Element element;
    double size;  ///< what the rounding of its points goes by
};
Through elementThrough(Draw& draw, Vec2 x, double direction) {
    const double before = draw.power(-3.0, 2.0);
    const double after = draw.power(-3.0, 2.0);
    const double turn = draw.chance(4) ? 0.0 : draw.power(-12.0, 0.45);
    const double curvature = (draw.chance(2) ? turn : -turn) / (before + after);
    const Reached start = along(x, direction, curvature, -before);
    const Reached end = along(x, direction, curvature, after);
    const long double sweep = static_cast<long double>(curvature) * (before + after);
    Element e{{double(start.x), double(start.y)}, {double(end.x), double(end.y)}, 0.0};
    e.bulge = double(std::tan(0.25L * sweep));
    return {e, before + after + std::fabs(x.x) + std::fabs(x.y)};
}

double distanceTo(const CrossingPoints& points, Vec2 x) {
    double nearest = std::numeric_limits<double>::infinity();
    for (const Vec2 p : points)
        nearest = std::min(nearest, std::sqrt(dot(p - x, p - x)));
    return nearest;
}

/// Two elements that cross in a point, and how far from it rounding may let them cross.
struct MadeToCross {
    Through a;
    Through b;
    Vec2 x;
    double size;
    double bound;
};

/// Nothing where rounding may let the elements miss each other: it turns short ones by more, and at
/// a small angle they may bend apart soon.
std::optional<MadeToCross> makeCross(Draw& draw) {
    const double far = draw.chance(3) ? 0.0 : draw.power(0.0, 3.0);
    const Vec2 x{draw.between(-far, far), draw.between(-far, far)};
    const double direction = draw.between(-kPi, kPi);
    const double angle = draw.chance(3) ? draw.power(-5.0, 0.0) : draw.between(0.1, 3.0);
    const Through a = elementThrough(draw, x, direction);
    const Through b = elementThrough(draw, x, direction + angle);
    const double size = std::max(a.size, b.size);
    const double shortest = std::min({distance(a.element.sp, x), distance(a.element.ep, x),
                                      distance(b.element.sp, x), distance(b.element.ep, x)});
    const double shift = kEpsilon * size * size / shortest;
    const double bend = std::fabs(carrierOf(a.element).curvature - carrierOf(b.element).curvature);
    const double sine = std::sin(angle);
    if (shortest < 1e-2 || sine * sine < 1000.0 * shift * bend) return std::nullopt;
    return MadeToCross{a, b, x, size, 200.0 * shift / sine};
}

/// Do all points lie on the carrier of an element, but for rounding?
bool lieOn(const CrossingPoints& points, const Element& e, double size) {
    const Carrier c = carrierOf(e);
    return std::all_of(points.begin(), points.end(), [&](Vec2 p) {
        return std::fabs(signedDistance(c, p)) < 32 * kEpsilon * size;
    });
}

/// How far the carrier of an element and its parallel are from measuring as they should, in
/// lengths.
double misfitOfParallel(Draw& draw, const Element& e, Vec2 middle) {
    const Carrier c = carrierOf(e);
    const double d = draw.between(-1.0, 1.0) * std::min(1.0, 0.5 / std::fabs(c.curvature));
    const auto beside = parallel(c, d);
    if (!beside) return std::numeric_limits<double>::infinity();
    const Vec2 foot = footOn(*beside, middle);
    // A positive d lies to the right.
    return std::max({std::fabs(signedDistance(c, e.ep)), std::fabs(signedDistance(c, middle)),
                     std::fabs(signedDistance(*beside, foot)),
                     std::fabs(signedDistance(c, foot) + d),
                     std::fabs(distance(foot, middle) - std::fabs(d))});
}

}  // namespace

TEST(Crossing, IsFoundWhereTheElementsWereMadeToCross) {
    Draw draw(3);
    int compared = 0;
    for (int i = 0; i < 100000; ++i) {
        const auto made = makeCross(draw);
        if (!made) continue;
        ++compared;
        const Element& a = made->a.element;
        const Element& b = made->b.element;
        const CrossingPoints found = crossings(a, b);
        ASSERT_LT(distanceTo(found, made->x), made->bound) << i;
        ASSERT_LT(distanceTo(crossings(b, a), made->x), made->bound) << i;
        ASSERT_TRUE(lieOn(found, a, made->size) && lieOn(found, b, made->size)) << i;
    }
    EXPECT_GT(compared, 30000);
}

/// A rounding of 1e-8 at the end of a side of 50 was missed once.
TEST(Crossing, IsFoundOnSmallArcsFarAlongLongElements) {
    Draw draw(6);
    for (int i = 0; i < 20000; ++i) {
        const Vec2 x{draw.between(-50, 50), draw.between(-50, 50)};
        const double direction = draw.between(-kPi, kPi);
        const double length = draw.between(1.0, 50.0);
        const double curvature = draw.chance(2) ? 0.0 : 1.0 / length;
        const auto elementAlong = [&](double angle, double before, double after, double k) {
            const Reached start = along(x, angle, k, -before);
            const Reached end = along(x, angle, k, after);
            return Element{{double(start.x), double(start.y)},
                           {double(end.x), double(end.y)},
                           std::tan(0.25 * k * (before + after))};
        };
        const Element large = elementAlong(direction, length, 1.0, curvature);
        const double size = draw.power(-8.0, -2.0);
        const double angle = direction + draw.between(0.5, 2.6);
        const Element small = elementAlong(angle, size, size, draw.between(-1.5, 1.5) / size);
        EXPECT_LT(distanceTo(crossings(large, small), x), 1e-12) << i;
        EXPECT_LT(distanceTo(crossings(small, large), x), 1e-12) << i;
        // Beside the element, where the small arc comes nearest: its middle, to the side it bends.
        const Vec2 d{std::cos(direction), std::sin(direction)};
        const double beside = 3.0 * size;
        const Vec2 m = x + beside * rightNormal(d);
        const Element circle{m + size * d, m - size * d, 1.0};
        const Element line{x - length * d, x + d, 0.0};
        const auto near = nearestApproach(carrierOf(circle), carrierOf(line));
        ASSERT_TRUE(near);
        EXPECT_LT(std::fabs(dot(*near - x, d)), 1e-12) << i;
        EXPECT_LT(std::fabs(signedDistance(carrierOf(line), *near)), beside) << i;
    }
}

TEST(Crossing, CountsWhatLiesOnBothElements) {
    const Element line{{-2, 0.5}, {2, 0.5}, 0};
    const Element upper{{1, 0}, {-1, 0}, 1};  // the half circle above
    const Element lower{{-1, 0}, {1, 0}, 1};
    EXPECT_EQ(crossings(line, upper).size(), 2u);
    EXPECT_EQ(crossings(line, lower).size(), 0u);
    EXPECT_EQ(crossings(Element{{-2, 1.5}, {2, 1.5}, 0}, upper).size(), 0u) << "beside it";
    EXPECT_EQ(crossings(Element{{-2, 1}, {2, 1}, 0}, upper).size(), 0u) << "touches";
    EXPECT_EQ(crossings(Element{{0, 0.5}, {2, 0.5}, 0}, upper).size(), 1u);
    EXPECT_EQ(crossings(upper, Element{{1, 0}, {-1, 0}, 1}).size(), 0u) << "itself";
    EXPECT_EQ(crossings(upper, Element{{3, 0}, {-3, 0}, 1}).size(), 0u) << "concentric";
    EXPECT_EQ(crossings(line, Element{{0, 0.5}, {5, 0.5}, 0}).size(), 0u) << "on one line";
    EXPECT_EQ(crossings(upper, Element{{2, 0}, {0, 0}, 1}).size(), 1u) << "of two circles";
}

/// A step of Newton's method led as far as 0.7 along the common tangent.
TEST(Crossing, LiesOnBothElementsWhereTheyTouch) {
    int found = 0;
    for (int degrees = 0; degrees < 3600; ++degrees) {
        const double angle = degrees * 0.1 * kPi / 180.0;
        const Vec2 along{std::cos(angle), std::sin(angle)};
        const Vec2 m{3.0, 4.0};
        const Vec2 touch = m + 3.5 * rightNormal(along);
        const Element half{m - 3.5 * rightNormal(along), touch, 1.0};
        const Element line{touch, touch + 30.0 * along, 0.0};
        for (const Vec2 p : crossings(carrierOf(half), carrierOf(line))) {
            EXPECT_LT(std::fabs(signedDistance(carrierOf(half), p)), 256 * kEpsilon) << degrees;
            EXPECT_LT(std::fabs(signedDistance(carrierOf(line), p)), 256 * kEpsilon) << degrees;
            ++found;
        }
    }
    EXPECT_GT(found, 100);
}

TEST(Carrier, MeasuresAsTheElementDoes) {
    Draw draw(4);
    for (int i = 0; i < 20000; ++i) {
        const Vec2 middle{draw.between(-10, 10), draw.between(-10, 10)};
        const Through through = elementThrough(draw, middle, draw.between(-kPi, kPi));
        EXPECT_LT(misfitOfParallel(draw, through.element, middle), 64.0 * kEpsilon * through.size)
            << i;
    }
    const Carrier circle = carrierOf({{1, 0}, {-1, 0}, 1});
    EXPECT_FALSE(parallel(circle, -1.0)) << "shrunk to its centre";
    EXPECT_TRUE(parallel(circle, -0.999));
    EXPECT_EQ(footOn(circle, {0, 0}), circle.at);
}

TEST(Crossing, PlacesGrowAlongAnElementAndBeyondItsEnds) {
    Draw draw(5);
    for (int i = 0; i < 5000; ++i) {
        const Element e = elementThrough(draw, {1, 2}, draw.between(-kPi, kPi)).element;
        if (distance(e.sp, e.ep) < 0.1) continue;
        // Of an arc of nearly half a turn the rest is no longer than the arc.
        const int beyond = std::fabs(sweep(e)) > 2.0 ? 0 : 2;
        std::vector<double> places;
        for (int k = -beyond; k <= 10 + beyond; ++k)
            places.push_back(placeOn(e, pointAt(e, 0.1 * k)));
        EXPECT_TRUE(std::is_sorted(places.begin(), places.end())) << i;
        const auto before = [](double place) { return place < -1e-9; };
        const auto behind = [](double place) { return place > 1.0 + 1e-9; };
        EXPECT_EQ(std::count_if(places.begin(), places.end(), before), beyond) << i;
        EXPECT_EQ(std::count_if(places.begin(), places.end(), behind), beyond) << i;
    }
}
