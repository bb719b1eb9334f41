#include <unistd.h>

#include <iostream>

#include "CommandLine.h"

int main(int argc, char** argv) {
    const gmpath::Console console{std::cout, std::cerr, isatty(STDERR_FILENO) != 0};
    return gmpath::runCommandLine(argc, argv, console);
}
