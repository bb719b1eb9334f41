// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <cmath>
#include <functional>
#include <limits>
#include <random>

#include "gmregion/Simplify.h"
#include "region/simplify/Directions.h"
#include "tests/support/PathDistance.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

constexpr double kTurn = 6.283185307179586;

/// The largest jump of direction, in degrees.
double largestJump(const Elements& path, bool closed) {
    double most = 0.0;
    for (std::size_t i = closed ? 0 : 1; i < path.size(); ++i) {
        const Vec2 a = endDirection(path[(i + path.size() - 1) % path.size()]);
        const Vec2 b = startDirection(path[i]);
        most = std::max(most, std::fabs(std::atan2(cross(a, b), dot(a, b))) * 360.0 / kTurn);
    }
    return most;
}

Elements chain(const std::vector<Vec2>& points, bool closed) {
    Elements path = polygon(points);
    if (!closed) path.pop_back();
    return path;
}

template <class Curve>
std::vector<Vec2> sampled(const Curve& curve, double from, double to, int count) {
    std::vector<Vec2> points;
    for (int i = 0; i < count; ++i)
        points.push_back(curve(from + (to - from) * i / count));
    return points;
}

Vec2 onEllipse(double t) {
    return {50.0 * std::cos(t), 5.0 * std::sin(t)};
}
Vec2 onSpiral(double t) {
    return {t * std::cos(t), t * std::sin(t)};
}
Vec2 onWave(double t) {
    return {t, 3.0 * std::sin(t)};
}

/// Simplifies one path and holds the result against the laws for all of them.
Elements simplified(const Elements& source, bool closed, const SimplifyOptions& options) {
    Paths paths;
    paths.add(source, closed, 42);
    Simplified result;
    EXPECT_TRUE(simplify(paths, options, result)) << textOf(result.refusal.reason);
    if (result.paths.size() != 1) return {};
    const PathView view = result.paths[0];
    Elements path(view.begin(), view.end());
    EXPECT_EQ(view.id, 42);
    EXPECT_EQ(view.closed, closed);
    EXPECT_LE(path.size(), source.size());
    EXPECT_EQ(result.sources.size(), path.size());
    for (std::size_t i = 0; i < path.size(); ++i) {
        EXPECT_LT(result.sources[i].last, source.size());
        if (i + 1 < path.size()) {
            EXPECT_EQ(path[i].ep, path[i + 1].sp);
        }
        // The middle of an element is near the elements that it stands for.
        Elements range;
        for (std::size_t k = result.sources[i].first;; k = (k + 1) % source.size()) {
            range.push_back(source[k]);
            if (k == result.sources[i].last) break;
        }
        const double off = distanceFrom(range, halved(path[i]).first.ep);
        EXPECT_LE(off, options.tolerance + 1e-9) << i;
    }
    if (closed) {
        EXPECT_EQ(path.back().ep, path.front().sp);
    } else {
        EXPECT_EQ(path.front().sp, source.front().sp);
        EXPECT_EQ(path.back().ep, source.back().ep);
    }
    const double limit = options.tolerance * (1.0 + 1e-9) + 1e-11;
    const int halvings = path.size() < 50 ? 8 : 4;
    EXPECT_LE(farthest(source, path, source.size() < 50 ? 7 : 2), limit);
    EXPECT_LE(farthest(path, source, halvings), limit);
    return path;
}

Elements simplified(const Elements& source, bool closed, double tolerance) {
    SimplifyOptions options;
    options.tolerance = tolerance;
    return simplified(source, closed, options);
}

/// The elements in pieces at random places, neighbours on one line or circle.
Elements inPieces(std::mt19937& engine, const Elements& source, int count) {
    Elements pieces;
    for (Element e : source) {
        for (int i = 1; i < count; ++i) {
            const double share = uniform(engine, 0.2, 0.8);
            const double half = e.bulge / (1.0 + std::sqrt(1.0 + e.bulge * e.bulge));
            Vec2 p = e.sp + share * (e.ep - e.sp);
            if (e.bulge != 0.0) p = halved(e).first.ep;
            const Parts parts = e.bulge != 0.0 ? Parts{{e.sp, p, half}, {p, e.ep, half}}
                                               : Parts{{e.sp, p, 0.0}, {p, e.ep, 0.0}};
            pieces.push_back(parts.first);
            e = parts.second;
        }
        pieces.push_back(e);
    }
    return pieces;
}

