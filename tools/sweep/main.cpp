// SPDX-License-Identifier: MIT
// Offsets parts as they are drawn, in every position and rounding, and prints a table of what
// became of them.
#include <cstdint>
#include <iostream>
#include <stdexcept>
#include <string>
#include <vector>

#include "Row.h"

namespace {

using gmregion::shapes::DrawnPart;

constexpr int kFaults = 1;
constexpr int kUsageError = 2;

/// Numbers of drawings to pass over for parts of more and more elements: primes, with no factor in
/// common with degrees, decimals and starts.
constexpr std::size_t kStrides[]{7, 13, 29, 59, 113, 251, 509, 1021, 2039, 4093, 8191, 16381};
/// Elements that a row may offset at each distance, about.
constexpr std::size_t kWork = 120'000;

std::vector<DrawnPart> allParts() {
    std::vector<DrawnPart> parts = gmregion::shapes::drawnParts();
    for (const int corners : {36, 72, 180, 360, 720, 1440})
        parts.push_back(gmregion::shapes::regularPolygon(corners));
    return parts;
}

std::size_t strideFor(const DrawnPart& part) {
    std::size_t elements = 0;
    for (const gmregion::shapes::Elements& loop : part.loops)
        elements += loop.size();
    const std::size_t all = 360 * 11 * gmregion::shapes::startsOf(part) * elements;
    for (const std::size_t stride : kStrides) {
        if (all / stride <= kWork) return stride;
    }
    return kStrides[std::size(kStrides) - 1];
}

void print(const std::string& name, const sweep::Row& row) {
    std::cout << "| " << name << " | ";
    if (row.elements > 0) std::cout << row.elements;
    std::cout << " | " << row.drawings << " | ";
    if (row.distances > 0) std::cout << row.distances;
    for (const std::size_t count :
         {row.runs, row.lost, row.open, row.refused, row.unsound, row.marginal, row.hanging})
        std::cout << " | " << count;
    std::cout << " |" << std::endl;
}

int run(std::size_t every) {
    std::cout << "| part | elements | drawings | distances | runs | lost | open | refused | found "
                 "fault with | marginal | loops not compared |\n"
                 "|---|---|---|---|---|---|---|---|---|---|---|\n";
    sweep::Row sum;
    bool isClean = true;
    for (const DrawnPart& part : allParts()) {
        const sweep::Row row = sweep::sweepPart(part, every * strideFor(part), std::cerr);
        print(part.name, row);
        isClean = isClean && row.isClean();
        sum += row;
    }
    print("all", sum);
    return isClean ? 0 : kFaults;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        const std::vector<std::string> words(argv + 1, argv + argc);
        if (words.empty()) return run(1);
        if (words.size() != 2 || words[0] != "--every") throw std::invalid_argument("arguments");
        return run(std::stoul(words[1]));
    } catch (const std::exception&) {
        std::cerr << "usage: gmregion_sweep [--every N]\n";
        return kUsageError;
    }
}
