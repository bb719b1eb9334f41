// SPDX-License-Identifier: MIT
/// @file
/// Moves onto a path and off it, both on its left: a run and a quarter of an arc that touches the
/// path, and an arc that leaves it followed by the tangent to a given point.
///
/// An approach belongs to the first element of the path, a departure to the last one.
#include <iostream>

#include "CurvePicture.h"
#include "gmkernel/gmkernel.h"

using examples::Style;

int main(int argc, char** argv) {
    GmContour path;
    path.AddElement(GmStretch(GmPoint(0, 0), GmPoint(60, 0)), true, 1);
    path.AddElement(GmArc(GmPoint(60, 0), GmPoint(80, 20), 20, true, GmBase::eRotCCW), true, 2);
    path.AddElement(GmStretch(GmPoint(80, 20), GmPoint(80, 45)), true, 3);

    GmApprDepData onto;
    onto.Point = GmPoint(-20, 40);
    onto.pCurve = path.GetElement(0);
    onto.nType = 3;  // a segment, then an arc of this radius and angle
    onto.dRadius = 14;
    onto.dAngle = 90;
    onto.nSide = -1;
    const GmContour approach(onto);

    GmApprDepData off;
    off.Point = GmPoint(25, 30);
    off.pCurve = path.GetElement(2);
    off.nEnd = 1;
    off.nType = 4;  // an arc of this radius, then the tangent to the point
    off.dRadius = 10;
    off.nSide = -1;
    const GmContour departure(off);

    // A chain takes an element only where the one before it ends.
    GmContour tool = approach;
    bool good = approach.ElementCount() == 2 && departure.ElementCount() == 2;
    for (const GmContour& part : {path, departure}) {
        for (int i = 0; i < part.ElementCount(); ++i)
            good = tool.AddElement(part.GetElement(i), false, 0) && good;
    }
    examples::CurvePicture picture;
    for (int i = 0; i < tool.ElementCount(); ++i) {
        const GmCurve& element = *tool.GetElement(i);
        const bool onPath = i >= 2 && i < 5;
        const Style style = onPath ? Style::kGiven : i < 2 ? Style::kResult : Style::kOther;
        std::cout << element.GetTraceString() << '\n';
        // Smooth all the way, but for the joint of the run and its arc.
        good = good && (i < 2 || tool.GetElement(i - 1)->TangEP() == element.TangSP());
        picture.add(element, style);
        picture.arrow(element, style);
    }
    picture.legend(Style::kGiven, "path");
    picture.legend(Style::kResult, "approach: run and quarter arc");
    picture.legend(Style::kOther, "departure: arc and tangent");
    return picture.save(argc > 1 ? argv[1] : "approach_departure.svg") && good ? 0 : 1;
}
