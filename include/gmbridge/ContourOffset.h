// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmbridge/Refusal.h"
#include "gmbridge/SetContours.h"
#include "gmbridge/export.h"
#include "gmkernel/GmContour.h"

namespace gmbridge {

/// What an offset gives: contours, or a refusal and none.
struct ContourOffset {
    SetContours contours;
    Refusal refusal;
    /// Points where the offset hangs on some tolerances, as gmregion::Outcome says.
    std::vector<GmPoint> marginal;
};

/// The exact offset of a contour by way of regions, with corners rounded, as
/// GmContour::Offsetting() makes it within its known limits, and without these.
///
/// What a closed contour runs round is offset: the part. Where it runs round places more than once,
/// with loops of its own sense, these are inside. Where it also runs round places against its
/// sense, it has two outsides and is refused, unless no disc of the kernel's length tolerance as
/// radius has room there; then these are passed over.
///
/// Outlines run in the sense of the contour and holes against it, so that the part stays on the
/// side on which the contour has it. For identifiers, starts, and what is too short for the kernel
/// see contoursOf().
///
/// Of an open contour it is all that lies at the distance on that side and not about its ends, in
/// the contour's direction: parts of the parallel that come nearer to another part of the contour,
/// or to its ends, are left out, see gmregion::makeParallels(). A distance of 0 is refused.
///
/// Refused, too, is what ContourPaths::add() and gmregion::offset() refuse, such as a distance that
/// is not finite. Cost: near-linear.
/// @param contour it is only read
/// @param distance in length units, positive to the right of the contour's direction of travel;
///        there is no smallest one
GMBRIDGE_EXPORT ContourOffset offsetContour(const GmContour& contour, double distance);

/// The same for a part with islands: what the outline runs round, without what the islands do.
///
/// A positive distance leads to the right of the outline, and the islands follow: where the part
/// grows they shrink, and the other way. Each island counts by what it runs round in whatever
/// sense; islands may touch and overlap each other and the outline. Refusals name contours by
/// number, the outline has 0 and the islands those from 1 on.
/// @param outline it is only read
/// @param islands they are only read; one that is null is refused
/// @param distance in length units, positive to the right of the outline's direction of travel
GMBRIDGE_EXPORT ContourOffset offsetPart(const GmContour& outline,
                                         const std::vector<const GmContour*>& islands,
                                         double distance);

}  // namespace gmbridge
