// SPDX-License-Identifier: MIT
/// @file
/// Rounds the corners of a contour: outer ones and inner ones with radii of their own.
///
/// Corners that turn with the contour are the outer ones, those that turn against it the inner
/// ones. A rounding that is there already is no corner any more.
#include <iostream>
#include <vector>

#include "CurvePicture.h"
#include "gmkernel/gmkernel.h"

using examples::Style;

namespace {

/// A bracket with six outer and two inner corners, counter-clockwise.
GmContour bracket() {
    const std::vector<GmPoint> corners = {{0, 0},   {90, 0},  {90, 60}, {65, 60},
                                          {65, 22}, {25, 22}, {25, 45}, {0, 45}};
    GmContour c;
    for (std::size_t i = 1; i < corners.size(); ++i)
        c.AddElement(GmStretch(corners[i - 1], corners[i]), true, static_cast<long>(i));
    c.Close(true);
    return c;
}

}  // namespace

int main(int argc, char** argv) {
    GmContour contour = bracket();
    examples::CurvePicture picture;
    picture.add(contour, Style::kHelp);

    contour.RoundCorners(5, -1);  // outer corners
    contour.RoundCorners(9, 1);   // inner corners
    picture.add(contour, Style::kGiven);

    int outer = 0;
    int inner = 0;
    bool smooth = contour.IsClosed();
    const int count = static_cast<int>(contour.ElementCount());
    for (int i = 0; i < count; ++i) {
        const GmCurve* const element = contour.GetElement(i);
        const GmCurve* const next = contour.GetElement((i + 1) % count);
        smooth = smooth && element->TangEP() == next->TangSP();
        if (!element->IsArc()) continue;
        const bool turnsWith = static_cast<const GmArc*>(element)->Dir() == GmBase::eRotCCW;
        ++(turnsWith ? outer : inner);
        picture.add(*element, turnsWith ? Style::kResult : Style::kOther);
        std::cout << element->GetTraceString() << '\n';
    }
    std::cout << outer << " outer and " << inner << " inner corners rounded\n";
    picture.legend(Style::kResult, "outer corners, radius 5");
    picture.legend(Style::kOther, "inner corners, radius 9");
    const bool saved = picture.save(argc > 1 ? argv[1] : "round_corners.svg");
    return saved && smooth && outer == 6 && inner == 2 ? 0 : 1;
}
