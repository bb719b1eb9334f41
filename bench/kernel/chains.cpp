// SPDX-License-Identifier: MIT
#include "bench/kernel/chains.h"

#include <cmath>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace {

const double kPi = std::acos(-1.0);
const double kPitch = 10.0;       // distance of neighbouring joints along the ring
const double kToothDepth = 3.0;   // joints lie in turn half of it inside and outside the ring
const double kBulgeRadius = 8.0;  // of the arcs; more than half the pitch, so they are short

GmPoint Joint(int i, int count) {
    const double angle = 2 * kPi * i / count;
    const double r = RingRadius(count) + (i % 2 == 0 ? -0.5 : 0.5) * kToothDepth;
    return {r * std::cos(angle), r * std::sin(angle)};
}

}  // namespace

double RingRadius(int count) {
    return kPitch * count / (2 * kPi);
}

GmContour MakeRing(ChainKind kind, int count) {
    GmContour ring;
    for (int i = 0; i < count; ++i) {
        const GmPoint sp = Joint(i, count);
        const GmPoint ep = Joint((i + 1) % count, count);
        if (kind == ChainKind::eLinesAndArcs && i % 2 == 1) {
            ring.AddElement(GmArc(sp, ep, kBulgeRadius, true, GmBase::eRotCCW), false, i);
        } else {
            ring.AddElement(GmStretch(sp, ep), false, i);
        }
    }
    return ring;
}
