// SPDX-License-Identifier: MIT
#include "gmregion/Verify.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <limits>
#include <random>
#include <string>

#include "gmregion/CleanUp.h"
#include "region/verify/BooleanVerifier.h"
#include "region/verify/OffsetVerifier.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using shapes::circle;
using shapes::Elements;
using shapes::rectangle;
using shapes::uniform;

RegionSet cleaned(const std::vector<Elements>& loops, FillRule rule = FillRule::kEvenOdd) {
    Paths paths;
    for (const Elements& loop : loops)
        paths.add(loop, true);
    return cleanUp(paths, {rule, 0.0}).regions;
}

RegionSet tangles(std::mt19937& engine) {
    std::vector<Elements> loops;
    for (std::size_t i = 0; i <= engine() % 3; ++i)
        loops.push_back(shapes::tangle(engine, 3 + engine() % 12, 10.0));
    return cleaned(loops);
}

std::string texts(const Verdict& verdict) {
    std::string all = std::to_string(verdict.count);
    for (const Fault& f : verdict.faults)
        all += std::string("; ") + textOf(f.kind) + " by " + std::to_string(f.by) + " at " +
               std::to_string(f.at.x) + " " + std::to_string(f.at.y);
    return all;
}

/// Loops that tests may break.
struct LooseLoops {
    explicit LooseLoops(const RegionSet& set) : elements(set.elements()) {
        for (const Loop& loop : set.loops())
            ends.push_back(loop.last);
    }
    LoopsView view() const { return {&elements, &ends}; }
    Index beginOf(std::size_t loop) const { return loop == 0 ? 0 : ends[loop - 1]; }

    void moveStart(std::size_t i, Vec2 by) {
        const auto loop = std::upper_bound(ends.begin(), ends.end(), i) - ends.begin();
        const Index first = beginOf(static_cast<std::size_t>(loop));
        const std::size_t before = i == first ? ends[loop] - 1 : i - 1;
        elements[i].sp = elements[i].sp + by;
        elements[before].ep = elements[i].sp;
    }
    void lose(std::size_t loop) {
        const Index first = beginOf(loop);
        const Index count = ends[loop] - first;
        elements.erase(elements.begin() + first, elements.begin() + ends[loop]);
        ends.erase(ends.begin() + static_cast<std::ptrdiff_t>(loop));
        for (std::size_t i = loop; i < ends.size(); ++i)
            ends[i] -= count;
    }
    void reverse(std::size_t loop) {
        std::reverse(elements.begin() + beginOf(loop), elements.begin() + ends[loop]);
        for (Index i = beginOf(loop); i < ends[loop]; ++i)
            elements[i] = reversed(elements[i]);
    }
    void repeat(std::size_t loop) {
        const Elements copy(elements.begin() + beginOf(loop), elements.begin() + ends[loop]);
        elements.insert(elements.end(), copy.begin(), copy.end());
        ends.push_back(static_cast<Index>(elements.size()));
    }
    /// A spike to the left out of the middle of an element, as wide as it is high.
    void notch(std::size_t i, double height) {
        const Element e = elements[i];
        const Vec2 along = unit(e.ep - e.sp);
        const Vec2 m = middle(e.sp, e.ep);
        const Vec2 tip = m - height * rightNormal(along);
        const Vec2 from = m - height * along;
        const Vec2 to = m + height * along;
        elements[i].ep = from;
        const Elements more{{from, tip, 0}, {tip, to, 0}, {to, e.ep, 0}};
        elements.insert(elements.begin() + static_cast<std::ptrdiff_t>(i) + 1, more.begin(),
                        more.end());
        for (Index& end : ends)
            end += end > i ? 3 : 0;
    }

    Elements elements;
    std::vector<Index> ends;
};

Verdict verified(const RegionSet& source, double d, const LooseLoops& result) {
    Verdict verdict;
    FaultList faults(verdict);
    OffsetVerifier verifier;
    verifier.verify(LooseLoops(source).view(), d, result.view(), {}, source.tolerance(), faults);
    return verdict;
}

