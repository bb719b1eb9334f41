// SPDX-License-Identifier: MIT
#include "apps/gmpath/InfoTable.h"

#include <algorithm>
#include <cmath>
#include <map>

#include "apps/gmpath/ReadRemarks.h"
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
using gmpart::nestingOf;
using gmpart::Path;
using gmpart::Sense;
using gmregion::Box;
using gmregion::Vec2;

namespace {

using Row = std::vector<std::string>;

constexpr int kDecimals = 4;
constexpr int kLengthDigits = 4;

/// Gaps up to this part of the joining tolerance are the rounding of drawings, and not told.
constexpr double kNoticed = 0.01;

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

/// "layer A: 3 contours, 1 open", a line each.
std::string layerLines(const std::vector<Path>& contours) {
    struct Counts {
        std::size_t all = 0;
        std::size_t open = 0;
    };
    std::map<std::string, Counts> layers;
    for (const Path& contour : contours) {
        Counts& counts = layers[contour.layer];
        ++counts.all;
        counts.open += contour.closed ? 0 : 1;
    }
    std::string text;
    for (const auto& [layer, counts] : layers) {
        text += "layer " + printable(layer) + ": " + counted(counts.all, "contour");
        if (counts.open > 0) text += ", " + std::to_string(counts.open) + " open";
        text += "\n";
    }
    return text;
}

std::string usedLine(const Part& part) {
    std::string text;
    bool hasCurves = false;
    for (const auto& [kind, count] : part.report.used) {
        text += (text.empty() ? "read: " : ", ") + std::to_string(count) + " " + printable(kind);
        hasCurves = hasCurves || kind == "SPLINE" || kind == "ELLIPSE";
    }
    if (hasCurves) text += ", curves within " + formatReal(part.curveTolerance, kLengthDigits);
    return text.empty() ? text : text + "\n";
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
    return text + "units: " + unitsText(part.units) + "\n" + layerLines(part.contours) +
           usedLine(part) + lossLines(part);
}

std::string lossLines(const Part& part) {
    std::string text;
    for (const auto& [kind, count] : part.report.unusable)
        text += "skipped: " + kindText(kind, count) + "\n";
    for (const auto& [kind, count] : part.report.leftOut)
        text += "left out: " + kindText(kind, count) + "\n";
    if (part.report.shortElements > 0) {
        text += "dropped: " + counted(part.report.shortElements, "element") + " shorter than " +
                formatReal(part.shortest, kLengthDigits) + "\n";
    }
    if (part.report.duplicates > 0) {
        text += "dropped: " + counted(part.report.duplicates, "duplicate") + "\n";
    }
    if (part.mended.overlaps > 0) {
        text += "mended: " + counted(part.mended.overlaps, "overlapping element") + " cut\n";
    }
    if (part.mended.largestGap > kNoticed * part.joinTolerance) {
        text += "mended: " + counted(part.mended.gaps, "gap") + " up to " +
                formatReal(part.mended.largestGap, kLengthDigits) + " closed\n";
    }
    return text;
}

}  // namespace gmpath