TEST(Simplify, PiecesOfOneLineOrCircleAreWholeAgain) {
    std::mt19937 engine(3);
    for (int round = 0; round < 300; ++round) {
        const Elements whole = star(engine, 5 + engine() % 6, {300.0, -200.0}, 20.0);
        const Elements pieces = inPieces(engine, whole, 2 + int(engine() % 6));
        const Elements path = simplified(pieces, true, round % 2 == 0 ? 0.0 : 1e-6);
        ASSERT_EQ(path.size(), whole.size()) << round;
        for (const Element& e : whole) {
            const auto same = std::find_if(path.begin(), path.end(),
                                           [&](const Element& f) { return f.sp == e.sp; });
            ASSERT_NE(same, path.end()) << round;
            ASSERT_EQ(same->ep, e.ep);
            ASSERT_NEAR(same->bulge, e.bulge, 1e-12);
            ASSERT_EQ(same->bulge == 0.0, e.bulge == 0.0);
        }
    }
    // Closed circles become halves from any number of arcs, three quarters of one stay one arc.
    for (const int count : {3, 4, 7, 100}) {
        Elements arcs = polygon(sampled(
                                    [](double t) {
                                        return Vec2{3 + std::cos(t), std::sin(t)};
                                    },
                                    0, kTurn, count),
                                std::tan(kTurn / 4.0 / count));
        const Elements halves = simplified(arcs, true, 0.0);
        ASSERT_EQ(halves.size(), 2U) << count;
        EXPECT_EQ(halves[0].bulge, 1.0);
        EXPECT_EQ(halves[0].sp, arcs[0].sp);
        EXPECT_NEAR(halves[0].ep.x, 2.0, 1e-14);
        if (count % 4 != 0) continue;
        arcs.resize(std::size_t(count) * 3 / 4);
        const Elements arc = simplified(arcs, false, 0.0);
        ASSERT_EQ(arc.size(), 1U);
        EXPECT_NEAR(arc[0].bulge, 1.0 + std::sqrt(2.0), 1e-12);
    }
    const Elements wide{{{0, 0}, {1, 0}, 5.3}, {{1, 0}, {9, 0}, 0.0}};
    const Elements same = simplified(wide, false, 1e-3);
    ASSERT_EQ(same.size(), 2U);
    EXPECT_EQ(same[0].bulge, 5.3);
}

TEST(Simplify, CountsOfKnownShapes) {
    struct Row {
        const char* name;
        std::vector<Vec2> points;
        bool closed;
        double tolerance;
        std::size_t most;
        double jump;
    };
    const auto circle = [](double t) { return Vec2{20 * std::cos(t), 20 * std::sin(t)}; };
    std::mt19937 engine(5);
    const auto noisy = [&](double t) { return uniform(engine, 0.9995, 1.0005) * circle(t); };
    const auto rounded = [](double t) {
        const Vec2 p = onEllipse(t);
        return Vec2{std::round(p.x * 1e3) / 1e3, std::round(p.y * 1e3) / 1e3};
    };
    const Row rows[] = {
        {"63 corners", sampled(circle, 0, kTurn, 63), true, 0.05, 2, 1e-9},
        {"two thirds of a circle", sampled(circle, 0, 4, 200), false, 0.01, 2, 0.1},
        {"noisy circle", sampled(noisy, 0, kTurn, 4000), true, 0.03, 2, 1e-9},
        {"noisy arc", sampled(noisy, 0, 3.5, 600), false, 0.02, 3, 35},
        {"ellipse", sampled(onEllipse, 0, kTurn, 2000), true, 0.01, 22, 20},
        {"rounded ellipse", sampled(rounded, 0, kTurn, 2000), true, 0.01, 22, 20},
        {"spiral", sampled(onSpiral, 1, 31, 2000), false, 0.01, 30, 2},
        {"wave", sampled(onWave, 0, 30, 2000), false, 0.01, 42, 20},
    };
    for (const Row& row : rows) {
        SCOPED_TRACE(row.name);
        const Elements path = simplified(chain(row.points, row.closed), row.closed, row.tolerance);
        EXPECT_LE(path.size(), row.most);
        EXPECT_LE(largestJump(path, row.closed), row.jump);
    }
}

