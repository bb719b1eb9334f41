#include "apps/gmpath/Commands.h"

#include <algorithm>
#include <cmath>

#include "apps/gmpath/InfoTable.h"
#include "apps/gmpath/Progress.h"
#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/files/OutputFiles.h"

namespace gmpath {

namespace {

constexpr int kMaxPasses = 10'000;

/// Distances beyond this leave the plane in which the kernel can tell points apart.
constexpr double kLargestDistance = 1e9;

constexpr int kDistanceDigits = 9;
constexpr int kLegendDigits = 6;

std::vector<double> distancesOf(const OffsetOptions& options) {
    if (options.count < 1 || options.count > kMaxPasses) {
        throw InputError("--count: not a number from 1 to " + std::to_string(kMaxPasses));
    }
    std::vector<double> distances;
    for (int pass = 0; pass < options.count; ++pass) {
        const double distance = options.distance + pass * options.step;
        if (!std::isfinite(distance) || std::abs(distance) > kLargestDistance) {
            throw InputError("--distance, --step: not a finite number, or beyond 1e9");
        }
        distances.push_back(distance);
    }
    return distances;
}

ResultDrawing drawingOf(const Part& part, const std::vector<ContourOffsets>& offsets,
                        const std::vector<double>& distances) {
    ResultDrawing drawing{part.contours, {}, {}};
    for (const ContourOffsets& found : offsets)
        drawing.results.push_back(found.paths);
    for (std::size_t pass = 0; pass < distances.size(); ++pass) {
        drawing.passes.push_back({"offset " + formatReal(distances[pass], kLegendDigits),
                                  "OFFSET_" + std::to_string(pass + 1)});
    }
    return drawing;
}

void reportContour(const std::string& contour, const std::vector<double>& distances,
                   const ContourOffsets& offsets, const Console& console) {
    if (!offsets.accepted) {
        console.err << contour << ": the kernel cannot take it over\n";
        return;
    }
    for (const FaultyOffset& faulty : offsets.faults)
        console.err << contour << ": " << faultText(faulty) << "\n";
    for (const std::size_t pass : offsets.emptyPasses) {
        console.err << contour << ": nothing left at distance "
                    << formatReal(distances[pass], kDistanceDigits) << "\n";
    }
}

void reportContours(const OffsetOptions& options, const std::vector<double>& distances,
                    const std::vector<ContourOffsets>& offsets, const Console& console) {
    std::size_t paths = 0;
    for (std::size_t i = 0; i < offsets.size(); ++i) {
        reportContour(
            "gmpath: " + printable(options.input.drawing) + ": contour " + std::to_string(i + 1),
            distances, offsets[i], console);
        paths += offsets[i].paths.size();
    }
    console.out << counted(offsets.size(), "contour") << ", " << counted(paths, "offset") << "\n";
}

}  // namespace

void checkPositive(double value, const std::string& option) {
    if (!std::isfinite(value) || value <= 0.0 || value > kLargestDistance) {
        throw InputError(option + ": not a positive finite number");
    }
}

std::string faultText(const FaultyOffset& faulty) {
    const std::string side = faulty.distance > 0.0 ? "right" : "left";
    return "the offset by " + formatReal(std::abs(faulty.distance), kDistanceDigits) + " to the " +
           side + " " + std::string(faultText(faulty.fault));
}

Part readInput(const InputOptions& options, const Console& console) {
    checkPositive(options.read.joinTolerance, "--join");
    checkPositive(options.read.scale, "--scale");
    Part part = readPart(options.drawing, options.read);
    if (part.skipped.unusable.empty()) return part;
    const std::string line = options.drawing + ": " + unusableLine(part.skipped);
    if (options.strict) throw InputError(line);
    console.err << "gmpath: " << printable(line) << "\n";
    return part;
}

void runInfo(const InputOptions& options, const Console& console) {
    console.out << infoTable(readInput(options, console));
}

bool runOffset(const OffsetOptions& options, const Console& console) {
    const std::vector<double> distances = distancesOf(options);
    checkOutputs(options.outputs, options.input.drawing);
    const Part part = readInput(options.input, console);
    Progress progress(console.err, console.showProgress);
    const std::vector<ContourOffsets> offsets =
        offsetContours(part.contours, {options.side, distances},
                       [&](std::size_t done, std::size_t total) { progress.show(done, total); });
    writeOutputs(drawingOf(part, offsets, distances), options.outputs);
    progress.clear();
    reportContours(options, distances, offsets, console);
    return std::all_of(offsets.begin(), offsets.end(),
                       [](const ContourOffsets& of) { return of.accepted && of.faults.empty(); });
}

}  // namespace gmpath
