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
#include "drawing/files/OutputFiles.h"
#include "part/offset/KernelOffset.h"
#include "part/offset/PartOffset.h"

namespace gmpath {

using gmdrawing::checkOutputs;
using gmdrawing::counted;
using gmdrawing::DrawingUnits;
using gmdrawing::formatReal;
using gmdrawing::InputError;
using gmdrawing::Length;
using gmdrawing::lengthIn;
using gmdrawing::Part;
using gmdrawing::ResultDrawing;
using gmdrawing::saidUnits;
using gmdrawing::writeOutputs;
using gmpart::OffsetFault;
using gmpart::offsetPart;
using gmpart::offsetPartByKernel;
using gmpart::OffsetPath;
using gmpart::OffsetRefusal;
using gmpart::OffsetRequest;
using gmpart::PartOffsets;
using gmpart::Side;
using gmregion::Join;
using gmregion::Point;

namespace {

constexpr int kMaxPasses = 10'000;

constexpr int kLegendDigits = 6;

struct OffsetOptions {
    InputOptions input;
    Length distance;             ///< of the first pass
    std::optional<Length> step;  ///< from one pass to the next; the first distance when left out
    int count = 1;               ///< number of passes
    Side side = Side::kWaste;
    Join join = Join::kRound;
    bool each = false;            ///< contours by themselves
    bool byKernel = false;        ///< the kernel makes the offsets
    bool onSourceLayers = false;  ///< results stand on the layers of their contours
    std::vector<std::string> outputs;
};

const std::map<std::string, Side>& sideNames() {
    static const std::map<std::string, Side> names = {
        {"waste", Side::kWaste}, {"material", Side::kMaterial}, {"right", Side::kRight},
        {"left", Side::kLeft},   {"inside", Side::kInside},     {"outside", Side::kOutside},
        {"both", Side::kBoth}};
    return names;
}

const std::map<std::string, Join>& joinNames() {
    static const std::map<std::string, Join> names = {
        {"round", Join::kRound}, {"miter", Join::kMiter}, {"bevel", Join::kBevel}};
    return names;
}

const std::map<std::string, bool>& layerNames() {
    static const std::map<std::string, bool> names = {{"pass", false}, {"source", true}};
    return names;
}

const std::map<std::string, bool>& engineNames() {
    static const std::map<std::string, bool> names = {{"regions", false}, {"kernel", true}};
    return names;
}

void addPasses(CLI::App& offset, OffsetOptions& options) {
    offset.add_option("-d,--distance", options.distance, "distance of the first pass")
        ->transform(finiteLength())
        ->required();
    offset.add_option("--count", options.count, "number of passes")
        ->transform(countUpTo(kMaxPasses))
        ->capture_default_str();
    offset
        .add_option("--step", options.step,
                    "distance from one pass to the next [the first distance]")
        ->transform(finiteLength());
}

void addOptions(CLI::App& offset, OffsetOptions& options) {
    addInputOptions(offset, options.input);
    addPasses(offset, options);
    addNamedOption(offset, "--side", options.side, sideNames(),
                   "waste (outside of outlines, inside of holes), material (the other way), right, "
                   "left, inside, outside or both; open contours are run round but for right and "
                   "left [waste]");
    addNamedOption(offset, "--join-style", options.join, joinNames(),
                   "corners that open: round, miter or bevel [round]");
    offset.add_flag("--each", options.each, "offset every contour by itself: nothing merges");
    addNamedOption(offset, "--engine", options.byKernel, engineNames(),
                   "what makes the offsets: regions, or the kernel, contour by contour [regions]");
    addNamedOption(offset, "--layers", options.onSourceLayers, layerNames(),
                   "layers of results: one for each pass, or that of the source contour which most "
                   "of a result comes from [pass]");
    addOutputs(offset, options.outputs);
}

void checkEngine(const OffsetOptions& options) {
    if (options.byKernel && options.join != Join::kRound) {
        throw InputError("--engine kernel: its corners are round (--join-style)");
    }
}

std::vector<double> distancesOf(const OffsetOptions& options, const DrawingUnits& units) {
    const double first = lengthIn(units, options.distance);
    const double step = lengthIn(units, options.step.value_or(options.distance));
    std::vector<double> distances;
    for (int pass = 0; pass < options.count; ++pass) {
        const double distance = first + pass * step;
        if (std::abs(distance) > kLargestNumber) {
            throw InputError("--distance, --step, --count: the last pass lies beyond 1e9");
        }
        distances.push_back(distance);
    }
    return distances;
}

/// Results stand with the contour that most of their length comes from.
ResultDrawing drawingOf(const Part& part, const PartOffsets& offsets,
                        const std::vector<double>& distances, bool onSourceLayers) {
    ResultDrawing drawing{part.contours, {}, {}};
    drawing.results.resize(part.contours.size());
    drawing.units = saidUnits(part.units);
    for (const OffsetPath& offset : offsets.paths)
        drawing.results[offset.main].push_back({offset.pass, offset.path, offset.doubtful});
    for (std::size_t pass = 0; pass < distances.size(); ++pass) {
        drawing.passes.push_back({"offset " + formatReal(distances[pass], kLegendDigits),
                                  onSourceLayers ? "" : "OFFSET_" + std::to_string(pass + 1)});
    }
    return drawing;
}

/// What is told about the offsets of a drawing.
class OffsetReport {
public:
    OffsetReport(const PartOffsets& offsets, const std::vector<double>& distances,
                 std::size_t contours, Report& report)
        : m_offsets(offsets), m_distances(distances), m_contours(contours), m_report(report) {}

