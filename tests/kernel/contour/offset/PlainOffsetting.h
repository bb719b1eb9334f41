// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <vector>

#include "gmkernel/GmContour.h"

/// Offsetting with nothing left out to save time: every pair of pieces is intersected, and every
/// piece is measured against the whole span each time. Slow, and the measure for the library, whose
/// results have the same digits. Bands and the contours over chains come from the library.
std::vector<std::unique_ptr<GmContour>> PlainOffsetting(GmContour& source, double d, int nSpan,
                                                        bool bKeepOpen);
