// SPDX-License-Identifier: MIT
#include "drawing/files/PartReader.h"

#include <dxflib/dl_dxf.h>

#include <sstream>

#include "drawing/InputError.h"
#include "drawing/contours/ChainBuilder.h"
#include "drawing/dxf/BlockExpansion.h"
#include "drawing/dxf/DxfGroups.h"
#include "drawing/dxf/DxfReader.h"
#include "drawing/dxf/DxfSanitizer.h"
#include "drawing/dxf/DxfUnits.h"
#include "drawing/dxf/NumberLocale.h"

namespace gmdrawing {

using gmpart::Placement;

namespace {

void add(SkipReport& report, const SkipReport& other) {
    for (const auto& [kind, count] : other.unusable)
        report.unusable[kind] += count;
    report.shortElements += other.shortElements;
    report.duplicates += other.duplicates;
}

Drawing readSanitized(const SanitizedDrawing& sanitized) {
    requirePlainNumbers();
    std::istringstream stream(sanitized.text);
    DxfReader collector;
    DL_Dxf reader;
    reader.in(stream, &collector);
    Drawing drawing = collector.takeDrawing();
    for (const auto& [block, report] : sanitized.skipped) {
        add(block.empty() ? drawing.model.skipped : drawing.blocks[block].skipped, report);
    }
    return drawing;
}

[[noreturn]] void failWithoutContours(const SkipReport& skipped) {
    const std::size_t unusable = skipped.unusableCount();
    throw InputError("the drawing holds no contours" +
                     (unusable == 0
                          ? std::string()
                          : ", " + std::to_string(unusable) + " of its entities cannot be used"));
}

}  // namespace

Part partFromText(const std::string& text, const ReadOptions& options) {
    const std::vector<DxfGroup> groups = dxfGroups(text);
    const Drawing drawing = readSanitized(sanitizedDrawing(groups));
    ExpandedDrawing expanded = expandBlocks(drawing, Placement::scaling(options.scale));
    ChainResult chains = buildChains(
        std::move(expanded.paths), options.joinTolerance * options.scale, options.withoutOverlaps);
    Part part{std::move(chains.contours), std::move(expanded.skipped), chains.mended,
              drawingUnits(groups)};
    add(part.skipped, chains.skipped);
    if (part.contours.empty()) failWithoutContours(part.skipped);
    return part;
}

Part readPart(const std::string& fileName, const ReadOptions& options) {
    try {
        return partFromText(readFile(fileName), options);
    } catch (const InputError& error) {
        throw InputError(fileName + ": " + error.what());
    }
}

}  // namespace gmdrawing
