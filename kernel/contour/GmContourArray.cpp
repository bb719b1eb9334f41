// SPDX-License-Identifier: MIT
#include "kernel/contour/GmContourArray.h"

#include "kernel/values/HandedOver.h"

void GmContourArray::Take(std::unique_ptr<GmContour> contour) {
    Add(contour.get());
    gmkernel_detail::handedOver(contour);
}
