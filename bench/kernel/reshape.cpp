// SPDX-License-Identifier: MIT
// Melting two contours of many elements, and rounding all corners of one.

#include <benchmark/benchmark.h>

#include "bench/kernel/chains.h"
#include "gmkernel/GmVec.h"

namespace {

void Melt(benchmark::State& state, ChainKind kind) {
    const int count = static_cast<int>(state.range(0));
    GmContour ring = MakeRing(kind, count);
    GmContour other(ring);
    other.Translation(GmVec(0.71 * RingRadius(count), 0.37 * RingRadius(count), 0));
    if (ring.MeltContours(&other, true) < 2) {
        state.SkipWithError("no outline and common part");
        return;
    }
    while (state.KeepRunning()) {
        benchmark::DoNotOptimize(ring.MeltContours(&other, true));
    }
}

void RoundAllCorners(benchmark::State& state, ChainKind kind) {
    const int count = static_cast<int>(state.range(0));
    const GmContour ring = MakeRing(kind, count);
    GmContour probe(ring);
    probe.RoundCorners(0.5, 0);
    if (probe.ElementCount() != 2 * count) {
        state.SkipWithError("corners stayed sharp");
        return;
    }
    while (state.KeepRunning()) {
        GmContour rounded(ring);
        rounded.RoundCorners(0.5, 0);
        benchmark::DoNotOptimize(rounded.ElementCount());
    }
}

}  // namespace

BENCHMARK_CAPTURE(Melt, lines, ChainKind::eLines)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(Melt, lines_and_arcs, ChainKind::eLinesAndArcs)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(RoundAllCorners, lines, ChainKind::eLines)
    ->Arg(100)
    ->Arg(1000)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(RoundAllCorners, lines_and_arcs, ChainKind::eLinesAndArcs)
    ->Arg(100)
    ->Arg(1000)
    ->Unit(benchmark::kMicrosecond);
