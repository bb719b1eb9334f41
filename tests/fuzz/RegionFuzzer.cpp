// SPDX-License-Identifier: MIT
/// @file
/// What a fuzzing engine calls: any bytes are a case; a broken promise ends the program.
#include <cstdint>
#include <cstdio>
#include <cstdlib>

#include "tests/fuzz/CaseRunner.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const gmregion::fuzz::FuzzCase fuzzCase = gmregion::fuzz::decode(data, size);
    gmregion::fuzz::CaseRunner runner(fuzzCase);
    const std::vector<std::string>& broken = runner.run();
    for (const std::string& promise : broken)
        std::fprintf(stderr, "broken: %s\n", promise.c_str());
    if (!broken.empty()) std::abort();
    return 0;
}
