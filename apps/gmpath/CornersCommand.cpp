// SPDX-License-Identifier: MIT
#include "apps/gmpath/CornersCommand.h"

#include <algorithm>
#include <memory>
#include <optional>

#include "apps/gmpath/InputOptions.h"
#include "apps/gmpath/OptionKinds.h"
#include "apps/gmpath/Phrases.h"
#include "apps/gmpath/Report.h"
#include "drawing/Text.h"
#include "drawing/files/OutputFiles.h"
#include "part/corners/CornerJob.h"

namespace gmpath {

using gmdrawing::checkOutputs;
using gmdrawing::counted;
using gmdrawing::DrawingUnits;
using gmdrawing::formatReal;
using gmdrawing::Length;
using gmdrawing::lengthIn;
using gmdrawing::Part;
using gmdrawing::PassName;
using gmdrawing::ResultDrawing;
using gmdrawing::saidUnits;
using gmdrawing::writeOutputs;
using gmpart::CornerChoice;
using gmpart::CornerKind;
using gmpart::CornerRequest;
using gmpart::CornerResult;
using gmpart::KernelRefusal;
using gmregion::kPi;

namespace {

constexpr int kLegendDigits = 6;
constexpr double kHalfTurn = 180.0;

/// Exactly one of the three sizes is given.
struct CornersOptions {
    InputOptions input;
    std::optional<Length> radius;
    std::optional<Length> chamfer;
    std::optional<Length> chamferLength;
    CornerChoice choice = CornerChoice::kAll;
    double bend = 5.0;  ///< degrees; joints that bend by less are no corners
    std::vector<std::string> outputs;
};

void addSizes(CLI::App& corners, CornersOptions& options) {
    CLI::App* sizes = corners.add_option_group("size", "What the corners become");
    sizes->add_option("--radius", options.radius, "round them with this radius")
        ->transform(positiveLength());
    sizes->add_option("--chamfer", options.chamfer, "chamfer them, this far from the corner")
        ->transform(positiveLength());
    sizes
        ->add_option("--chamfer-length", options.chamferLength,
                     "chamfer them, with a chamfer of this length")
        ->transform(positiveLength());
    sizes->require_option(1);
}

void addOptions(CLI::App& corners, CornersOptions& options) {
    addSizes(corners, options);
    CLI::Option* convex = corners.add_flag_callback(
        "--convex", [&options] { options.choice = CornerChoice::kConvex; },
        "only corners that turn with their closed contour");
    corners
        .add_flag_callback(
            "--concave", [&options] { options.choice = CornerChoice::kConcave; },
            "only corners that turn against it")
        ->excludes(convex);
    corners.add_option("--bend", options.bend, "joints that bend by fewer degrees are no corners")
        ->transform(angleUpTo(kHalfTurn))
        ->capture_default_str();
    addOutputs(corners, options.outputs);
    addInputOptions(corners, options.input);
}

CornerRequest requestOf(const CornersOptions& options, const DrawingUnits& units) {
    const auto request = [&](CornerKind kind, Length size) {
        return CornerRequest{kind, lengthIn(units, size), options.choice,
                             options.bend / kHalfTurn * kPi};
    };
    if (options.radius) return request(CornerKind::kRounding, *options.radius);
    if (options.chamfer) return request(CornerKind::kChamferDistance, *options.chamfer);
    return request(CornerKind::kChamferLength, options.chamferLength.value_or(Length{}));
}

PassName nameOf(const CornerRequest& request) {
    const std::string value = formatReal(request.value, kLegendDigits);
    const bool rounds = request.kind == CornerKind::kRounding;
    return {(rounds ? "rounded by " : "chamfer ") + value, ""};
}

/// What is to be told about a contour, empty when all went well.
std::string remark(const CornerResult& result) {
    if (result.refusal != KernelRefusal::kNone)
        return "left as it is: " + refusalText(result.refusal);
    if (result.notDone == 0) return {};
    return "no room at " + std::to_string(result.notDone) + " of " +
           counted(result.done + result.notDone, "corner");
}

bool runCorners(const CornersOptions& options, const Console& console) {
    checkOutputs(options.outputs, options.input.drawing);
    const Part part = readInput(options.input, console);
    const CornerRequest request = requestOf(options, part.units);
    ResultDrawing drawing{part.contours, {}, {nameOf(request)}, {}, true};
    const std::vector<CornerResult> results = breakCorners(part.contours, request);
    for (const CornerResult& result : results)
        drawing.results.push_back({{0, result.path, result.refusal != KernelRefusal::kNone}});
    drawing.units = saidUnits(part.units);
    writeOutputs(drawing, options.outputs);

    Report report(console.err, options.input.drawing, part.contours);
    std::size_t done = 0;
    std::size_t notDone = 0;
    for (std::size_t i = 0; i < results.size(); ++i) {
        done += results[i].done;
        notDone += results[i].notDone;
        report.tell(i, remark(results[i]));
    }
    console.out << counted(results.size(), "contour") << ", " << counted(done, "corner")
                << " done, " << notDone << " not done\n";
    return std::all_of(results.begin(), results.end(), [](const CornerResult& result) {
        return result.refusal == KernelRefusal::kNone;
    });
}

}  // namespace

Command addCorners(CLI::App& program) {
    CLI::App* corners =
        program.add_subcommand("corners", "Round or chamfer the corners of a part drawing");
    const auto options = std::make_shared<CornersOptions>();
    addOptions(*corners, *options);
    corners->footer("Example: gmpath corners bracket.dxf --radius 2 --convex -o rounded.dxf");
    return {corners, [=](const Console& console) { return runCorners(*options, console); }};
}

}  // namespace gmpath
