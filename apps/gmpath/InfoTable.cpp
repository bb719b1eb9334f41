// SPDX-License-Identifier: MIT
#include "apps/gmpath/InfoTable.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include "drawing/Text.h"
#include "part/model/Area.h"
#include "part/regions/Nesting.h"
#include "region/model/Box.h"

namespace gmpath {

using gmdrawing::characterCount;
using gmdrawing::counted;
using gmdrawing::formatFixed;
using gmdrawing::formatReal;
using gmdrawing::Part;
using gmdrawing::printable;
using gmdrawing::SkippedKind;
using gmdrawing::SkipReport;
using gmpart::nestingOf;
using gmpart::Path;
using gmpart::Sense;
using gmregion::Box;
using gmregion::kKernelTolerance;
using gmregion::Vec2;

namespace {

using Row = std::vector<std::string>;

constexpr int kDecimals = 4;

/// Columns with text; the others hold numbers, which are set to the right.
constexpr std::size_t kLayerColumn = 1;
constexpr std::size_t kStateColumn = 2;

std::string number(double value) {
    return formatFixed(value, kDecimals);
}

std::string point(Vec2 p) {
    return "(" + number(p.x) + ", " + number(p.y) + ")";
}

Row headRow() {
    return {"no", "layer", "state", "depth", "segments", "arcs", "length", "area", "sense", "box"};
}

std::string senseText(const Path& path) {
    switch (sense(path)) {
        case Sense::kCounterClockwise:
            return "ccw";
        case Sense::kClockwise:
            return "cw";
        case Sense::kNone:
            break;
    }
    return "-";
}

Row contourRow(std::size_t index, const Path& path, std::size_t depth) {
    const std::size_t arcs = arcCount(path);
    const Box box = boundingBox(path);
    return {std::to_string(index + 1),
            printable(path.layer),
            path.closed ? "closed" : "open",
            path.closed ? std::to_string(depth) : "-",
            std::to_string(path.elements.size() - arcs),
            std::to_string(arcs),
            number(length(path)),
            path.closed ? number(std::abs(signedArea(path))) : "-",
            senseText(path),
            point(box.low) + " - " + point(box.high)};
}

std::vector<std::size_t> columnWidths(const std::vector<Row>& rows) {
    std::vector<std::size_t> widths(rows.front().size(), 0);
    for (const Row& row : rows) {
        for (std::size_t i = 0; i < row.size(); ++i) {
            widths[i] = std::max(widths[i], characterCount(row[i]));
        }
    }
    return widths;
}

std::string rowText(const Row& row, const std::vector<std::size_t>& widths) {
    std::string text;
    for (std::size_t i = 0; i + 1 < row.size(); ++i) {
        const std::string blanks(widths[i] - characterCount(row[i]), ' ');
        const bool toTheLeft = i == kLayerColumn || i == kStateColumn;
        text += (toTheLeft ? row[i] + blanks : blanks + row[i]) + "  ";
    }
    return text + row.back() + "\n";
}

std::string kindText(const SkippedKind& kind, std::size_t count) {
    return std::to_string(count) + " " + printable(kind.kind) + " on layer " +
           printable(kind.layer) + ": " + kind.reason;
}

}  // namespace

std::string infoTable(const Part& part) {
    const std::vector<std::size_t> depths = nestingOf(part.contours).depths;
    std::vector<Row> rows = {headRow()};
    for (std::size_t i = 0; i < part.contours.size(); ++i) {
        rows.push_back(contourRow(i, part.contours[i], depths[i]));
    }
    const std::vector<std::size_t> widths = columnWidths(rows);
    std::string text;
    for (const Row& row : rows)
        text += rowText(row, widths);
    return text + skipLines(part.skipped);
}

std::string skipLines(const SkipReport& skipped) {
    std::string text;
    for (const auto& [kind, count] : skipped.unusable) {
        text += "skipped: " + kindText(kind, count) + "\n";
    }
    if (skipped.shortElements > 0) {
        text += "dropped: " + counted(skipped.shortElements, "element") + " shorter than " +
                formatReal(kKernelTolerance) + "\n";
    }
    if (skipped.duplicates > 0) {
        text += "dropped: " + counted(skipped.duplicates, "duplicate") + "\n";
    }
    return text;
}

std::string unusableLine(const SkipReport& skipped) {
    const std::size_t total = skipped.unusableCount();
    std::string text =
        std::to_string(total) + (total == 1 ? " entity" : " entities") + " cannot be used (";
    const char* separator = "";
    for (const auto& [kind, count] : skipped.unusable) {
        text += separator + kindText(kind, count);
        separator = "; ";
    }
    return text + ")";
}

}  // namespace gmpath
