// SPDX-License-Identifier: MIT
#include "apps/gmpath/ToolpathCommand.h"

#include <algorithm>
#include <memory>
#include <sstream>

#include "apps/gmpath/Phrases.h"
#include "apps/gmpath/Progress.h"
#include "apps/gmpath/Report.h"
#include "apps/gmpath/ToolpathSettings.h"
#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/files/OutputFiles.h"
#include "machining/picture/ToolpathPicture.h"

namespace gmpath {

using gmdrawing::AtomicFile;
using gmdrawing::checkOutputs;
using gmdrawing::counted;
using gmdrawing::formatFixed;
using gmdrawing::formatReal;
using gmdrawing::InputError;
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

namespace {

constexpr int kSizeDigits = 4;
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

void reportOffsets(const Report& report, const PartOffsets& offsets) {
    for (const OffsetRefusal& refusal : offsets.refusals)
        report.tell("no offset: " + std::string(textOf(refusal.reason)) + placeText(refusal.at));
    for (const OffsetFault& fault : offsets.faults)
        report.tell("an offset is faulty, not cut: " + faultText(fault.fault, fault.count));
}

void reportContours(const Report& report, const ToolpathResult& result) {
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

bool runToolpath(const ToolpathOptions& options, const Console& console) {
    checkOutputs(options.outputs, options.input.drawing, {".ngc", ".svg"});
    // What the drawing holds besides is told only when the rest is in order.
    std::ostringstream remarks;
    const Part part = readInput(options.input, {console.out, remarks});
    const ToolpathRequest request = requestFor(part, options);
    console.err << remarks.str();
    Progress progress(console.err, console.showProgress);
    const ToolpathResult result =
        makeToolpath(part.contours, request,
                     [&](std::size_t done, std::size_t total) { progress.show(done, total); });
    const MachineSettings settings = machineSettings(options, part.units);
    writeOutputs({{".ngc", [&](AtomicFile& file) { file.write(gcodeOf(result.moves, settings)); }},
                  {".svg", [&](AtomicFile& file) { file.write(svgOf(part.contours, result)); }}},
                 options.outputs);
    progress.clear();
    const Report report(console.err, options.input.drawing);
    reportOffsets(report, result.offsets);
    reportContours(report, result);
    console.out << summary(result, settings.units);
    return result.offsets.refusals.empty() && result.offsets.faults.empty() &&
           result.together.empty() &&
           std::all_of(result.contours.begin(), result.contours.end(),
                       [](const ContourCut& cut) { return cut.keepsAway; });
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
