// SPDX-License-Identifier: MIT
#include "apps/gmpath/MeltCommand.h"

#include <algorithm>
#include <memory>
#include <sstream>

#include "apps/gmpath/InputOptions.h"
#include "apps/gmpath/OptionKinds.h"
#include "apps/gmpath/Phrases.h"
#include "apps/gmpath/Report.h"
#include "drawing/Text.h"
#include "drawing/files/OutputFiles.h"
#include "region/boolean/MeltJob.h"

namespace gmpath {

using gmdrawing::checkOutputs;
using gmdrawing::counted;
using gmdrawing::Part;
using gmdrawing::ResultDrawing;
using gmdrawing::writeOutputs;
using gmregion::LoopKind;
using gmregion::MeltedPair;
using gmregion::MeltLoop;
using gmregion::MeltOutcome;

namespace {

struct MeltOptions {
    InputOptions first;  ///< its reading options hold for both drawings
    std::string second;
    std::vector<std::string> outputs;
};

std::string labelOf(const std::string& drawing, std::size_t index) {
    return drawing + std::to_string(index + 1);
}

std::string pairName(const MeltedPair& pair) {
    return labelOf("A", pair.first) + " + " + labelOf("B", pair.second);
}

std::string loopsText(const MeltedPair& pair) {
    const auto isOutline = [](const MeltLoop& loop) { return loop.kind == LoopKind::kOutline; };
    const auto outlines =
        static_cast<std::size_t>(std::count_if(pair.loops.begin(), pair.loops.end(), isOutline));
    return counted(pair.loops.size(), "loop") + " (" + counted(outlines, "outline") + ", " +
           counted(pair.loops.size() - outlines, "common part") + ")";
}

std::string outcomeText(const MeltedPair& pair) {
    switch (pair.outcome) {
        case MeltOutcome::kLoops:
            return loopsText(pair);
        case MeltOutcome::kFirstInside:
            return "no loops, " + labelOf("A", pair.first) + " lies inside";
        case MeltOutcome::kSecondInside:
            return "no loops, " + labelOf("B", pair.second) + " lies inside";
        case MeltOutcome::kSame:
            return "no loops, they are the same";
        case MeltOutcome::kRefused:
            return "not melted, in one of them " + refusalText(pair.refusal);
        case MeltOutcome::kFailed:
            return "the loops are not outline and common parts";
        case MeltOutcome::kApart:
            break;
    }
    return "no loops, they do not overlap";
}

void addContours(ResultDrawing& drawing, const Part& part, const std::string& name) {
    for (std::size_t i = 0; i < part.contours.size(); ++i) {
        drawing.contours.push_back(part.contours[i]);
        drawing.labels.push_back(labelOf(name, i));
    }
}

ResultDrawing drawingOf(const Part& first, const Part& second,
                        const std::vector<MeltedPair>& pairs) {
    ResultDrawing drawing{{}, {}, {{"outlines", "OUTLINE"}, {"common parts", "COMMON"}}, {}, true};
    addContours(drawing, first, "A");
    addContours(drawing, second, "B");
    drawing.results.resize(drawing.contours.size());
    for (const MeltedPair& pair : pairs) {
        for (const MeltLoop& loop : pair.loops) {
            const std::size_t pass = loop.kind == LoopKind::kOutline ? 0 : 1;
            drawing.results[pair.first].push_back(
                {pass, loop.path, pair.outcome == MeltOutcome::kFailed});
        }
    }
    return drawing;
}

bool runMelt(const MeltOptions& options, const Console& console) {
    checkOutputs(options.outputs, options.first.drawing);
    checkOutputs(options.outputs, options.second);
    // What the drawings hold besides is told only when both can be read.
    std::ostringstream remarks;
    const Part first = readInput(options.first, {console.out, remarks});
    InputOptions secondInput = options.first;
    secondInput.drawing = options.second;
    const Part second = readInput(secondInput, {console.out, remarks});
    console.err << remarks.str();
    const std::vector<MeltedPair> pairs = meltContours(first.contours, second.contours);
    writeOutputs(drawingOf(first, second, pairs), options.outputs);

    std::size_t melted = 0;
    bool sound = true;
    for (const MeltedPair& pair : pairs) {
        const bool failed =
            pair.outcome == MeltOutcome::kFailed || pair.outcome == MeltOutcome::kRefused;
        melted += pair.outcome == MeltOutcome::kLoops ? 1 : 0;
        sound = sound && !failed;
        if (failed) {
            Report(console.err, pairName(pair)).tell(outcomeText(pair));
        } else {
            console.out << pairName(pair) << ": " << outcomeText(pair) << "\n";
        }
    }
    console.out << counted(pairs.size(), "pair") << ", " << melted << " melted\n";
    return sound;
}

}  // namespace

Command addMelt(CLI::App& program) {
    CLI::App* melt =
        program.add_subcommand("melt", "Melt the overlapping contours of two part drawings");
    const auto options = std::make_shared<MeltOptions>();
    addOutputs(*melt, options->outputs);
    addInputOptions(*melt, options->first);
    melt->add_option("SECOND", options->second, "the other drawing")->required();
    melt->footer("Example: gmpath melt plate.dxf boss.dxf -o outline.dxf -o outline.svg");
    return {melt, [=](const Console& console) { return runMelt(*options, console); }};
}

}  // namespace gmpath