/// Whether a fault of a kind was found within a distance of a point.
bool found(const Verdict& verdict, FaultKind kind, Vec2 at, double within) {
    return std::any_of(verdict.faults.begin(), verdict.faults.end(), [&](const Fault& f) {
        return f.kind == kind && distance(f.at, at) <= within;
    });
}

/// Ways to break an offset that hold for any shape, and what must be found where.
void expectFaults(const RegionSet& source, double d, const RegionSet& result) {
    const double t = source.tolerance();
    const LooseLoops sound(result);
    ASSERT_TRUE(verified(source, d, sound).isSound()) << texts(verified(source, d, sound));
    const auto expect = [&](const char* what, FaultKind kind, Vec2 at, double within,
                            const std::function<void(LooseLoops&)>& damage) {
        LooseLoops broken = sound;
        damage(broken);
        const Verdict verdict = verified(source, d, broken);
        EXPECT_TRUE(found(verdict, kind, at, within)) << what << ": " << texts(verdict);
    };
    const double size = 50.0;
    for (std::size_t loop = 0; loop < sound.ends.size(); ++loop) {
        SCOPED_TRACE(loop);
        const Index i = sound.beginOf(loop);
        const Element e = sound.elements[i];
        const Vec2 m = middleOf(e);
        expect("lost", FaultKind::kMissing, m, size, [&](LooseLoops& l) { l.lose(loop); });
        expect("reversed", FaultKind::kWrongSense, m, 0.5 * lengthAlong(e),
               [&](LooseLoops& l) { l.reverse(loop); });
        expect("doubled", FaultKind::kCrossing, m, size, [&](LooseLoops& l) { l.repeat(loop); });
        // To the left is nearer to the source outward, and farther from it inward.
        const FaultKind toLeft = d > 0.0 ? FaultKind::kTooNear : FaultKind::kTooFar;
        const FaultKind toRight = d > 0.0 ? FaultKind::kTooFar : FaultKind::kTooNear;
        const double more = 12.0 * t / distance(e.sp, e.ep);
        expect("bulge", toRight, m, lengthAlong(e),
               [&](LooseLoops& l) { l.elements[i].bulge += more; });
        expect("bulge", toLeft, m, lengthAlong(e),
               [&](LooseLoops& l) { l.elements[i].bulge -= more; });
        const Vec2 right = rightNormal(tangentStart(e));
        expect("vertex", toRight, e.sp, size,
               [&](LooseLoops& l) { l.moveStart(i, 5 * t * right); });
        expect("vertex", toLeft, e.sp, size,
               [&](LooseLoops& l) { l.moveStart(i, -5 * t * right); });
        expect("shifted", FaultKind::kOpenLoop, e.sp, 1.1e-3,
               [&](LooseLoops& l) { l.elements[i].sp = e.sp + 1e-3 * right; });
        if (e.bulge == 0.0)
            expect("notch", toLeft, m, 8 * t, [&](LooseLoops& l) { l.notch(i, 3 * t); });
    }
}

TEST(Verify, FindsWhatIsBroken) {
    const Elements ell = shapes::polygon({{0, 0}, {10, 0}, {10, 4}, {4, 4}, {4, 10}, {0, 10}});
    const Elements slot{
        {{0, 0}, {8, 0}, 0}, {{8, 0}, {8, 4}, 1}, {{8, 4}, {0, 4}, 0}, {{0, 4}, {0, 0}, 1}};
    const std::vector<std::vector<Elements>> sources{
        {rectangle(0, 0, 10, 6)},
        {circle({3, 4}, 5)},
        {slot},
        {rectangle(0, 0, 20, 12), circle({5, 6}, 2), rectangle(11, 4, 4, 4)},
        {ell},
        {rectangle(0, 0, 5, 5), rectangle(6, 1, 5, 5)}};
    for (std::size_t i = 0; i < sources.size(); ++i) {
        for (const double d : {0.6, 0.2, -0.7}) {
            SCOPED_TRACE(std::to_string(i) + " " + std::to_string(d));
            const RegionSet source = cleaned(sources[i]);
            expectFaults(source, d, offset(source, d).regions);
        }
    }
}

