// SPDX-License-Identifier: MIT
#pragma once

namespace gmdrawing {

/// What a drawing says about its units of length.
struct DrawingUnits {
    int code = 0;           ///< 0: nothing said, 1: inches, 4: millimetres, others as by name
    bool imperial = false;  ///< drawn by the customs of inches
};

}  // namespace gmdrawing
