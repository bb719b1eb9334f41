// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <vector>

#include "gmkernel/GmContour.h"

namespace gmkernel_detail {

/// A contour that a walk puts together piece by piece.
class LoopContour : public GmContour {
public:
    using GmContour::AddRealElem;
    using GmContour::CheckContour;
    using GmContour::InsertElem;
};

/// What the walks over all crossings gave.
struct Loops {
    std::vector<std::unique_ptr<GmContour>> contours;
    bool cameBack = true;  ///< false when a walk was given up; the loops before it stay
};

}  // namespace gmkernel_detail