TEST(Verify, PassesRandomOffsetsAndNotTheirNeighbours) {
    std::mt19937 engine(21);
    int passed = 0;
    for (int round = 0; round < 400; ++round) {
        SCOPED_TRACE(round);
        const RegionSet source = tangles(engine);
        const double d = uniform(engine, -2, 3);
        const Outcome outcome = offset(source, d);
        if (outcome.refusal) continue;
        const Verdict sound = verifyOffset(source, d, outcome.regions);
        ASSERT_TRUE(sound.isSound()) << texts(sound);
        ++passed;
        if (outcome.regions.empty()) continue;
        ASSERT_FALSE(verifyOffset(source, d + 5 * source.tolerance(), outcome.regions).isSound());
        const LooseLoops loops(outcome.regions);
        for (std::size_t loop = 0; loop < std::min<std::size_t>(4, loops.ends.size()); ++loop) {
            if (lengthAlong(loops.elements[loops.beginOf(loop)]) < 1e-2) continue;
            LooseLoops broken = loops;
            broken.lose(loop);
            EXPECT_TRUE(found(verified(source, d, broken), FaultKind::kMissing, {}, 100)) << loop;
        }
    }
    EXPECT_GT(passed, 300);
}

/// Corners beyond the limit are bevels, which were told to be too near once.
TEST(Verify, PassesMitersAndBevels) {
    std::mt19937 engine(22);
    int passed = 0;
    for (int round = 0; round < 140; ++round) {
        SCOPED_TRACE(round);
        const RegionSet source = tangles(engine);
        for (const OffsetOptions& options :
             {OffsetOptions{Join::kMiter, End::kRound, uniform(engine, 1, 4)},
              OffsetOptions{Join::kBevel, End::kRound, 1.0}}) {
            const double d = uniform(engine, -1, 2);
            const Outcome outcome = offset(source, d, options);
            if (outcome.refusal) continue;
            const Verdict verdict = verifyOffset(source, d, outcome.regions, options);
            EXPECT_TRUE(verdict.isSound()) << int(options.join) << " by " << d << ", limit "
                                           << options.miterLimit << ": " << texts(verdict);
            ++passed;
        }
    }
    EXPECT_GT(passed, 200);
    // A miter within its limit must not be cut off.
    const RegionSet square = cleaned({rectangle(0, 0, 10, 6)});
    const RegionSet bevels = offset(square, 1.0, {Join::kBevel, End::kRound, 1.0}).regions;
    const Verdict cut = verifyOffset(square, 1.0, bevels, {Join::kMiter, End::kRound, 1.5});
    EXPECT_TRUE(found(cut, FaultKind::kTooNear, {-0.5, -0.5}, 1e-6)) << texts(cut);
}

TEST(Verify, AnswersEmptyAndUndefined) {
    const RegionSet none;
    const RegionSet square = cleaned({rectangle(0, 0, 2, 2)});
    const double nan = std::numeric_limits<double>::quiet_NaN();
    EXPECT_TRUE(verifyOffset(square, 0.0, square).isSound());
    EXPECT_TRUE(verifyOffset(none, 1.0, none).isSound());
    EXPECT_TRUE(verifyOffset(square, -1.5, none).isSound());
    EXPECT_FALSE(verifyOffset(none, 1.0, square).isSound());
    EXPECT_FALSE(verifyOffset(square, -0.5, none).isSound());
    EXPECT_FALSE(verifyOffset(square, 0.0, none).isSound());
    for (const double d : {nan, HUGE_VAL, 1e200})
        EXPECT_EQ(verifyOffset(square, d, square).faults.at(0).kind, FaultKind::kUndefined);
}

TEST(Verify, TellsWedgesFromSidesThatRunAlong) {
    const auto wedge = [](double width) {
        return cleaned({rectangle(-30, 0, 5, 5), shapes::polygon({{0, 0}, {20, 0}, {20, width}})});
    };
    const double t = wedge(1.0).tolerance();
    const RegionSet thin = wedge(1.1 * t);
    ASSERT_EQ(thin.loops().size(), 2U);
    EXPECT_TRUE(verifyOffset(thin, 0.0, thin).isSound());
    LooseLoops along(thin);
    for (Element& e : along.elements) {
        for (Vec2* p : {&e.sp, &e.ep})
            p->y = p->x == 20.0 ? 0.3 * p->y : p->y;
    }
    EXPECT_TRUE(found(verified(thin, 0.0, along), FaultKind::kCrossing, {10, 0}, 10));
}

