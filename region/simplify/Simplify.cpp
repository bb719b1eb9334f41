// SPDX-License-Identifier: MIT
/// @file
/// First what lies on one line or circle up to rounding becomes one, then what does within the
/// tolerance. The first pass keeps a segment or arc that was drawn in pieces as it was drawn, where
/// the second alone would blend it with its neighbours.
#include "gmregion/Simplify.h"

#include <algorithm>

#include "region/simplify/Chain.h"
#include "region/simplify/Joints.h"
#include "region/simplify/LongestFit.h"
#include "region/simplify/Source.h"
#include "region/simplify/Writer.h"

namespace gmregion {

namespace {

/// The directions of a curve are right up to rounding: arcs are off them by no more than some of
/// that, as the tangent of half the angle.
constexpr double kCurveBend = 1.0 / 1073741824.0;  // 2^-30

bool refuse(Simplified& result, const Refusal& refusal) {
    result.paths.clear();
    result.sources.clear();
    result.refusal = refusal;
    return false;
}

/// What one path after the other is made in.
struct Memory {
    Chain chain;
    std::vector<Piece> pieces;
    std::vector<Element> elements;
};

/// The limits for what is the same up to rounding.
Limits exactly(const Limits& limits) {
    Limits exact = limits;
    exact.tolerance = limits.rounding;
    exact.slackCounts = false;
    return exact;
}

/// Corners are those of the full tolerance in both passes.
void simplifyChain(Memory& memory, const Limits& limits) {
    Chain& chain = memory.chain;
    if (chain.pieces.empty()) {
        memory.pieces.clear();
        return;
    }
    setJoints(chain, limits);
    makeFew(chain, exactly(limits), memory.pieces);
    if (!(limits.tolerance > limits.rounding)) return;
    chain.pieces.swap(memory.pieces);
    setJoints(chain, limits);
    makeFew(chain, limits, memory.pieces);
}

}  // namespace

bool simplify(const Paths& paths, const SimplifyOptions& options, Simplified& result) {
    refuse(result, {});
    double largest = 0.0;
    Limits limits;
    Refusal refusal = measure(paths, largest);
    if (!refusal) refusal = limitsFor(options, largest, limits);
    if (refusal) return refuse(result, refusal);
    Memory memory;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        const PathView path = paths[i];
        refusal = takePath(path, i, limits, memory.chain);
        if (refusal) return refuse(result, refusal);
        simplifyChain(memory, limits);
        writePath(memory.pieces, path.closed, path.id, limits, memory.elements, result);
    }
    return true;
}

bool simplifyCurve(const TangentPoint* points, std::size_t count, bool closed,
                   const SimplifyOptions& options, Simplified& result) {
    refuse(result, {});
    if (count < 2) return refuse(result, {Reason::kOutOfRange, {}, 0});
    double largest = 0.0;
    Limits limits;
    Refusal refusal = measure(points, count, largest);
    if (!refusal) refusal = limitsFor(options, largest, limits);
    limits.bend = std::min(limits.bend, kCurveBend);
    Memory memory;
    if (!refusal) refusal = takeCurve(points, count, closed, limits, memory.chain);
    if (refusal) return refuse(result, refusal);
    simplifyChain(memory, limits);
    writePath(memory.pieces, closed, 0, limits, memory.elements, result);
    return true;
}

}  // namespace gmregion