TEST(Simplify, SidesStayStraightAndCornersStay) {
    std::vector<Vec2> points{{3, 0}};
    const Vec2 middles[] = {{97, 3}, {97, 47}, {3, 47}, {3, 3}};
    for (int k = 0; k < 4; ++k) {
        for (int i = 0; i <= 40; ++i) {
            const double t = kTurn * (k - 1 + i / 40.0) / 4.0;
            points.push_back(middles[k] + 3.0 * Vec2{std::cos(t), std::sin(t)});
        }
    }
    const Elements path = simplified(chain(points, false), false, 0.05);
    ASSERT_EQ(path.size(), 8U);
    int straight = 0;
    for (const Element& e : path)
        straight += e.bulge == 0.0 ? 1 : 0;
    EXPECT_EQ(straight, 4);
    EXPECT_LE(largestJump(path, false), 1e-3);

    // The corners of an octagon stay whatever the tolerance allows.
    const auto octagon = sampled(
        [](double t) {
            return Vec2{std::cos(t), std::sin(t)};
        },
        0, kTurn, 8);
    EXPECT_EQ(simplified(chain(octagon, true), true, 0.2).size(), 8U);
    std::mt19937 engine(9);
    for (int round = 0; round < 200; ++round) {
        Elements source = tangle(engine, 4 + engine() % 8, 10.0);
        const Elements kept = simplified(inPieces(engine, source, 3), true, 1e-3);
        for (std::size_t i = 0; i < source.size(); ++i) {
            const Vec2 a = endDirection(source[(i + source.size() - 1) % source.size()]);
            if (!jumpsBy(a, startDirection(source[i]), 0.301)) continue;
            EXPECT_TRUE(std::any_of(kept.begin(), kept.end(), [&](const Element& e) {
                return e.sp == source[i].sp;
            })) << round;
        }
    }
}

TEST(Simplify, LawsHoldUnderMovesAndNoise) {
    std::mt19937 engine(17);
    for (int round = 0; round < 25; ++round) {
        const double a = uniform(engine, 5, 40), b = uniform(engine, 5, 40);
        const double wave = uniform(engine, 0.0, 0.15), noise = uniform(engine, 0.0, 0.005);
        const int count = 50 + int(engine() % 400), lobes = 2 + int(engine() % 4);
        std::vector<Vec2> points = sampled(
            [&](double t) {
                const double r = 1.0 + wave * std::cos(lobes * t) + noise / a;
                return Vec2{a * r * std::cos(t) + uniform(engine, -noise, noise),
                            b * r * std::sin(t) + uniform(engine, -noise, noise)};
            },
            0, kTurn, count);
        if (round % 3 == 0) points.insert(points.begin() + 7, points[7]);
        const double tolerance = uniform(engine, 0.01, 0.1);
        const std::size_t base = simplified(chain(points, true), true, tolerance).size();
        simplified(chain(points, false), false, tolerance);
        const auto agrees = [&](const std::vector<Vec2>& other, const char* what) {
            const std::size_t size = simplified(chain(other, true), true, tolerance).size();
            EXPECT_LE(size, base + 1 + base / 8) << what << round;
            EXPECT_LE(base, size + 1 + size / 8) << what << round;
        };
        std::vector<Vec2> other(points.rbegin(), points.rend());
        agrees(other, "reversed");
        other = points;
        std::rotate(other.begin(), other.begin() + count / 3, other.end());
        agrees(other, "started elsewhere");
        for (Vec2& p : other)
            p = {-p.y + 1000.0, -p.x - 2000.0};
        agrees(other, "mirrored and moved");
    }
}

