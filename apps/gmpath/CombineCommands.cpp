// SPDX-License-Identifier: MIT
#include "apps/gmpath/CombineCommands.h"

#include <algorithm>
#include <memory>
#include <sstream>

#include "apps/gmpath/InputOptions.h"
#include "apps/gmpath/OptionKinds.h"
#include "apps/gmpath/Phrases.h"
#include "apps/gmpath/Report.h"
#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/files/OutputFiles.h"
#include "gmregion/Questions.h"

#include "part/boolean/PartBoolean.h"
#include "part/regions/ContourRegions.h"
#include "part/regions/PartRegions.h"

namespace gmpath {

using gmdrawing::checkOutputs;
using gmdrawing::counted;
using gmdrawing::formatReal;
using gmdrawing::InputError;
using gmdrawing::Part;
using gmdrawing::ResultDrawing;
using gmdrawing::saidUnits;
using gmdrawing::unitText;
using gmdrawing::writeOutputs;
using gmpart::combineParts;
using gmpart::LoopSources;
using gmpart::PartCombination;
using gmpart::Path;
using gmpart::sourcesOf;
using gmregion::Combination;
using gmregion::RegionSet;

namespace {

/// Drawings have letters for names.
constexpr std::size_t kMostParts = 26;

constexpr int kAreaDigits = 9;

/// One thing that a command makes of the parts.
struct Product {
    Combination combination;
    std::string name;
    std::string layer;  ///< empty for the layers of the contours that it comes from
};

struct Recipe {
    std::string command;
    std::string description;
    std::vector<Product> products;
};

const std::vector<Recipe>& recipes() {
    static const std::vector<Recipe> all = {
        {"union", "Make one part of several", {{Combination::kUnion, "union", ""}}},
        {"intersect",
         "What is common to several parts",
         {{Combination::kIntersection, "common part", ""}}},
        {"subtract",
         "The first part without the others",
         {{Combination::kDifference, "difference", ""}}},
        {"melt",
         "The union of several parts, and what is common to them",
         {{Combination::kUnion, "outlines", "OUTLINE"},
          {Combination::kIntersection, "common parts", "COMMON"}}}};
    return all;
}

struct CombineOptions {
    InputOptions read;  ///< how all drawings are read
    std::vector<std::string> drawings;
    std::vector<std::string> outputs;
};

std::string labelOf(std::size_t part, std::size_t contour) {
    return static_cast<char>('A' + static_cast<char>(part)) + std::to_string(contour + 1);
}

/// Drawings that name different units are not combined.
void checkUnits(const CombineOptions& options, const std::vector<Part>& parts) {
    const int first = saidUnits(parts.front().units);
    for (std::size_t i = 1; i < parts.size(); ++i) {
        const int other = saidUnits(parts[i].units);
        if (first == other || first == gmdrawing::kNoUnit || other == gmdrawing::kNoUnit) continue;
        throw InputError(options.drawings[i] + ": the drawing is in " + unitText(other) +
                         ", the first one in " + unitText(first));
    }
}

std::vector<Part> readAll(const CombineOptions& options, const Console& console) {
    // What the drawings hold besides is told only when all can be read.
    std::ostringstream remarks;
    std::vector<Part> parts;
    for (const std::string& drawing : options.drawings) {
        InputOptions input = options.read;
        input.drawing = drawing;
        parts.push_back(readInput(input, {console.out, remarks}));
    }
    checkUnits(options, parts);
    console.err << remarks.str();
    return parts;
}

ResultDrawing drawingOf(const std::vector<Part>& parts, const Recipe& recipe) {
    ResultDrawing drawing;
    drawing.replacesSources = true;
    drawing.units = saidUnits(parts.front().units);
    for (std::size_t p = 0; p < parts.size(); ++p) {
        for (std::size_t i = 0; i < parts[p].contours.size(); ++i) {
            drawing.contours.push_back(parts[p].contours[i]);
            drawing.labels.push_back(labelOf(p, i));
        }
    }
    for (const Product& product : recipe.products)
        drawing.passes.push_back({product.name, product.layer});
    drawing.results.resize(drawing.contours.size());
    return drawing;
}

void addResults(ResultDrawing& drawing, std::size_t product, const PartCombination& found) {
    const RegionSet& set = found.result.regions;
    for (std::size_t loop = 0; loop < set.loops().size(); ++loop) {
        const LoopSources sources = sourcesOf(set, loop);
        Path path = gmpart::loopPath(set, loop);
        path.layer = drawing.contours[sources.main].layer;
        drawing.results[sources.main].push_back(
            {product, std::move(path), !found.verdict.isSound()});
    }
}

std::string summary(const Product& product, const PartCombination& found) {
    const RegionSet& set = found.result.regions;
    const std::size_t holes = set.loops().size() - set.regionCount();
    return product.name + ": " + counted(set.regionCount(), "outline") + ", " +
           counted(holes, "hole") + ", area " + formatReal(area(set), kAreaDigits) + "\n";
}

/// Whether the result may be used; tells why not.
bool isSound(const Product& product, const PartCombination& found, Report& report) {
    if (found.result.refusal) {
        report.tell(product.name + ": not made, " + textOf(found.result.refusal.reason) +
                    placeText(found.result.refusal.at));
        return false;
    }
    if (found.verdict.isSound()) return true;
    report.tell(product.name +
                " is faulty: " + faultText(found.verdict.faults.front(), found.verdict.count));
    return false;
}

void tellLeftOut(const PartCombination& found, const std::vector<std::string>& labels,
                 Report& report) {
    for (std::size_t i = 0; i < found.hasRegions.size(); ++i) {
        if (!found.hasRegions[i]) {
            report.tell("contour " + labels[i] + ": encloses nothing, left out");
        }
    }
}

bool runCombination(const Recipe& recipe, const CombineOptions& options, const Console& console) {
    for (const std::string& drawing : options.drawings)
        checkOutputs(options.outputs, drawing);
    const std::vector<Part> parts = readAll(options, console);
    std::vector<const std::vector<Path>*> contours;
    for (const Part& part : parts)
        contours.push_back(&part.contours);

    ResultDrawing drawing = drawingOf(parts, recipe);
    const std::vector<Path> unnamed;  // remarks go by the labels of their own
    Report report(console.err, options.drawings.front(), unnamed);
    std::ostringstream summaries;
    bool sound = true;
    for (std::size_t i = 0; i < recipe.products.size(); ++i) {
        const PartCombination found = combineParts(contours, recipe.products[i].combination);
        if (i == 0) tellLeftOut(found, drawing.labels, report);
        sound = isSound(recipe.products[i], found, report) && sound;
        addResults(drawing, i, found);
        summaries << summary(recipe.products[i], found);
    }
    writeOutputs(drawing, options.outputs);
    console.out << summaries.str();
    return sound;
}

Command addCombination(CLI::App& program, const Recipe& recipe) {
    CLI::App* command = program.add_subcommand(recipe.command, recipe.description);
    const auto options = std::make_shared<CombineOptions>();
    addOutputs(*command, options->outputs);
    addReadOptions(*command, options->read);
    command->add_option("PARTS", options->drawings, "part drawings (DXF in text form, or SVG)")
        ->required()
        ->expected(2, static_cast<int>(kMostParts));
    command->footer("Example: gmpath " + recipe.command +
                    " plate.dxf boss.dxf -o result.dxf -o result.svg");
    return {command, [options, &recipe](const Console& console) {
                return runCombination(recipe, *options, console);
            }};
}

}  // namespace

std::vector<Command> addCombinations(CLI::App& program) {
    std::vector<Command> commands;
    for (const Recipe& recipe : recipes())
        commands.push_back(addCombination(program, recipe));
    return commands;
}

}  // namespace gmpath