    void tellAll() const {
        for (const OffsetRefusal& refusal : m_offsets.refusals)
            tell(refusal.contour, "no offset " + passText(refusal.pass) + ": " +
                                      textOf(refusal.reason) + placeText(refusal.at));
        for (const OffsetFault& fault : m_offsets.faults)
            tell(fault.contour, "the offset " + passText(fault.pass) +
                                    " is faulty: " + faultText(fault.fault, fault.count));
        for (std::size_t pass = 0; pass < m_distances.size(); ++pass) {
            tellMerged(pass);
            tellMissing(pass);
            tellMarginal(pass);
        }
    }

private:
    std::string passText(std::size_t pass) const {
        return "at distance " + formatReal(m_distances[pass], kDistanceDigits);
    }

    void tell(std::optional<std::size_t> contour, const std::string& text) const {
        if (contour) {
            m_report.tell(*contour, text);
        } else {
            m_report.tell(text);
        }
    }

    void tellMerged(std::size_t pass) const {
        for (const OffsetPath& path : m_offsets.paths) {
            if (path.pass != pass || path.contours.size() < 2) continue;
            m_report.tell("the offsets " + passText(pass) + " of contours " +
                          numbersText(path.contours) + " meet and are one");
        }
    }

    void tellMissing(std::size_t pass) const {
        const auto isRefused = [&](const OffsetRefusal& refusal) { return refusal.pass == pass; };
        if (std::any_of(m_offsets.refusals.begin(), m_offsets.refusals.end(), isRefused)) return;
        std::vector<bool> found(m_contours, false);
        for (const OffsetPath& path : m_offsets.paths) {
            if (path.pass != pass) continue;
            for (const std::size_t contour : path.contours)
                found[contour] = true;
        }
        for (std::size_t i = 0; i < m_contours; ++i) {
            if (!found[i]) m_report.tell(i, "nothing left " + passText(pass));
        }
    }

    void tellMarginal(std::size_t pass) const {
        const std::vector<Point>& places = m_offsets.marginal[pass];
        if (places.empty()) return;
        m_report.tell(passText(pass) + ", " + counted(places.size(), "place") +
                      " where a neck or a gap is just twice as wide, the first" +
                      placeText(places.front()));
    }

    const PartOffsets& m_offsets;
    const std::vector<double>& m_distances;
    std::size_t m_contours;
    Report& m_report;
};

PartOffsets offsetsOf(const Part& part, const OffsetOptions& options, const OffsetRequest& request,
                      const Console& console) {
    Progress progress(console.err, console.showProgress);
    const auto show = [&](std::size_t done, std::size_t total) { progress.show(done, total); };
    PartOffsets offsets = options.byKernel ? offsetPartByKernel(part.contours, request, show)
                                           : offsetPart(part.contours, request, show);
    progress.clear();
    return offsets;
}

bool runOffset(const OffsetOptions& options, const Console& console) {
    checkEngine(options);
    checkOutputs(options.outputs, options.input.drawing);
    const Part part = readInput(options.input, console);
    const std::vector<double> distances = distancesOf(options, part.units);
    const OffsetRequest request{
        options.side, distances, {options.join, gmregion::End::kRound}, options.each};
    const PartOffsets offsets = offsetsOf(part, options, request, console);
    writeOutputs(drawingOf(part, offsets, distances, options.onSourceLayers), options.outputs);
    Report report(console.err, options.input.drawing, part.contours);
    OffsetReport(offsets, distances, part.contours.size(), report).tellAll();
    console.out << counted(part.contours.size(), "contour") << ", "
                << counted(offsets.paths.size(), "offset") << "\n";
    return offsets.refusals.empty() && offsets.faults.empty();
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
