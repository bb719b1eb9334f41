// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "region/model/Box.h"
#include "region/model/Element.h"

namespace gmpart {

using gmregion::Box;
using gmregion::Element;
using gmregion::kKernelTolerance;
using gmregion::kPi;
using gmregion::Vec2;

/// A chain of elements in which each starts exactly where the one before ends.
struct Path {
    std::vector<Element> elements;
    bool closed = false;  ///< the last element ends exactly where the first starts
    std::string layer;    ///< layer of the drawing it comes from
};

/// Number of elements that are arcs.
std::size_t arcCount(const Path& path);

/// Length along the path, 0 for a path without elements.
double length(const Path& path);

/// The longest element, the first of equal ones; the path must have an element.
const Element& longestElement(const Path& path);

/// The smallest box about a path, arcs included up to their extreme points.
Box boundingBox(const Path& path);

/// The path run the other way; closed paths keep their start point.
Path reversed(const Path& path);

/// Distance from p to the nearest point of the path; infinite for a path without elements.
double distance(const Path& path, Vec2 p);

/// Appends the arc about m from the direction angle `startAngle` over the signed sweep, both in
/// radians. Arcs that turn by more than 300 degrees come as two halves, so that the ends of every
/// element stay well apart in comparison to its radius. A sweep of 2 pi gives the full circle,
/// whose end is then exactly its start.
void appendArc(std::vector<Element>& elements, Vec2 m, double r, double startAngle, double sweep);

/// Appends an element given by its ends and its bulge, in halves when it turns by more than 300
/// degrees. Coincident ends give a segment without length, whatever the bulge.
void appendBulge(std::vector<Element>& elements, const Element& e);

/// Moves joints so that every element starts exactly where the one before ends, and the first
/// where the last ends when the path is closed. Meant for gaps within a tolerance; a gap of any
/// size is closed at its middle.
void meetEnds(Path& path);

}  // namespace gmpart
