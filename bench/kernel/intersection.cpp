// SPDX-License-Identifier: MIT
// One intersection of each ordered pair of kinds.

#include <benchmark/benchmark.h>

#include <memory>
#include <string>
#include <vector>

#include "bench/kernel/chains.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmBeam.h"
#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmStretch.h"

namespace {

struct Kind {
    const char* name;
    std::unique_ptr<GmCurve> first;   // these all pass near the origin ...
    std::unique_ptr<GmCurve> second;  // ... and each of these crosses every one of them
};

// The first curves run through (6, 0) roughly upwards, the second ones through it roughly to the
// right, so that each pair has at least one point.
std::vector<Kind> MakeKinds() {
    const GmPoint below(5, -20), above(7, 20), left(-20, -1), right(40, 1);
    GmContour upwards, rightwards;
    upwards.AddElement(GmStretch(below, GmPoint(6, -10)), false, 0);
    upwards.AddElement(GmStretch(GmPoint(6, -10), GmPoint(6, 10)), false, 0);
    upwards.AddElement(GmStretch(GmPoint(6, 10), above), false, 0);
    rightwards.AddElement(GmStretch(left, GmPoint(0, 0.5)), false, 0);
    rightwards.AddElement(GmStretch(GmPoint(0, 0.5), GmPoint(10, -0.5)), false, 0);
    rightwards.AddElement(GmStretch(GmPoint(10, -0.5), right), false, 0);
    const GmCircle firstCircle(GmPoint(0, 0), 6, true), secondCircle(GmPoint(6, 6), 6, true);

    std::vector<Kind> kinds;
    kinds.push_back(
        {"line", std::make_unique<GmLine>(below, above), std::make_unique<GmLine>(left, right)});
    kinds.push_back(
        {"beam", std::make_unique<GmBeam>(below, above), std::make_unique<GmBeam>(left, right)});
    kinds.push_back({"stretch", std::make_unique<GmStretch>(below, above),
                     std::make_unique<GmStretch>(left, right)});
    kinds.push_back({"circle", std::make_unique<GmCircle>(firstCircle),
                     std::make_unique<GmCircle>(secondCircle)});
    kinds.push_back(
        {"arc",
         std::make_unique<GmArc>(GmPoint(0, -6), GmPoint(0, 6), GmPoint(0, 0), GmBase::eRotCCW),
         std::make_unique<GmArc>(GmPoint(0, 6), GmPoint(12, 6), GmPoint(6, 6), GmBase::eRotCCW)});
    kinds.push_back(
        {"contour", std::make_unique<GmContour>(upwards), std::make_unique<GmContour>(rightwards)});
    return kinds;
}

void Intersect(benchmark::State& state, GmCurve const& first, GmCurve const& second) {
    if (first.Intersection(&second) < 1) {
        state.SkipWithError("the curves do not meet");
        return;
    }
    while (state.KeepRunning()) {
        benchmark::DoNotOptimize(first.Intersection(&second));
    }
}

// The curves live as long as the program: the benchmarks run after this registration.
bool RegisterPairs() {
    static const std::vector<Kind> kinds = MakeKinds();
    for (Kind const& a : kinds) {
        for (Kind const& b : kinds) {
            const std::string name = std::string("Intersection/") + a.name + "/" + b.name;
            GmCurve const& first = *a.first;
            GmCurve const& second = *b.second;
            benchmark::RegisterBenchmark(name.c_str(), [&first, &second](benchmark::State& state) {
                Intersect(state, first, second);
            });
        }
    }
    return true;
}

const bool registered = RegisterPairs();

}  // namespace
