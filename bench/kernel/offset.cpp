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
        if (results != 1) {
            state.SkipWithError("one result expected");
            break;
        }
    }
}

}  // namespace

// A positive distance lies to the right of the direction of travel: outside the ring.
BENCHMARK_CAPTURE(Offset, lines_outside, ChainKind::eLines, 1.0)
    ->Arg(10)
    ->Arg(100)
    ->Arg(1000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(Offset, lines_inside, ChainKind::eLines, -1.0)
    ->Arg(10)
    ->Arg(100)
    ->Arg(1000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(Offset, lines_and_arcs_outside, ChainKind::eLinesAndArcs, 1.0)
    ->Arg(10)
    ->Arg(100)
    ->Arg(1000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(Offset, lines_and_arcs_inside, ChainKind::eLinesAndArcs, -1.0)
    ->Arg(10)
    ->Arg(100)
    ->Arg(1000)
    ->Unit(benchmark::kMillisecond);
