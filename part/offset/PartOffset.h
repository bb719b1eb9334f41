// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <functional>
#include <optional>
#include <vector>

#include "gmregion/Offset.h"
#include "gmregion/Outcome.h"
#include "gmregion/Verify.h"

#include "part/model/Path.h"
#include "part/regions/PartRegions.h"

namespace gmpart {

/// On which side to offset. Open contours have no inside: but for right and left, what lies within
/// the distance of them is run round, ends included.
enum class Side {
    kWaste,     ///< outside of outlines, inside of holes: the part grows
    kMaterial,  ///< inside of outlines, outside of holes: the part shrinks
    kRight,     ///< right of the contour's direction of travel
    kLeft,      ///< left of the contour's direction of travel
    kInside,    ///< towards what the contour runs round
    kOutside,   ///< away from what the contour runs round
    kBoth       ///< the waste side and the material side
};

/// What to offset, and how far.
struct OffsetRequest {
    Side side = Side::kWaste;
    /// One distance a pass, in units of the contours, each measured from them; a negative one lies
    /// on the other side.
    std::vector<double> distances;
    gmregion::OffsetOptions options;
    /// Contours by themselves: nothing merges.
    bool each = false;
};

/// A path of an offset.
struct OffsetPath {
    std::size_t pass = 0;  ///< number of the pass
    Path path;             ///< on the layer of its main contour
    /// The contours that it comes from, rising; several where their offsets met.
    std::vector<std::size_t> contours;
    std::size_t main = 0;   ///< that of them which most of its length comes from
    bool doubtful = false;  ///< there is a fault in the offset that it belongs to
};

/// A fault that the check of an offset found.
struct OffsetFault {
    std::size_t pass = 0;
    gmregion::Fault fault;  ///< the first
    std::size_t count = 0;  ///< of all
    /// The contour whose offset it is; nothing where it is that of several.
    std::optional<std::size_t> contour = {};
};

/// An offset that was not made.
struct OffsetRefusal {
    std::size_t pass = 0;
    gmregion::Reason reason = gmregion::Reason::kNone;
    gmregion::Point at;
    std::optional<std::size_t> contour = {};
};

/// The offsets of a drawing.
struct PartOffsets {
    std::vector<OffsetPath> paths;  ///< by pass, closed ones first
    std::vector<OffsetFault> faults;
    std::vector<OffsetRefusal> refusals;
    /// For every pass the places where it hangs on some tolerances, see gmregion::Outcome.
    std::vector<std::vector<gmregion::Point>> marginal;
};

/// Called with the number of steps done and their total.
using ProgressCall = std::function<void(std::size_t done, std::size_t total)>;

/// Offsets the contours of a drawing as a part with holes: what meets, merges. For the sides that
/// are told by contours (right, left, inside, outside), those of one depth are offset together.
///
/// Contours become regions by their nesting (PartRegions); closed ones that enclose nothing are
/// taken as open ones. Open contours are offset among themselves. Every offset of regions is
/// checked (gmregion::verifyOffset()). Cost: near-linear in the elements, for every pass.
PartOffsets offsetPart(const std::vector<Path>& contours, const OffsetRequest& request,
                       const ProgressCall& progress);
/// The same with the regions of the contours.
PartOffsets offsetPart(const std::vector<Path>& contours, const PartRegions& regions,
                       const OffsetRequest& request, const ProgressCall& progress);

}  // namespace gmpart
