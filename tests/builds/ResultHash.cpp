// SPDX-License-Identifier: MIT
/// @file
/// Prints a hash over every bit of what all operations answer, for some sources. Builds by
/// different compilers are to print the same.
#include <cstdio>

#include "tests/builds/AllOperations.h"

int main() {
    using namespace gmregion;
    Workspace workspace;
    std::size_t numbers = 0;
    for (const unsigned seed : {1U, 2U, 3U, 4U, 5U, 6U}) {
        const Sources sources = makeSources(seed);
        ResultBits bits;
        callAll(sources, workspace, bits);
        numbers += bits.bits().size();
        std::printf("%u %016llx\n", seed, static_cast<unsigned long long>(bits.hash()));
    }
    std::printf("of %zu numbers\n", numbers);
    return 0;
}
