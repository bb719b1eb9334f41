#include "kernel/curves/kernels/SlopeForm.h"

namespace gmkernel_detail {

bool parallelToYAxis(GmDir const& dir) {
    return GmParallelDir(dir, GmDir(0.0, 1.0, 0.0));
}

SlopeForm slopeForm(GmPoint const& sp, GmDir const& dir) {
    if (parallelToYAxis(dir)) return {true, 0.0, sp.X()};
    const double k = dir.k();
    return {false, k, sp.Y() - k * sp.X()};
}

}  // namespace gmkernel_detail
