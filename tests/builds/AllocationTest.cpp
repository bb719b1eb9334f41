// SPDX-License-Identifier: MIT
/// @file
/// With a workspace and an outcome that were used twice before, operations allocate nothing: in the
/// first call memory is made, in the second what has changed places with what was larger. Every
/// call of operator new of this program is counted, so it holds no other test.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <functional>
#include <new>

#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Clip.h"
#include "gmregion/Offset.h"
#include "gmregion/Parallels.h"
#include "gmregion/Verify.h"
#include "tests/builds/AllOperations.h"

namespace {

std::size_t allocations = 0;

void* allocated(std::size_t size) {
    ++allocations;
    if (void* memory = std::malloc(size == 0 ? 1 : size)) return memory;
    throw std::bad_alloc();
}

}  // namespace

void* operator new(std::size_t size) {
    return allocated(size);
}
void* operator new[](std::size_t size) {
    return allocated(size);
}
void operator delete(void* memory) noexcept {
    std::free(memory);
}
void operator delete[](void* memory) noexcept {
    std::free(memory);
}
void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}
void operator delete[](void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace {

using namespace gmregion;

/// How many allocations each of some calls after the first two makes at the most.
std::size_t allocationsOfLaterCalls(const std::function<void()>& call) {
    call();
    call();
    std::size_t most = 0;
    for (int i = 0; i < 3; ++i) {
        const std::size_t before = allocations;
        call();
        most = std::max(most, allocations - before);
    }
    return most;
}

class Allocations : public testing::Test {
protected:
    /// Expects none, from every set of the sources.
    template <class Call>
    void expectNone(const char* what, const Call& call) {
        for (const RegionSet& set : m_sources.sets)
            EXPECT_EQ(allocationsOfLaterCalls([&] { call(set); }), 0U) << what;
    }

    const Sources m_sources = makeSources(2);
    Workspace m_workspace;
    Outcome m_outcome;
};

TEST_F(Allocations, AreCounted) {
    EXPECT_GT(allocationsOfLaterCalls([&] { cleanUp(m_sources.heap); }), 0U);
}

TEST_F(Allocations, AreNotMadeByCleanUpAndBooleans) {
    for (const FillRule rule : {FillRule::kNonZero, FillRule::kEvenOdd, FillRule::kPositive}) {
        const auto call = [&] { cleanUp(m_sources.heap, {rule, 0.0}, m_workspace, m_outcome); };
        EXPECT_EQ(allocationsOfLaterCalls(call), 0U);
    }
    for (const Combination combination :
         {Combination::kUnion, Combination::kIntersection, Combination::kDifference,
          Combination::kSymmetricDifference}) {
        expectNone("combine", [&](const RegionSet& set) {
            combine(m_sources.sets.front(), set, combination, m_workspace, m_outcome);
        });
    }
    const auto unite = [&] {
        uniteAll(m_sources.sets.data(), m_sources.sets.size(), m_workspace, m_outcome);
    };
    EXPECT_EQ(allocationsOfLaterCalls(unite), 0U);
}

TEST_F(Allocations, AreNotMadeByOffsets) {
    for (const Join join : {Join::kRound, Join::kMiter, Join::kBevel}) {
        for (const double d : {0.3, -0.3, 1.1}) {
            expectNone("offset", [&](const RegionSet& set) {
                offset(set, d, {join, End::kRound, 3.0}, m_workspace, m_outcome);
            });
        }
    }
    for (const End end : {End::kRound, End::kSquare, End::kButt}) {
        const auto call = [&] {
            thicken(m_sources.open, 0.2, 0.0, {Join::kRound, end, 3.0}, m_workspace, m_outcome);
        };
        EXPECT_EQ(allocationsOfLaterCalls(call), 0U);
    }
    Parallels parallels;
    const auto beside = [&] {
        makeParallels(m_sources.open, 0.2, 0.0, {}, m_workspace, parallels);
    };
    EXPECT_EQ(allocationsOfLaterCalls(beside), 0U);
    Clipping clipping;
    expectNone("clip",
               [&](const RegionSet& set) { clip(m_sources.open, set, m_workspace, clipping); });
    Verdict verdict;
    expectNone("verify", [&](const RegionSet& set) {
        verifyOffset(set, 0.0, set, {}, m_workspace, verdict);
    });
    const double distances[]{0.2, 0.4, -0.2};
    Outcome series[3];
    expectNone("series", [&](const RegionSet& set) {
        offsetSeries(set, distances, 3, {}, m_workspace, series);
    });
}

}  // namespace
