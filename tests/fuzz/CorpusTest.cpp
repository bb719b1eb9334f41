// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "tests/fuzz/CaseRunner.h"
#include "tests/fuzz/CorpusFiles.h"

namespace {

using namespace gmregion::fuzz;

/// Cases that a fuzzing engine found, each of which reaches something that the others do not.
TEST(Corpus, KeepsAllPromises) {
    std::size_t cases = 0;
    std::size_t steps = 0;
    for (const auto& file : filesIn(GMREGION_CORPUS)) {
        const std::vector<std::uint8_t> bytes = bytesOf(file);
        const FuzzCase fuzzCase = decode(bytes.data(), bytes.size());
        CaseRunner runner(fuzzCase);
        for (const std::string& promise : runner.run())
            ADD_FAILURE() << file.filename() << ": " << promise;
        ++cases;
        steps += fuzzCase.steps.size();
    }
    EXPECT_GT(cases, 30U);
    EXPECT_GT(steps, 100U);
}

}  // namespace
