// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <memory>
#include <vector>

#include "gmbridge/ContourPaths.h"
#include "gmbridge/export.h"
#include "gmkernel/GmContour.h"
#include "gmregion/Parallels.h"
#include "gmregion/RegionSet.h"

namespace gmbridge {

/// A loop of a set as a contour of the kernel. Behind a pointer, since copies of contours lose
/// their identifiers.
struct LoopContour {
    std::unique_ptr<GmContour> contour;
    std::size_t region = 0;  ///< number of the region that it bounds
    bool hole = false;
};

/// A set as contours of the kernel.
struct SetContours {
    /// Region by region, each outline first, then its holes.
    std::vector<LoopContour> loops;
    /// Where elements were left out whose ends the kernel cannot tell apart; their neighbours meet
    /// there.
    std::vector<GmPoint> closedUp;
    /// A point of each loop that is left out, since it holds nothing longer than that.
    std::vector<GmPoint> lost;
};

/// The loops of a set as contours of the kernel.
///
/// Elements carry the identifier of the contour's element that they come from, see
/// ContourPaths::sourceOf(), 0 where there is none, and contours begin with the lowest one, as
/// offsets of the kernel do. What joins parallels at a corner is marked as inserted; indices are
/// positions. Pieces of one arc that follow each other are one arc again where the kernel can tell
/// its ends apart, and a full circle that was one element is one again: a contour of that element
/// alone, for which IsClosed() is false as for every contour of one element. All others are
/// closed.
///
/// Elements with ends nearer than twice the kernel's length tolerance are left out; the elements
/// beside them move their ends by less than that, and keep their bulges. Arcs as flat as rounding
/// become segments, see curveOf(). Cost: the number of elements.
/// @param set what is to be converted
/// @param sources the contours from which the set comes
/// @param outlines the sense in which outlines run, eRotCW for clockwise; holes run against it
GMBRIDGE_EXPORT SetContours contoursOf(const gmregion::RegionSet& set, const ContourPaths& sources,
                                       GmBase::eRotDir outlines = GmBase::eRotCCW);

/// Curves beside contours as contours of the kernel: the same, but that those which are open keep
/// both their ends, and each is a region of its own.
GMBRIDGE_EXPORT SetContours contoursOf(const gmregion::Parallels& parallels,
                                       const ContourPaths& sources);

}  // namespace gmbridge
