// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "drawing/LayerChoice.h"
#include "drawing/MendReport.h"
#include "drawing/ReadReport.h"
#include "drawing/Units.h"
#include "part/model/Path.h"

namespace gmdrawing {

/// How a drawing is read. Lengths are positive.
struct ReadOptions {
    /// Ends that lie at most this far apart are joined [0.001 mm; 0.0005 in where the drawing is in
    /// inches or feet].
    std::optional<Length> join = std::nullopt;
    /// How far arcs may be from ellipses and splines that they stand for [0.01 mm; 0.0005 in where
    /// the drawing is in inches or feet].
    std::optional<Length> curves = std::nullopt;
    /// Factor from units of the drawing to units of the result; positive.
    double scale = 1.0;
    /// The units of the drawing, whatever it says.
    std::optional<int> units = std::nullopt;
    LayerPatterns layers = {};
};

/// What a part drawing holds.
struct Part {
    std::vector<gmpart::Path> contours;  ///< at least one, each with at least one element
    ReadReport report;
    MendReport mended;
    DrawingUnits units;
    double joinTolerance = 0.0;   ///< that was used, in units of the drawing
    double curveTolerance = 0.0;  ///< that was used, in units of the drawing
    double shortest = 0.0;        ///< shorter elements were dropped, in units of the drawing
};

/// Reads a part drawing (DXF in text form, or SVG) and builds its contours.
/// Throws InputError, with the file's name and the cause, for a file that is missing, unreadable,
/// empty, truncated or no drawing, for a drawing without contours, and when the locale of the
/// process does not read numbers as drawings have them.
Part readPart(const std::string& fileName, const ReadOptions& options);

/// The same for the text of a drawing. The causes come without a file name.
Part partFromText(const std::string& text, const ReadOptions& options);

}  // namespace gmdrawing
