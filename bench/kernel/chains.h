// SPDX-License-Identifier: MIT
/// @file
/// Closed contours of any size for the benchmarks.
#pragma once

#include "gmkernel/GmContour.h"

/// What the elements of a chain are.
enum class ChainKind {
    eLines,         ///< segments only
    eLinesAndArcs,  ///< segments and arcs in turn
};

/// A closed counter-clockwise ring of `count` elements (an even number, at least 4), each about 10
/// long, so that chains of different sizes look alike from near by: a saw of segments, or a row of
/// half-open bulges with segments between them. The centre is the origin.
GmContour MakeRing(ChainKind kind, int count);

/// The mean radius of the ring that MakeRing() answers.
double RingRadius(int count);
