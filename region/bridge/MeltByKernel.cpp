// SPDX-License-Identifier: MIT
#include "region/bridge/MeltByKernel.h"

#include "gmkernel/GmContour.h"
#include "region/bridge/PathConversion.h"

namespace gmregion {

KernelLoops meltByKernel(const Path& a, const Path& b) {
    KernelLoops melted;
    GmContour first;
    GmContour second;
    melted.refusal = fillContour(first, simplifiedForKernel(a));
    if (melted.refusal == Refusal::kNone) {
        melted.refusal = fillContour(second, simplifiedForKernel(b));
    }
    if (melted.refusal != Refusal::kNone) return melted;
    melted.meet = first.SplitContours(&second) > 0;
    for (int i = 0; const GmContour* loop = first.GetSubContour(i); ++i)
        melted.loops.push_back(pathFromKernel(*loop, a.layer).path);
    return melted;
}

}  // namespace gmregion
