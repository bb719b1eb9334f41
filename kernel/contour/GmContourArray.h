// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "gmkernel/GmContour.h"
#include "kernel/values/PointerList.h"

/// The sub-contour list: pointers to contours in the order of their indices. The list forgets and
/// never deletes; the contour that holds it owns the entries.
class GmContourArray : public gmkernel_detail::PointerList<GmContour> {
public:
    /// Appends a contour whose owner is from now on that of the list.
    void Take(std::unique_ptr<GmContour> contour);
};