TEST(Verify, PassesSoundBooleansAlone) {
    std::mt19937 engine(5);
    const Combination all[]{Combination::kUnion, Combination::kIntersection,
                            Combination::kDifference, Combination::kSymmetricDifference};
    int checked = 0;
    for (int round = 0; round < 100; ++round) {
        SCOPED_TRACE(round);
        const RegionSet a = tangles(engine);
        const RegionSet b = round % 10 == 0 ? a : tangles(engine);
        for (const Combination c : all) {
            const RegionSet result = combine(a, b, c).regions;
            const Verdict sound = verifyBoolean(a, b, c, result);
            ASSERT_TRUE(sound.isSound()) << int(c) << " " << texts(sound);
            const Combination other = all[(std::size_t(c) + 1) % 4];
            const double areaOfOther = shapes::area(combine(a, b, other).regions);
            if (std::fabs(areaOfOther - shapes::area(result)) < 1e-3) continue;
            EXPECT_FALSE(verifyBoolean(a, b, other, result).isSound()) << int(c);
            ++checked;
        }
    }
    EXPECT_GT(checked, 200);
}

TEST(Verify, PassesBooleansOfPartsThatTouch) {
    // On a grid sides run along each other, circles touch them, and corners lie on centres.
    std::mt19937 engine(7);
    const auto number = [&](unsigned range) { return static_cast<double>(engine() % range); };
    const auto heap = [&] {
        std::vector<Elements> loops;
        for (std::size_t i = 0; i < 2 + engine() % 6; ++i) {
            if (engine() % 2 == 0) {
                loops.push_back(rectangle(number(12), number(12), 1 + number(6), 1 + number(6)));
            } else {
                loops.push_back(circle({number(12), number(12)}, 1 + number(3)));
            }
        }
        return cleaned(loops);
    };
    for (int round = 0; round < 400; ++round) {
        SCOPED_TRACE(round);
        const RegionSet a = heap();
        const RegionSet b = heap();
        for (const Combination c :
             {Combination::kUnion, Combination::kIntersection, Combination::kDifference}) {
            const Verdict sound = verifyBoolean(a, b, c, combine(a, b, c).regions);
            ASSERT_TRUE(sound.isSound()) << int(c) << " " << texts(sound);
        }
    }
}

TEST(Verify, FindsBrokenBooleans) {
    const RegionSet a = cleaned({rectangle(0, 0, 10, 10), circle({3, 3}, 1)});
    const RegionSet b = cleaned({rectangle(5, 5, 10, 10), rectangle(20, 0, 1, 1)});
    const auto kindsOf = [&](const std::function<void(LooseLoops&)>& damage) {
        LooseLoops broken(combine(a, b, Combination::kUnion).regions);
        damage(broken);
        Verdict verdict;
        FaultList faults(verdict);
        BooleanVerifier verifier;
        verifier.verify(LooseLoops(a).view(), LooseLoops(b).view(), Combination::kUnion,
                        broken.view(), a.tolerance(), faults);
        return verdict;
    };
    EXPECT_TRUE(kindsOf([](LooseLoops&) {}).isSound());
    for (const std::size_t loop : {0U, 1U, 2U}) {
        const Verdict lost = kindsOf([&](LooseLoops& l) { l.lose(loop); });
        EXPECT_TRUE(found(lost, FaultKind::kWinding, {}, 100)) << loop;
        EXPECT_TRUE(found(lost, FaultKind::kArea, {}, 100)) << loop;
        EXPECT_FALSE(kindsOf([&](LooseLoops& l) { l.reverse(loop); }).isSound()) << loop;
        const Verdict moved = kindsOf([&](LooseLoops& l) {
            l.moveStart(l.beginOf(loop), {-1e-3, 2e-3});
        });
        EXPECT_TRUE(found(moved, FaultKind::kForeign, {}, 100)) << loop;
    }
}

}  // namespace
