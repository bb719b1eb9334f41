// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "gmkernel/GmCurve.h"

#include "part/model/Path.h"

namespace gmpart {

/// A curve of the kernel with its box.
struct BoxedCurve {
    std::unique_ptr<GmCurve> curve;
    Box box;

    /// Takes a copy of a curve.
    void take(const GmCurve& other);
};

/// True when two curves have a point in common.
bool meet(const BoxedCurve& a, const BoxedCurve& b);

}  // namespace gmpart
