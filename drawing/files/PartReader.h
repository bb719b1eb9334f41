// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "drawing/DrawingUnits.h"
#include "drawing/MendReport.h"
#include "drawing/SkipReport.h"
#include "part/model/Path.h"

namespace gmdrawing {

struct ReadOptions {
    /// Ends that lie at most this far apart are joined, in units of the drawing; positive.
    double joinTolerance = 1e-3;
    /// Factor from units of the drawing to units of the result; positive.
    double scale = 1.0;
    /// Whether what stays open is joined once more without the parts of elements that lie on
    /// others.
    bool withoutOverlaps = false;
};

/// What a part drawing holds.
struct Part {
    std::vector<gmpart::Path> contours;  ///< at least one, each with at least one element
    SkipReport skipped;
    MendReport mended;
    DrawingUnits units;
};

/// Reads a part drawing (DXF in text form) and builds its contours.
/// Throws InputError, with the file's name and the cause, for a file that is missing, unreadable,
/// empty, truncated or no DXF file, for a drawing without contours, and when the locale of the
/// process does not read numbers as drawings have them.
Part readPart(const std::string& fileName, const ReadOptions& options);

/// The same for the text of a drawing. The causes come without a file name.
Part partFromText(const std::string& text, const ReadOptions& options);

}  // namespace gmdrawing
