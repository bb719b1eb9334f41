// SPDX-License-Identifier: MIT
#include "CurvePicture.h"

#include "gmbridge/Curves.h"
#include "gmkernel/gmkernel.h"

namespace examples {

using gmbridge::appendElements;
using gmbridge::planePoint;

void CurvePicture::add(const GmCurve& curve, Style style) {
    Elements elements;
    if (curve.IsLine()) {
        const auto& line = static_cast<const GmLine&>(curve);
        const GmPoint along(line.SP() + GmVec(line.Dir()));
        addEndless({planePoint(line.SP()), planePoint(along)}, style);
    } else if (curve.IsCircle()) {
        const auto& circle = static_cast<const GmCircle&>(curve);
        const GmPoint sp(circle.M() + GmVec(circle.R(), 0.0, 0.0));
        appendElements(GmArc(circle, sp, sp, GmBase::eRotCCW), elements);
        add(elements, true, style);
    } else if (curve.IsContour()) {
        const auto& contour = static_cast<const GmContour&>(curve);
        for (int i = 0; i < contour.ElementCount(); ++i)
            appendElements(*contour.GetElement(i), elements);
        add(elements, contour.IsClosed(), style);
    } else if (appendElements(curve, elements)) {
        add(elements, false, style);
    }
}

void CurvePicture::mark(const GmPoint& p, Style style) {
    mark(planePoint(p), style);
}

void CurvePicture::arrow(const GmCurve& element, Style style) {
    Elements elements;
    if (appendElements(element, elements)) arrow(elements.back(), style);
}

}  // namespace examples
