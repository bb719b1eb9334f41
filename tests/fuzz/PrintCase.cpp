// SPDX-License-Identifier: MIT
/// @file
/// Prints what files of bytes stand for, as the lines of a test, and what becomes of them.
///   gmregion_print_case FILE...
#include <cmath>
#include <cstdio>
#include <string>

#include "tests/fuzz/CaseRunner.h"
#include "tests/fuzz/CorpusFiles.h"

namespace {

using namespace gmregion;
using namespace gmregion::fuzz;

constexpr const char* kTasks[kTaskCount]{"kCombine",  "kUniteAll",     "kOffset", "kOffsetSeries",
                                         "kThicken",  "kOpened",       "kClosed", "kQuestions",
                                         "kSimplify", "kSimplifyCurve"};

std::string text(double value) {
    if (std::isnan(value)) return "NAN";
    if (std::isinf(value)) return value > 0.0 ? "HUGE_VAL" : "-HUGE_VAL";
    char digits[32];
    std::snprintf(digits, sizeof digits, "%.17g", value);
    return digits;
}

std::string text(Point p) {
    return "{" + text(p.x) + ", " + text(p.y) + "}";
}

void print(const Heap& heap, std::size_t number) {
    std::printf("Paths heap%zu;\n", number);
    for (std::size_t i = 0; i < heap.paths.size(); ++i) {
        const PathView path = heap.paths[i];
        std::printf("heap%zu.add({", number);
        for (const Element& e : path) {
            std::printf("%s{%s, %s, %s}", &e == path.first ? "" : ",\n    ", text(e.sp).c_str(),
                        text(e.ep).c_str(), text(e.bulge).c_str());
        }
        std::printf("}, %s, %lld);\n", path.closed ? "true" : "false",
                    static_cast<long long>(path.id));
    }
    std::printf("CleanUpOptions{FillRule(%d), %s};\n", int(heap.options.rule),
                text(heap.options.tolerance).c_str());
}

void print(const Step& step) {
    std::printf(
        "// %s of %zu and %zu, %s, at %s, join %d, end %d, limit %s, corner %s, smooth %s\n",
        kTasks[static_cast<std::size_t>(step.task)], step.first, step.second,
        text(step.size).c_str(), text(step.at).c_str(), int(step.offset.join), int(step.offset.end),
        text(step.offset.miterLimit).c_str(), text(step.simplify.corner).c_str(),
        text(step.simplify.smooth).c_str());
}

}  // namespace

int main(int argc, char** argv) {
    for (int i = 1; i < argc; ++i) {
        const std::vector<std::uint8_t> bytes = bytesOf(argv[i]);
        const FuzzCase fuzzCase = decode(bytes.data(), bytes.size());
        std::printf("// %s\n", argv[i]);
        for (std::size_t heap = 0; heap < fuzzCase.heaps.size(); ++heap)
            print(fuzzCase.heaps[heap], heap);
        for (const Step& step : fuzzCase.steps)
            print(step);
        std::fflush(stdout);
        CaseRunner runner(fuzzCase);
        for (const std::string& promise : runner.run())
            std::printf("// broken: %s\n", promise.c_str());
        for (const Reason reason : runner.refusals())
            std::printf("// refused: %s\n", textOf(reason));
    }
    return 0;
}
