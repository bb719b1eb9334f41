// SPDX-License-Identifier: MIT
#include "apps/gmpath/ReadRemarks.h"

#include <optional>

#include "drawing/Text.h"
#include "drawing/contours/Frame.h"

namespace gmpath {

using gmdrawing::counted;
using gmdrawing::DrawingUnits;
using gmdrawing::formatReal;
using gmdrawing::frameOf;
using gmdrawing::Part;
using gmdrawing::printable;
using gmdrawing::ReadReport;
using gmdrawing::SkipCounts;
using gmdrawing::totalOf;
using gmdrawing::UnitSource;
using gmdrawing::unitText;

namespace {

std::string entitiesLine(const SkipCounts& counts, const std::string& what) {
    const std::size_t total = totalOf(counts);
    return std::to_string(total) + (total == 1 ? " entity " : " entities ") + what + " (" +
           kindsText(counts) + ")";
}

void tellFrame(const Part& part, Report& report) {
    const std::optional<std::size_t> frame = frameOf(part.contours);
    if (!frame) return;
    const std::string layer = printable(part.contours[*frame].layer);
    report.tell(*frame, "a rectangle that holds all others and has layer " + layer +
                            " for itself; if it is a frame, the part is inside out: leave it out "
                            "with --skip-layer '" +
                            layer + "'");
}

}  // namespace

void tellReading(const Part& part, Report& report) {
    constexpr int kHeightDigits = 6;
    const ReadReport& read = part.report;
    if (!read.unusable.empty()) report.tell(unusableLine(read));
    if (!read.leftOut.empty()) report.tell(entitiesLine(read.leftOut, "left out"));
    if (read.highest > read.lowest) {
        report.tell("heights from " + formatReal(read.lowest, kHeightDigits) + " to " +
                    formatReal(read.highest, kHeightDigits) + ", flattened");
    }
    if (part.mended.overlaps > 0) {
        report.tell(counted(part.mended.overlaps, "element") + " cut where others cover it");
    }
    tellFrame(part, report);
}

std::string unusableLine(const ReadReport& report) {
    return entitiesLine(report.unusable, "cannot be used");
}

std::string unitsText(const DrawingUnits& units) {
    switch (units.source) {
        case UnitSource::kDrawing:
            return unitText(units.code) + " (as the drawing says)";
        case UnitSource::kOption:
            return unitText(units.code) + " (as --units says)";
        case UnitSource::kAssumed:
            break;
    }
    return unitText(units.code) + " (assumed, the drawing names none: --units)";
}

}  // namespace gmpath
