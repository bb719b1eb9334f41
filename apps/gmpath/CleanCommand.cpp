// SPDX-License-Identifier: MIT
#include "apps/gmpath/CleanCommand.h"

#include <iomanip>
#include <map>
#include <memory>
#include <optional>
#include <sstream>

#include "apps/gmpath/InputOptions.h"
#include "apps/gmpath/OptionKinds.h"
#include "apps/gmpath/Phrases.h"
#include "apps/gmpath/Report.h"
#include "drawing/Text.h"
#include "drawing/files/OutputFiles.h"
#include "gmregion/CleanUp.h"
#include "part/clean/CleanJob.h"
#include "part/regions/ContourRegions.h"
#include "part/regions/PartRegions.h"

namespace gmpath {

using gmdrawing::checkOutputs;
using gmdrawing::DrawingUnits;
using gmdrawing::formatReal;
using gmdrawing::Length;
using gmdrawing::lengthIn;
using gmdrawing::Part;
using gmdrawing::ResultDrawing;
using gmdrawing::saidUnits;
using gmdrawing::writeOutputs;
using gmpart::CleanRequest;
using gmpart::CleanResult;
using gmpart::Path;
using gmpart::sourcesOf;
using gmregion::FillRule;
using gmregion::RegionSet;

namespace {

constexpr int kGapDigits = 4;
constexpr int kNameWidth = 38;

struct CleanOptions {
    InputOptions input;
    std::optional<FillRule> rule;
    std::optional<Length> tolerance;
    std::optional<Length> fit;
    std::vector<std::string> outputs;
};

const std::map<std::string, std::optional<FillRule>>& ruleNames() {
    static const std::map<std::string, std::optional<FillRule>> names = {
        {"nesting", std::nullopt},
        {"nonzero", FillRule::kNonZero},
        {"evenodd", FillRule::kEvenOdd},
        {"positive", FillRule::kPositive}};
    return names;
}

void addOptions(CLI::App& clean, CleanOptions& options) {
    addOutputs(clean, options.outputs);
    addInputOptions(clean, options.input);
    addNamedOption(
        clean, "--rule", options.rule, ruleNames(),
        "what closed contours cover: nesting (outlines and holes by turns, each filled), "
        "nonzero, evenodd or positive, by how often they run round a place [nesting]");
    clean
        .add_option("--tolerance", options.tolerance,
                    "points and sides that lie this far apart are the same [a millionth of the "
                    "size, 1e-4 at most]")
        ->transform(positiveLength());
    clean
        .add_option("--fit", options.fit,
                    "replace runs of short elements by arcs and lines within this distance [none]")
        ->transform(positiveLength());
}

/// What was found and mended, a line each.
std::string table(const Part& part, const CleanResult& cleaned) {
    std::ostringstream text;
    const auto row = [&](const std::string& name, const std::string& value) {
        text << std::left << std::setw(kNameWidth) << name << value << "\n";
    };
    const auto count = [&](const std::string& name, std::size_t number) {
        row(name, std::to_string(number));
    };
    const RegionSet& set = cleaned.result.regions;
    count("contours", part.contours.size());
    count("elements of closed contours", cleaned.elements);
    count("short elements dropped", part.report.shortElements);
    count("duplicates dropped", part.report.duplicates);
    count("overlapping elements cut", part.mended.overlaps);
    row("gaps closed", part.mended.gaps == 0 ? "0"
                                             : std::to_string(part.mended.gaps) + ", the largest " +
                                                   formatReal(part.mended.largestGap, kGapDigits));
    count("contours left out, enclose nothing", cleaned.left);
    count("outlines", set.regionCount());
    count("holes", set.loops().size() - set.regionCount());
    count("elements", cleaned.unfitted);
    if (cleaned.unfitted != set.elements().size()) {
        count("elements after fitting", set.elements().size());
    }
    return text.str();
}

ResultDrawing drawingOf(const Part& part, const RegionSet& set) {
    ResultDrawing drawing{part.contours, {}, {{"regions", ""}}, {}, true};
    drawing.results.resize(part.contours.size());
    drawing.units = saidUnits(part.units);
    for (std::size_t loop = 0; loop < set.loops().size(); ++loop) {
        const std::size_t main = sourcesOf(set, loop).main;
        Path path = gmpart::loopPath(set, loop);
        path.layer = part.contours[main].layer;
        drawing.results[main].push_back({0, std::move(path)});
    }
    return drawing;
}

CleanRequest requestOf(const CleanOptions& options, const DrawingUnits& units) {
    CleanRequest request;
    request.rule = options.rule;
    if (options.tolerance) request.tolerance = lengthIn(units, *options.tolerance);
    if (options.fit) request.fit = lengthIn(units, *options.fit);
    return request;
}

bool runClean(const CleanOptions& options, const Console& console) {
    checkOutputs(options.outputs, options.input.drawing);
    const Part part = readInput(options.input, console);
    const CleanResult cleaned = cleanPart(part.contours, requestOf(options, part.units));
    writeOutputs(drawingOf(part, cleaned.result.regions), options.outputs);
    if (cleaned.result.refusal) {
        Report(console.err, options.input.drawing, part.contours)
            .tell("not cleaned: " + std::string(textOf(cleaned.result.refusal.reason)) +
                  placeText(cleaned.result.refusal.at));
    }
    console.out << table(part, cleaned);
    return !cleaned.result.refusal;
}

}  // namespace

Command addClean(CLI::App& program) {
    CLI::App* clean =
        program.add_subcommand("clean", "Make clean outlines and holes of a part drawing");
    const auto options = std::make_shared<CleanOptions>();
    addOptions(*clean, *options);
    clean->footer("Example: gmpath clean bracket.dxf --fit 0.01 -o clean.dxf -o clean.svg");
    return {clean, [=](const Console& console) { return runClean(*options, console); }};
}

}  // namespace gmpath
