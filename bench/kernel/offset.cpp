// SPDX-License-Identifier: MIT
// Offsets of closed contours to both sides.

#include <benchmark/benchmark.h>

#include "bench/kernel/chains.h"

namespace {

const int kWholeContour = 1000000;  // span of elements that covers every chain here

void Offset(benchmark::State& state, ChainKind kind, double distance) {
    GmContour ring = MakeRing(kind, static_cast<int>(state.range(0)));
    if (!ring.IsClosed() || ring.ElementCount() != state.range(0)) {
        state.SkipWithError("the chain is not the wanted one");
        return;
    }
    while (state.KeepRunning()) {
        const int results = ring.Offsetting(distance, kWholeContour, false);
        if (results < 1) {
            state.SkipWithError("a result expected");
            break;
        }
    }
}

}  // namespace

// A positive distance lies to the right of the direction of travel: outside the ring. Sizes grow by
// ten each time, so that the times show how the cost grows.
BENCHMARK_CAPTURE(Offset, lines_outside, ChainKind::eLines, 1.0)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(Offset, lines_inside, ChainKind::eLines, -1.0)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(Offset, lines_and_arcs_outside, ChainKind::eLinesAndArcs, 1.0)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Unit(benchmark::kMillisecond);
// The ring of 100,000 is so large that rounding opens this offset.
BENCHMARK_CAPTURE(Offset, lines_and_arcs_inside, ChainKind::eLinesAndArcs, -1.0)
    ->RangeMultiplier(10)
    ->Range(10, 10000)
    ->Unit(benchmark::kMillisecond);