TEST(Simplify, TurnsAndGapsWithinTheTolerance) {
    const auto arc = [](Vec2 m, double r) {
        return [m, r](double t) { return m + r * Vec2{std::cos(t), std::sin(t)}; };
    };
    const auto append = [](std::vector<Vec2>& points, const std::vector<Vec2>& more) {
        points.insert(points.end(), more.begin(), more.end());
    };
    // A hairpin goes past the end of its path.
    std::vector<Vec2> points{{0, 0}};
    append(points, sampled(arc({10, 0.3}, 0.3), -kTurn / 4, kTurn / 4, 40));
    points.push_back({9, 0.6});
    simplified(chain(points, false), false, 0.7);
    // A band that is bent nearly to a ring does not close.
    points = sampled(arc({}, 10.2), 0.0, 6.0, 600);
    append(points, sampled(arc(10.0 * Vec2{std::cos(6.0), std::sin(6.0)}, 0.2), 6.0, 9.14, 40));
    append(points, sampled(arc({}, 9.8), 6.0, 0.0, 600));
    append(points, sampled(arc({10.0, 0.0}, 0.2), -3.14, 0.0, 40));
    simplified(chain(points, true), true, 0.5);
    // A circle run round twice stays that.
    points = sampled(arc({}, 10), 0.0, 2.0 * kTurn, 400);
    double length = 0.0;
    for (const Element& e : simplified(chain(points, true), true, 0.1))
        length += lengthAlong(e);
    EXPECT_NEAR(length, 20.0 * kTurn, 0.1);
    // Gaps leave less of the tolerance.
    std::mt19937 engine(29);
    for (int round = 0; round < 20; ++round) {
        Elements gaps = chain(sampled(onSpiral, 2.0, 12.0, 150), false);
        for (Element& e : gaps)
            e.sp = e.sp + Vec2{0.0, uniform(engine, -0.04, 0.04)};
        EXPECT_LT(simplified(gaps, false, 0.05).size(), 120U);
    }
    // A gap whose length has no square is closed, too.
    simplified({{{0, 0}, {4, 0}, 0}, {{4, 0}, {1, 3}, 0}, {{1, 3}, {1e-200, 0}, 0}}, true, 0.0);
    // What is shorter than the gap that it is closed over vanishes.
    Paths paths;
    paths.add(Elements{{{3, 4}, {3, 4.001}, 0}}, true);
    paths.add(Elements{{{3, 4}, {5, 4}, 0}, {{5, 4}, {3, 4}, 0.5}, {{3, 4}, {3, 4.002}, 0}}, true);
    Simplified result;
    EXPECT_TRUE(simplify(paths, {0.1}, result));
    EXPECT_EQ(result.paths[0].size(), 0U);
    EXPECT_EQ(result.paths[1].size(), 2U);
}

std::vector<TangentPoint> tangentPoints(Vec2 (*at)(double), double from, double to, int count,
                                        bool closed) {
    std::vector<TangentPoint> points;
    for (int i = 0; i < (closed ? count : count + 1); ++i) {
        const double t = from + (to - from) * i / count, h = 1e-5;
        points.push_back({at(t), at(t + h) - at(t - h)});
    }
    return points;
}

TEST(Simplify, CurvesByPointsAndTangents) {
    struct Row {
        const char* name;
        Vec2 (*at)(double);
        double from, to;
        bool closed;
        std::size_t most;
    };
    const Row rows[] = {{"ellipse", onEllipse, 0, kTurn, true, 34},
                        {"spiral", onSpiral, 1, 31, false, 46},
                        {"wave", onWave, 0, 30, false, 70}};
    SimplifyOptions options;
    for (const Row& row : rows) {
        const Elements fine = chain(sampled(row.at, row.from, row.to, 6000), row.closed);
        int coarse = 0;
        for (const int count : {60, 90, 120, 160, 240, 1200}) {
            SCOPED_TRACE(row.name + std::to_string(count));
            const auto points = tangentPoints(row.at, row.from, row.to, count, row.closed);
            Simplified result;
            options.tolerance = count < 1200 ? 0.3 : 0.01;
            if (!simplifyCurve(points.data(), points.size(), row.closed, options, result)) {
                EXPECT_EQ(result.refusal.reason, Reason::kTolerance);
                EXPECT_TRUE(result.paths.empty());
                EXPECT_LT(count, 160);
                ++coarse;
                continue;
            }
            const Elements path(result.paths[0].begin(), result.paths[0].end());
            EXPECT_LE(path.size(), row.most);
            EXPECT_LE(largestJump(path, row.closed), 1e-5);
            const double limit = options.tolerance + 2e-4;  // the fine one is made of chords
            EXPECT_LE(farthest(fine, path, 0), limit);
            EXPECT_LE(farthest(path, fine, 5), limit);
        }
        EXPECT_LT(coarse, 4) << row.name;
    }
    // A point given twice with two tangents is a corner.
    const TangentPoint bent[] = {
        {{0, 0}, {2, 0}}, {{9, 0}, {1, 0}}, {{9, 0}, {0, 3}}, {{9, 9}, {0, 1}}};
    Simplified result;
    ASSERT_TRUE(simplifyCurve(bent, 4, false, options, result));
    EXPECT_EQ(result.paths.elementCount(), 2U);
}

