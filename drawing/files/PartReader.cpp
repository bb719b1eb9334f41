// SPDX-License-Identifier: MIT
#include "drawing/files/PartReader.h"

#include <dxflib/dl_dxf.h>

#include <sstream>

#include "drawing/InputError.h"
#include "drawing/contours/ChainBuilder.h"
#include "drawing/dxf/BlockExpansion.h"
#include "drawing/dxf/DxfGroups.h"
#include "drawing/dxf/DxfHeader.h"
#include "drawing/dxf/DxfReader.h"
#include "drawing/dxf/DxfSanitizer.h"
#include "drawing/dxf/DxfText.h"
#include "drawing/dxf/NumberLocale.h"
#include "drawing/svg/reading/SvgReader.h"

namespace gmdrawing {

namespace {

/// A length by the customs of who draws in millimetres and of who draws in inches.
struct CustomaryLength {
    Length metric;
    Length imperial;

    double in(const DrawingUnits& units) const {
        constexpr int kFeet = 2;
        const bool isImperial = units.code == kInch || units.code == kFeet;
        return lengthIn(units, isImperial ? imperial : metric);
    }
};

constexpr CustomaryLength kJoin{{1e-3, kMillimetre}, {5e-4, kInch}};
constexpr CustomaryLength kCurves{{1e-2, kMillimetre}, {5e-4, kInch}};
constexpr CustomaryLength kShortest{{1e-4, kMillimetre}, {1e-5, kInch}};

double lengthOr(const DrawingUnits& units, const std::optional<Length>& option,
                const CustomaryLength& otherwise) {
    return option ? lengthIn(units, *option) : otherwise.in(units);
}

Drawing readSanitized(const SanitizedDrawing& sanitized) {
    requirePlainNumbers();
    std::istringstream stream(sanitized.text);
    DxfReader collector;
    DL_Dxf reader;
    reader.in(stream, &collector);
    Drawing drawing = collector.takeDrawing();
    for (const auto& [block, skipped] : sanitized.skipped) {
        SkipCounts& counts =
            (block.empty() ? drawing.model : drawing.blocks[block]).report.unusable;
        for (const auto& [kind, count] : skipped)
            counts[kind] += count;
    }
    for (const auto& [block, places] : sanitized.places) {
        std::vector<SkippedPlace>& all =
            (block.empty() ? drawing.model : drawing.blocks[block]).report.places;
        all.insert(all.end(), places.begin(), places.end());
    }
    return drawing;
}

[[noreturn]] void failWithoutContours(const ReadReport& report) {
    std::string cause = "the drawing holds no contours";
    if (!report.unusable.empty()) cause += "; cannot be used: " + kindsText(report.unusable);
    if (!report.leftOut.empty()) cause += "; left out: " + kindsText(report.leftOut);
    throw InputError(cause);
}

/// A part that knows its units and the tolerances that go by them.
Part emptyPart(const DrawingUnits& units, const ReadOptions& options) {
    Part part;
    part.units = units;
    part.joinTolerance = lengthOr(units, options.join, kJoin);
    part.curveTolerance = lengthOr(units, options.curves, kCurves);
    part.shortest = kShortest.in(units);
    return part;
}

/// The part with the contours of what was placed.
Part withContours(Part part, PlacedPaths placed, const ReadOptions& options) {
    part.report = std::move(placed.report);
    ChainResult chains = buildChains(std::move(placed.paths), part.joinTolerance * options.scale,
                                     part.shortest * options.scale);
    part.contours = std::move(chains.contours);
    part.mended = chains.mended;
    part.report.shortElements = chains.shortElements;
    part.report.duplicates = chains.duplicates;
    if (part.contours.empty()) failWithoutContours(part.report);
    return part;
}

Part partFromSvg(const std::string& text, const ReadOptions& options) {
    const SvgDrawing drawing(text);
    Part part = emptyPart(drawing.units(options.units), options);
    PlacedPaths placed = drawing.read(part.units, options.scale, part.curveTolerance,
                                      LayerChoice(options.layers, {}));
    return withContours(std::move(part), std::move(placed), options);
}

Part partFromDxf(const std::string& text, const ReadOptions& options) {
    const std::string plain = plainDxfText(text);
    const std::vector<DxfGroup> groups = dxfGroups(plain);
    Part part = emptyPart(drawingUnits(groups, options.units), options);
    const SanitizedDrawing sanitized = sanitizedDrawing(groups);
    const LayerChoice layers(options.layers, hiddenLayers(groups));
    PlacedPaths placed = expandBlocks(
        readSanitized(sanitized),
        {Placement::scaling(options.scale), part.curveTolerance * options.scale, layers});
    placed.report.lowest = sanitized.lowest;
    placed.report.highest = sanitized.highest;
    return withContours(std::move(part), std::move(placed), options);
}

}  // namespace

Part partFromText(const std::string& text, const ReadOptions& options) {
    return isXml(text) ? partFromSvg(text, options) : partFromDxf(text, options);
}

Part readPart(const std::string& fileName, const ReadOptions& options) {
    try {
        return partFromText(readFile(fileName), options);
    } catch (const InputError& error) {
        throw InputError(fileName + ": " + error.what());
    }
}

}  // namespace gmdrawing
