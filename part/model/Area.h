// SPDX-License-Identifier: MIT
#pragma once

#include "part/model/Path.h"

namespace gmpart {

/// Area enclosed by a closed path, exact for arcs: positive when it runs counter-clockwise. Regions
/// that the path runs round twice count twice. An open path is taken as closed by its chord.
double signedArea(const Path& path);

/// Sense in which a closed path runs round what it encloses.
enum class Sense {
    kNone,              ///< open, or encloses nothing beyond rounding
    kCounterClockwise,  ///< the inside lies on the left
    kClockwise          ///< the inside lies on the right
};

/// Sense by the sign of the exact area; kNone for open paths and where the area vanishes in
/// comparison with the length.
Sense sense(const Path& path);

}  // namespace gmpart
