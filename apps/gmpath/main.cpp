// SPDX-License-Identifier: MIT
#include <unistd.h>

#include <iostream>
#include <locale>

#include "apps/gmpath/CommandLine.h"

int main(int argc, char** argv) {
    std::locale::global(std::locale::classic());  // numbers as drawings and machines have them
    const gmpath::Console console{std::cout, std::cerr, isatty(STDERR_FILENO) != 0};
    const int exitCode = gmpath::runCommandLine(argc, argv, console);
    if (std::cout.flush()) return exitCode;
    constexpr int kLostOutput = 2;
    std::cerr << "gmpath: the output cannot be written\n";
    return kLostOutput;
}
