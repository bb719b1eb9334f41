// SPDX-License-Identifier: MIT
// Hashes what the kernel answers to many seeded operations, so that two builds of it can be
// compared bit by bit. Only public headers are used: the same sources compile against any of them.
#include <algorithm>
#include <iomanip>
#include <iostream>
#include <stdexcept>
#include <string>

#include "Families.h"

namespace {

constexpr int kUsageError = 2;
constexpr int kNothingAnswered = 1;

std::size_t IndexOf(std::string const& name) {
    std::vector<net::Family> const& families = net::Families();
    for (std::size_t i = 0; i < families.size(); ++i) {
        if (name == families[i].name) return i;
    }
    throw std::invalid_argument("no family " + name);
}

void Operate(std::size_t family, long index, net::Answer& answer) {
    net::Family const& chosen = net::Families()[family];
    net::Dice dice(family, static_cast<std::uint64_t>(index));
    answer.Begin(chosen.name, index);
    chosen.ask(dice, answer);
}

/// Prints the questions of a family with how often they were asked and answered; false where one
/// was never answered.
bool Report(char const* family, net::Answer const& answer) {
    bool bAll = !answer.Tallies().empty();
    for (auto const& [question, tally] : answer.Tallies()) {
        std::cerr << family << ": " << question << ": " << tally.answered << " of " << tally.asked
                  << " with a result" << (tally.answered > 0 ? "\n" : ": NO TEST\n");
        bAll = bAll && tally.answered > 0;
    }
    return bAll;
}

/// Asks the operations of a block and prints their hash.
void HashBlock(std::size_t family, long first, long last, net::Answer& answer) {
    answer.ResetHash();
    for (long i = first; i <= last; ++i)
        Operate(family, i, answer);
    std::cout << net::Families()[family].name << ' ' << first << '-' << last << ' ' << std::hex
              << std::setfill('0') << std::setw(16) << answer.Hash() << std::dec << std::endl;
}

/// Hashes the blocks of every family, or every n-th of them; false where a question was never
/// answered.
bool HashAll(long every) {
    bool bAll = true;
    for (std::size_t i = 0; i < net::Families().size(); ++i) {
        net::Family const& family = net::Families()[i];
        net::Answer answer(nullptr);
        for (long first = 0; first < family.operations; first += every * family.block)
            HashBlock(i, first, std::min(first + family.block, family.operations) - 1, answer);
        bAll = Report(family.name, answer) && bAll;
    }
    return bAll;
}

void Dump(std::string const& family, long first, long last) {
    const std::size_t index = IndexOf(family);
    net::Answer answer(&std::cout);
    for (long i = first; i <= last; ++i)
        Operate(index, i, answer);
}

int Run(std::vector<std::string> const& words) {
    if (words.empty()) return HashAll(1) ? 0 : kNothingAnswered;
    if (words.size() == 2 && words[0] == "--every")
        return HashAll(std::max(1L, std::stol(words[1]))) ? 0 : kNothingAnswered;
    if (words.size() != 3) throw std::invalid_argument("wrong number of arguments");
    Dump(words[0], std::stol(words[1]), std::stol(words[2]));
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return Run(std::vector<std::string>(argv + 1, argv + argc));
    } catch (std::exception const& error) {
        std::cerr << "net: " << error.what() << "\n"
                  << "usage: net                      one line a block: family, operations, hash\n"
                  << "       net --every N            the same of every N-th block\n"
                  << "       net FAMILY FIRST LAST    operations and answers in full\n";
        return kUsageError;
    }
}
