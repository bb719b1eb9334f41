// SPDX-License-Identifier: MIT
#include "apps/gmpath/OffsetCommand.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <memory>
#include <optional>

#include "apps/gmpath/InputOptions.h"
#include "apps/gmpath/OptionKinds.h"
#include "apps/gmpath/Phrases.h"
#include "apps/gmpath/Progress.h"
#include "apps/gmpath/Report.h"
#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/contours/Nesting.h"
#include "drawing/files/OutputFiles.h"

namespace gmpath {

using gmdrawing::checkOutputs;
using gmdrawing::counted;
using gmdrawing::formatReal;
using gmdrawing::InputError;
using gmdrawing::nestingDepths;
using gmdrawing::Part;
using gmdrawing::ResultDrawing;
using gmdrawing::writeOutputs;
using gmregion::ContourOffsets;
using gmregion::FaultyOffset;
using gmregion::OffsetPath;
using gmregion::Refusal;
using gmregion::Side;

namespace {

constexpr int kMaxPasses = 10'000;

constexpr int kLegendDigits = 6;

struct OffsetOptions {
    InputOptions input;
    double distance = 0.0;       ///< of the first pass
    std::optional<double> step;  ///< from one pass to the next; the first distance when left out
    int count = 1;               ///< number of passes
    Side side = Side::kWaste;
    std::vector<std::string> outputs;
};

const std::map<std::string, Side>& sideNames() {
    static const std::map<std::string, Side> names = {
        {"waste", Side::kWaste},   {"right", Side::kRight},     {"left", Side::kLeft},
        {"inside", Side::kInside}, {"outside", Side::kOutside}, {"both", Side::kBoth}};
    return names;
}

void addOptions(CLI::App& offset, OffsetOptions& options) {
    addInputOptions(offset, options.input);
    offset.add_option("-d,--distance", options.distance, "distance of the first pass")
        ->transform(finiteNumber())
        ->required();
    offset.add_option("--count", options.count, "number of passes")
        ->transform(countUpTo(kMaxPasses))
        ->capture_default_str();
    offset
        .add_option("--step", options.step,
                    "distance from one pass to the next [the first distance]")
        ->transform(finiteNumber());
    addNamedOption(offset, "--side", options.side, sideNames(),
                   "waste (outside of outlines, inside of holes; open contours both), right, left, "
                   "inside, outside or both [waste]");
    addOutputs(offset, options.outputs);
}

std::vector<double> distancesOf(const OffsetOptions& options) {
    const double step = options.step.value_or(options.distance);
    std::vector<double> distances;
    for (int pass = 0; pass < options.count; ++pass) {
        const double distance = options.distance + pass * step;
        if (std::abs(distance) > kLargestNumber) {
            throw InputError("--distance, --step, --count: the last pass lies beyond 1e9");
        }
        distances.push_back(distance);
    }
    return distances;
}

ResultDrawing drawingOf(const Part& part, const std::vector<ContourOffsets>& offsets,
                        const std::vector<double>& distances) {
    ResultDrawing drawing{part.contours, {}, {}};
    for (const ContourOffsets& found : offsets) {
        drawing.results.emplace_back();
        for (const OffsetPath& offset : found.paths)
            drawing.results.back().push_back({offset.pass, offset.path, offset.doubtful});
    }
    for (std::size_t pass = 0; pass < distances.size(); ++pass) {
        drawing.passes.push_back({"offset " + formatReal(distances[pass], kLegendDigits),
                                  "OFFSET_" + std::to_string(pass + 1)});
    }
    return drawing;
}

void reportContour(std::size_t contour, const std::vector<double>& distances,
                   const ContourOffsets& offsets, const Report& report) {
    if (offsets.refusal != Refusal::kNone) {
        report.tell(contour, "no offsets: " + refusalText(offsets.refusal));
        return;
    }
    for (const FaultyOffset& faulty : offsets.faults)
        report.tell(contour, faultText(faulty));
    for (const std::size_t pass : offsets.emptyPasses) {
        report.tell(contour,
                    "nothing left at distance " + formatReal(distances[pass], kDistanceDigits));
    }
}

bool runOffset(const OffsetOptions& options, const Console& console) {
    const std::vector<double> distances = distancesOf(options);
    checkOutputs(options.outputs, options.input.drawing);
    const Part part = readInput(options.input, console);
    Progress progress(console.err, console.showProgress);
    const std::vector<ContourOffsets> offsets =
        offsetContours(part.contours, nestingDepths(part.contours), {options.side, distances},
                       [&](std::size_t done, std::size_t total) { progress.show(done, total); });
    writeOutputs(drawingOf(part, offsets, distances), options.outputs);
    progress.clear();

    const Report report(console.err, options.input.drawing);
    std::size_t paths = 0;
    for (std::size_t i = 0; i < offsets.size(); ++i) {
        reportContour(i, distances, offsets[i], report);
        paths += offsets[i].paths.size();
    }
    console.out << counted(offsets.size(), "contour") << ", " << counted(paths, "offset") << "\n";
    return std::all_of(offsets.begin(), offsets.end(), [](const ContourOffsets& of) {
        return of.refusal == Refusal::kNone && of.faults.empty();
    });
}

}  // namespace

Command addOffset(CLI::App& program) {
    CLI::App* offset = program.add_subcommand("offset", "Offset every contour of a part drawing");
    const auto options = std::make_shared<OffsetOptions>();
    addOptions(*offset, *options);
    offset->footer(
        "Example: gmpath offset bracket.dxf --distance 3 --count 2 --step 2.5 -o paths.svg "
        "-o paths.dxf");
    return {offset, [=](const Console& console) { return runOffset(*options, console); }};
}

}  // namespace gmpath
