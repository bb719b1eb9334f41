// SPDX-License-Identifier: MIT
/// @file
/// How an element lies to a line or circle over its whole length, by a few of its points.
#pragma once

#include "region/locate/BoundaryIndex.h"

namespace gmregion {

/// An element that turns by half a turn at the most, with what probes of it need.
struct Probe {
    explicit Probe(const BoundaryPiece& piece);
    /// A part of a carrier that turns by half a turn at the most.
    Probe(const Element& e, const Carrier& c);

    Vec2 sp, ep, mid;
    Vec2 startNormal, endNormal;  ///< of length 1, to the left
};

/// Bounds of a carrier's form over a probe: the least and the greatest value, or beyond them.
struct FormRange {
    double low;
    double high;
};
FormRange formOver(const Carrier& c, const Probe& p);

/// Bounds of the product of a vector with the way from a point, over a probe.
FormRange heightOver(Vec2 from, Vec2 direction, const Probe& p);

}  // namespace gmregion
