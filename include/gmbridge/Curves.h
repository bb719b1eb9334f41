// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <vector>

#include "gmbridge/export.h"
#include "gmkernel/GmCurve.h"
#include "gmkernel/GmPoint.h"
#include "gmregion/Element.h"

namespace gmbridge {

/// A point of the kernel in the plane: its third coordinate is left out.
GMBRIDGE_EXPORT gmregion::Point planePoint(const GmPoint& p);
/// A point of the plane in the kernel, at height 0.
GMBRIDGE_EXPORT GmPoint kernelPoint(gmregion::Point p);

/// Appends what a segment or an arc of the kernel is among the elements: one, with exactly its
/// ends, or two halves for an arc of more than 300 degrees, a full circle among them.
///
/// An arc keeps its ends and its sweep about its centre; where its ends lie off its circle, which
/// the kernel allows, its radius follows them.
/// @param curve what is to be converted
/// @param elements gets the elements
/// @return false, with nothing appended, for other kinds of curves, undefined ones, arcs without a
///         sense, and numbers that are not finite
GMBRIDGE_EXPORT bool appendElements(const GmCurve& curve, std::vector<gmregion::Element>& elements);

/// An element as a segment or an arc of the kernel, with exactly its ends.
///
/// An arc that leaves its chord by less than coordinates of its centre are rounded becomes a
/// segment. One whose ends the kernel counts as the same point is the caller's to avoid: it is
/// either no curve or a full circle there.
GMBRIDGE_EXPORT std::unique_ptr<GmCurve> curveOf(const gmregion::Element& e);

}  // namespace gmbridge
