// SPDX-License-Identifier: MIT
/// @file
/// Pictures that show curves of the kernel.
#pragma once

#include "SvgPicture.h"
#include "gmkernel/GmCurve.h"
#include "gmkernel/GmPoint.h"

namespace examples {

/// A picture that takes curves and points of the kernel, too.
class CurvePicture : public SvgPicture {
public:
    using SvgPicture::add;
    using SvgPicture::arrow;
    using SvgPicture::mark;

    /// A segment, arc, circle, line or contour; other curves are not drawn.
    void add(const GmCurve& curve, Style style);
    /// A dot.
    void mark(const GmPoint& p, Style style);
    /// An arrow head in the end of a segment or arc, along its direction of travel.
    void arrow(const GmCurve& element, Style style);
};

}  // namespace examples
