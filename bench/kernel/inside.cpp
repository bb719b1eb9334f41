// SPDX-License-Identifier: MIT
// Is a point inside a contour of many elements?

#include <benchmark/benchmark.h>

#include "bench/kernel/chains.h"

namespace {

void Inside(benchmark::State& state, ChainKind kind, double radiusShare) {
    const int count = static_cast<int>(state.range(0));
    GmContour ring = MakeRing(kind, count);
    // Off the axis, so that the ray to the first element meets no joint.
    const GmPoint p(radiusShare * RingRadius(count) * 0.8, radiusShare * RingRadius(count) * 0.6);
    if (ring.In(p) != (radiusShare < 1)) {
        state.SkipWithError("the point is on the wrong side");
        return;
    }
    while (state.KeepRunning()) {
        benchmark::DoNotOptimize(ring.In(p));
    }
}

}  // namespace

BENCHMARK_CAPTURE(Inside, lines_point_inside, ChainKind::eLines, 0.5)
    ->Arg(1000)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(Inside, lines_point_outside_in_box, ChainKind::eLines, 1.1)
    ->Arg(1000)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(Inside, lines_and_arcs_point_inside, ChainKind::eLinesAndArcs, 0.5)
    ->Arg(1000)
    ->Unit(benchmark::kMicrosecond);
