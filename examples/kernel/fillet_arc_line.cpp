// SPDX-License-Identifier: MIT
/// @file
/// Puts a fillet between an arc and the segment that follows it.
///
/// The constructor of the circle finds the fillet; both elements are then cut back to the points in
/// which it touches them.
#include <iostream>

#include "CurvePicture.h"
#include "gmkernel/gmkernel.h"

using examples::Style;

int main(int argc, char** argv) {
    const double radius = 12;
    GmArc arc(GmPoint(-30, 0), GmPoint(30, 0), GmPoint(0, 0), GmBase::eRotCW);
    GmStretch segment(GmPoint(30, 0), GmPoint(75, 10));
    examples::CurvePicture picture;
    picture.add(arc, Style::kHelp);
    picture.add(segment, Style::kHelp);

    const bool arcFirst = true;
    GmCircle circle(arc, segment, radius, arcFirst, false);
    const GmPoint onArc = circle.GetTangPoint(arc);
    const GmPoint onSegment = circle.GetTangPoint(segment);
    const GmArc fillet(circle, onArc, onSegment, true);
    arc.SetEP(onArc);
    segment.SetSP(onSegment);

    GmContour chain;
    const bool joined = chain.AddElement(arc, true, 1) && chain.AddElement(fillet, true, 2) &&
                        chain.AddElement(segment, true, 3);
    const bool smooth = arc.TangEP() == fillet.TangSP() && fillet.TangEP() == segment.TangSP();

    std::cout << "centre of the fillet: " << circle.M().X() << ", " << circle.M().Y() << '\n'
              << "it leaves the arc at: " << onArc.X() << ", " << onArc.Y() << '\n'
              << "and joins the line:   " << onSegment.X() << ", " << onSegment.Y() << '\n'
              << "length of the fillet: " << fillet.Length() << '\n';

    picture.add(circle, Style::kHelp);
    picture.add(arc, Style::kGiven);
    picture.add(segment, Style::kGiven);
    picture.add(fillet, Style::kResult);
    picture.mark(onArc, Style::kResult);
    picture.mark(onSegment, Style::kResult);
    picture.legend(Style::kHelp, "corner and the circle that touches both");
    picture.legend(Style::kGiven, "arc and segment, cut back");
    picture.legend(Style::kResult, "fillet of radius 12");
    const bool saved = picture.save(argc > 1 ? argv[1] : "fillet_arc_line.svg");
    return saved && joined && smooth ? 0 : 1;
}
