// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "drawing/ReadReport.h"
#include "part/model/Path.h"

namespace gmdrawing {

/// An open contour that a part of is missing, as far as can be told.
struct BrokenContour {
    std::size_t contour;
    gmregion::Vec2 at;    ///< an end of it
    std::string reason;   ///< "ends where a SPLINE on layer A was skipped" and the like
    gmregion::Box about;  ///< it and what it lacks, empty where that is not known
};

/// Finds open contours that are likely to be pieces of outlines or holes: those that end where
/// something was skipped that may belong to them, or where it is not known where that lies; and
/// those that would run round closed ones if their ends, which lie nearer to each other than half
/// their length, were joined.
/// @param contours of a drawing
/// @param skipped what of the drawing was skipped
/// @param tolerance what lies this near counts as there, in length units
std::vector<BrokenContour> brokenContours(const std::vector<gmpart::Path>& contours,
                                          const std::vector<SkippedPlace>& skipped,
                                          double tolerance);

/// The contours of which the sides are not known while some are broken: these, and all that lie in
/// the boxes about them and about broken ones that these boxes overlap. Rising.
std::vector<std::size_t> doubtfulContours(const std::vector<gmpart::Path>& contours,
                                          const std::vector<BrokenContour>& broken);

}  // namespace gmdrawing
