// SPDX-License-Identifier: MIT
#include "apps/gmpath/ToolpathCommand.h"

#include <algorithm>
#include <array>
#include <memory>
#include <sstream>

#include "apps/gmpath/Phrases.h"
#include "apps/gmpath/Progress.h"
#include "apps/gmpath/Report.h"
#include "apps/gmpath/ToolpathSettings.h"
#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/contours/BrokenContours.h"
#include "drawing/files/OutputFiles.h"
#include "machining/picture/ToolpathPicture.h"

namespace gmpath {

using gmdrawing::AtomicFile;
using gmdrawing::BrokenContour;
using gmdrawing::brokenContours;
using gmdrawing::checkOutputs;
using gmdrawing::counted;
using gmdrawing::doubtfulContours;
using gmdrawing::endingOf;
using gmdrawing::formatFixed;
using gmdrawing::formatReal;
using gmdrawing::InputError;
using gmdrawing::OutputFormat;
using gmdrawing::Part;
using gmdrawing::writeOutputs;
using gmmachining::ContourCut;
using gmmachining::LeadTally;
using gmmachining::MachineSettings;
using gmmachining::MoveKind;
using gmmachining::ToolpathRequest;
using gmmachining::ToolpathResult;
using gmmachining::Units;
using gmpart::OffsetFault;
using gmpart::OffsetRefusal;
using gmpart::PartOffsets;
using gmpart::Path;

namespace {

constexpr int kSizeDigits = 4;

/// Endings of the outputs.
constexpr std::array<const char*, 4> kPrograms = {".ngc", ".nc", ".tap", ".gcode"};
constexpr const char* kPicture = ".svg";
constexpr int kLengthDecimals = 1;

std::string shortenedText(const LeadTally& leads) {
    const std::string size = formatReal(leads.smallest, kSizeDigits);
    if (leads.shortened == 1) return "lead shortened to " + size;
    return std::to_string(leads.shortened) + " leads shortened, the smallest to " + size;
}

std::string droppedText(const LeadTally& leads) {
    if (leads.dropped == 1) return "no room for a lead, dropped";
    return "no room for " + std::to_string(leads.dropped) + " leads, dropped";
}

/// What is to be told about a contour, empty when all went well.
std::string remark(const ContourCut& cut) {
    if (!cut.fits) return "the tool does not fit";
    std::string text;
    const auto add = [&](bool applies, const std::string& what) {
        if (applies) text += (text.empty() ? "" : "; ") + what;
    };
    add(!cut.keepsAway, "the cut comes too near to another contour");
    add(cut.leads.shortened > 0, shortenedText(cut.leads));
    add(cut.leads.dropped > 0, droppedText(cut.leads));
    return text;
}

void reportOffsets(Report& report, const PartOffsets& offsets) {
    for (const OffsetRefusal& refusal : offsets.refusals)
        report.tell("no offset: " + std::string(textOf(refusal.reason)) + placeText(refusal.at));
    for (const OffsetFault& fault : offsets.faults)
        report.tell("an offset is faulty, not cut: " + faultText(fault.fault, fault.count));
}

void reportContours(Report& report, const ToolpathResult& result) {
    const std::vector<ContourCut>& cuts = result.contours;
    const auto runRound =
        std::count_if(cuts.begin(), cuts.end(), [](const ContourCut& cut) { return cut.runRound; });
    if (runRound > 0) {
        report.tell(counted(static_cast<std::size_t>(runRound), "open contour") + " cut all round");
    }
    for (const std::vector<std::size_t>& contours : result.together) {
        report.tell("contours " + numbersText(contours) +
                    " cut as one: the tool does not fit between them");
    }
    const bool complete = result.offsets.refusals.empty() && result.offsets.faults.empty();
    for (std::size_t i = 0; i < cuts.size(); ++i) {
        if (complete || cuts[i].fits) report.tell(i, remark(cuts[i]));
    }
}

std::string summary(const ToolpathResult& result, Units units) {
    LeadTally leads;
    for (const ContourCut& cut : result.contours) {
        leads.made += cut.leads.made;
        leads.shortened += cut.leads.shortened;
        leads.dropped += cut.leads.dropped;
    }
    const std::string unit = units == Units::kInches ? " in" : " mm";
    const auto lengthText = [&](MoveKind kind) {
        return formatFixed(travel(result.moves, kind), kLengthDecimals) + unit;
    };
    return counted(result.contours.size(), "contour") + ", cuts " + lengthText(MoveKind::kCut) +
           ", rapid moves " + lengthText(MoveKind::kRapid) + ", " + counted(leads.made, "lead") +
           " (" + std::to_string(leads.shortened) + " shortened), " +
           std::to_string(leads.dropped) + " dropped\n";
}

/// Drawings whose units no machine has are told by their name.
ToolpathRequest requestFor(const Part& part, const ToolpathOptions& options) {
    try {
        return toolpathRequest(options, part.units);
    } catch (const InputError& error) {
        throw InputError(options.input.drawing + ": " + error.what());
    }
}

/// The contours whose sides are known, by number. Tells which are broken.
std::vector<std::size_t> soundContours(const Part& part, const ToolpathOptions& options,
                                       Report& report) {
    const double near = options.input.read.scale * part.joinTolerance;
    const std::vector<BrokenContour> broken =
        brokenContours(part.contours, part.report.places, near);
    for (const BrokenContour& piece : broken)
        report.tell(piece.contour, piece.reason + ", its end" + placeText(piece.at));
    const std::vector<std::size_t> doubtful = doubtfulContours(part.contours, broken);
    std::vector<std::size_t> sound;
    for (std::size_t i = 0; i < part.contours.size(); ++i) {
        if (!std::binary_search(doubtful.begin(), doubtful.end(), i)) sound.push_back(i);
    }
    if (doubtful.empty()) return sound;
    report.tell(options.anyway ? "contours " + numbersText(doubtful) +
                                     " are not cut: with broken ones about, their side is not known"
                               : "nothing is written (--anyway cuts the other contours)");
    return sound;
}

/// The tool path of some of the contours, told by the numbers of all.
ToolpathResult toolpathOf(const std::vector<Path>& contours, const std::vector<std::size_t>& chosen,
                          const ToolpathRequest& request, Progress& progress) {
    std::vector<Path> paths;
    for (const std::size_t contour : chosen)
        paths.push_back(contours[contour]);
    ToolpathResult result = makeToolpath(
        paths, request, [&](std::size_t done, std::size_t total) { progress.show(done, total); });
    std::vector<ContourCut> cuts(contours.size());
    for (std::size_t i = 0; i < chosen.size(); ++i)
        cuts[chosen[i]] = result.contours[i];
    result.contours = std::move(cuts);
    for (std::vector<std::size_t>& together : result.together) {
        for (std::size_t& contour : together)
            contour = chosen[contour];
    }
    for (gmmachining::Move& move : result.moves)
        move.contour = chosen[move.contour];
    return result;
}

/// Whether nothing is cut that is not known to be right.
bool isSafe(const ToolpathResult& result) {
    return result.offsets.refusals.empty() && result.offsets.faults.empty() &&
           std::all_of(result.contours.begin(), result.contours.end(),
                       [](const ContourCut& cut) { return cut.keepsAway; });
}

std::vector<std::string> outputEndings() {
    std::vector<std::string> endings(kPrograms.begin(), kPrograms.end());
    endings.emplace_back(kPicture);
    return endings;
}

/// The outputs without the programs for machines.
std::vector<std::string> withoutPrograms(std::vector<std::string> outputs) {
    const auto isProgram = [](const std::string& name) { return endingOf(name) != kPicture; };
    outputs.erase(std::remove_if(outputs.begin(), outputs.end(), isProgram), outputs.end());
    return outputs;
}

bool runToolpath(const ToolpathOptions& options, const Console& console) {
    checkOutputs(options.outputs, options.input.drawing, outputEndings());
    // What the drawing holds besides is told only when the rest is in order.
    std::ostringstream remarks;
    const Part part = readInput(options.input, {console.out, remarks});
    const ToolpathRequest request = requestFor(part, options);
    const MachineSettings settings = machineSettings(options, part.units);
    console.err << remarks.str();
    Report report(console.err, options.input.drawing, part.contours);
    const std::vector<std::size_t> chosen = soundContours(part, options, report);
    const bool complete = chosen.size() == part.contours.size();
    if (chosen.empty() || (!complete && !options.anyway)) return false;
    Progress progress(console.err, console.showProgress);
    const ToolpathResult result = toolpathOf(part.contours, chosen, request, progress);
    const bool safe = isSafe(result);
    std::vector<OutputFormat> formats = {
        {kPicture, [&](AtomicFile& file) { file.write(svgOf(part.contours, result)); }}};
    for (const char* ending : kPrograms) {
        formats.push_back(
            {ending, [&](AtomicFile& file) { file.write(gcodeOf(result.moves, settings)); }});
    }
    writeOutputs(formats,
                 safe || options.anyway ? options.outputs : withoutPrograms(options.outputs));
    progress.clear();
    reportOffsets(report, result.offsets);
    reportContours(report, result);
    if (!safe && !options.anyway) report.tell("no program is written (--anyway writes it)");
    console.out << summary(result, settings.units);
    return complete && safe && result.together.empty();
}

}  // namespace

Command addToolpath(CLI::App& program) {
    CLI::App* toolpath =
        program.add_subcommand("toolpath", "Cut out the contours of a part drawing with a tool");
    const auto options = std::make_shared<ToolpathOptions>();
    addToolpathOptions(*toolpath, *options);
    toolpath->footer(
        "Example: gmpath toolpath bracket.dxf --tool 6 --lead arc --depth 8 --step-down 2 "
        "-o bracket.ngc -o bracket.svg");
    return {toolpath, [=](const Console& console) { return runToolpath(*options, console); }};
}

}  // namespace gmpath