TEST(Simplify, RefusesWhatIsNoGood) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const Elements good{{{0, 0}, {1, 0}, 0}, {{1, 0}, {2, 1}, 0.2}};
    const auto reasonOf = [&](const Elements& elements, bool closed, SimplifyOptions options) {
        Paths paths;
        paths.add(elements, closed);
        Simplified result;
        const bool done = simplify(paths, options, result);
        EXPECT_EQ(done, result.refusal.reason == Reason::kNone);
        EXPECT_TRUE(done || (result.paths.empty() && result.sources.empty()));
        return result.refusal.reason;
    };
    EXPECT_EQ(reasonOf(good, false, {0.1}), Reason::kNone);
    EXPECT_EQ(reasonOf({}, true, {0.1}), Reason::kNone);
    EXPECT_EQ(reasonOf({{{1, 1}, {1, 1}, 3.0}}, true, {0.1}), Reason::kNone);
    EXPECT_EQ(reasonOf(good, true, {0.1}), Reason::kGap);
    for (const double bad : {nan, double(HUGE_VAL), -HUGE_VAL, 1e13}) {
        const Reason expected = bad == 1e13 ? Reason::kOutOfRange : Reason::kNotFinite;
        EXPECT_EQ(reasonOf({{{0, bad}, {1, 0}, 0}}, false, {0.1}), expected);
        const TangentPoint points[] = {{{0, 0}, {1, 0}}, {{1, bad}, {1, 0}}};
        Simplified result;
        EXPECT_FALSE(simplifyCurve(points, 2, false, {0.1}, result));
        EXPECT_EQ(result.refusal.reason, expected);
        EXPECT_NE(reasonOf(good, false, {bad}), Reason::kNone);
        EXPECT_NE(reasonOf(good, false, {0.1, bad}), Reason::kNone);
        EXPECT_NE(reasonOf(good, false, {0.1, 0.3, bad}), Reason::kNone);
    }
    EXPECT_EQ(reasonOf({{{0, 0}, {1, 0}, nan}}, false, {0.1}), Reason::kNotFinite);
    EXPECT_EQ(reasonOf(good, false, {-0.1}), Reason::kTolerance);
    EXPECT_EQ(reasonOf(good, false, {1e-15}), Reason::kTolerance);

    // Whatever is in range gives a path, and the laws hold of it.
    std::mt19937 engine(23);
    for (int round = 0; round < 1000; ++round) {
        Elements heap;
        Vec2 at{uniform(engine, -1, 1), 0.0};
        const double scales[] = {0.0, 1e-13, 1e-3, 1.0, 1e3};
        for (int i = 0; i < 12; ++i) {
            const double scale = scales[engine() % 5];
            const Vec2 to = at + scale * Vec2{uniform(engine, -1, 1), uniform(engine, -1, 1)};
            const double bulges[] = {0.0, 1e-9, 0.5, 1.0, -2.0, 30.0};
            heap.push_back({at, to, bulges[engine() % 6]});
            at = to;
        }
        if (std::all_of(heap.begin(), heap.end(),
                        [](const Element& e) { return lengthOf(e.ep - e.sp) < 1e-6; }))
            continue;
        Paths paths;
        paths.add(heap, false);
        Simplified result;
        EXPECT_TRUE(simplify(paths, {0.01}, result)) << round;
        const PathView view = result.paths[0];
        EXPECT_LE(view.size(), heap.size());
        EXPECT_LE(farthest(Elements(view.begin(), view.end()), heap, 6), 0.0101) << round;
    }
}

TEST(Simplify, ManyPointsTakeLittleTime) {
    std::mt19937 engine(31);
    const auto noisy = [&](double t) {
        return onWave(t) + Vec2{0.0, uniform(engine, -0.004, 0.004)};
    };
    const auto random = [&](double) { return Vec2{uniform(engine, 0, 9), uniform(engine, 0, 9)}; };
    for (const auto& points : {sampled(noisy, 0, 3000, 100000), sampled(random, 0, 1, 100000)}) {
        Paths paths;
        paths.add(chain(points, false), false);
        Simplified result;
        const auto start = std::chrono::steady_clock::now();
        ASSERT_TRUE(simplify(paths, {0.02}, result));
        const std::chrono::duration<double> time = std::chrono::steady_clock::now() - start;
        EXPECT_LT(time.count(), 20.0);  // some tenths of a second without sanitizers
    }
}

}  // namespace
