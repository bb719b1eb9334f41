// SPDX-License-Identifier: MIT
/// @file
/// Threads that do everything at once, each with a workspace of its own, on sources that they
/// share.
#include <gtest/gtest.h>

#include <thread>
#include <vector>

#include "tests/builds/AllOperations.h"

namespace {

using namespace gmregion;

constexpr std::size_t kThreads = 4;
constexpr int kRounds = 2;

TEST(Threads, GiveTheBitsOfOneThread) {
    const Sources sources = makeSources(1);
    Workspace workspace;
    ResultBits alone;
    callAll(sources, workspace, alone);
    ASSERT_GT(alone.bits().size(), 10000U);
    std::vector<ResultBits> found(kThreads * kRounds);
    std::vector<std::thread> threads;
    for (std::size_t i = 0; i < kThreads; ++i) {
        threads.emplace_back([&sources, &found, i] {
            Workspace own;
            for (std::size_t round = 0; round < kRounds; ++round)
                callAll(sources, own, found[kRounds * i + round]);
        });
    }
    for (std::thread& thread : threads)
        thread.join();
    for (const ResultBits& bits : found)
        EXPECT_EQ(bits.bits(), alone.bits());
}

}  // namespace
