// SPDX-License-Identifier: MIT
/// @file
/// Intersects curves: a contour with a circle, and a line with that circle.
///
/// A curve reports the points in its solution list; the free function Intersection() hands them
/// out without touching either curve.
#include <iostream>
#include <vector>

#include "CurvePicture.h"
#include "gmkernel/gmkernel.h"

using examples::Style;

namespace {

/// A link 80 long and 30 high with round ends, counter-clockwise.
GmContour link() {
    GmContour c;
    c.AddElement(GmStretch(GmPoint(15, 0), GmPoint(65, 0)), true, 1);
    c.AddElement(GmArc(GmPoint(65, 0), GmPoint(65, 30), GmPoint(65, 15), GmBase::eRotCCW), true, 2);
    c.AddElement(GmStretch(GmPoint(65, 30), GmPoint(15, 30)), true, 3);
    c.AddElement(GmArc(GmPoint(15, 30), GmPoint(15, 0), GmPoint(15, 15), GmBase::eRotCCW), true, 4);
    return c;
}

}  // namespace

int main(int argc, char** argv) {
    const GmContour contour = link();
    const GmCircle circle(GmPoint(70, 30), 18, true);
    const GmLine line(GmPoint(30, 0), GmPoint(90, 40));

    contour.IntersectionWithCurve(&circle);
    const std::vector<GmPoint>& onContour = contour.GetPtSol();  // until the next intersection
    std::vector<GmPoint> onLine;
    Intersection(line, circle, onLine);

    examples::CurvePicture picture;
    picture.add(contour, Style::kGiven);
    picture.add(circle, Style::kGiven);
    picture.add(line, Style::kHelp);
    picture.legend(Style::kGiven, "contour and circle, crossings orange");
    picture.legend(Style::kHelp, "line, crossings with the circle blue");
    bool good = onContour.size() == 2 && onLine.size() == 2;
    for (const GmPoint& p : onContour) {
        std::cout << "contour and circle: " << p.X() << ", " << p.Y() << '\n';
        good = good && contour.Element(p) && circle.Element(p);
        picture.mark(p, Style::kResult);
    }
    for (const GmPoint& p : onLine) {
        std::cout << "line and circle:    " << p.X() << ", " << p.Y() << '\n';
        good = good && line.Element(p) && circle.Element(p);
        picture.mark(p, Style::kOther);
    }
    return picture.save(argc > 1 ? argv[1] : "intersect_curves.svg") && good ? 0 : 1;
}
