// SPDX-License-Identifier: MIT
/// @file
/// Melts two overlapping contours: their boundaries make the outline of both and of what they have
/// in common.
#include <cmath>
#include <iostream>

#include "CurvePicture.h"
#include "gmkernel/gmkernel.h"

using examples::Style;

namespace {

double length(const GmContour& c) {
    double sum = 0;
    for (int i = 0; i < c.ElementCount(); ++i)
        sum += c.GetElement(i)->Length();
    return sum;
}

}  // namespace

int main(int argc, char** argv) {
    GmContour bar;  // counter-clockwise, as the disc
    bar.AddElement(GmStretch(GmPoint(0, 8), GmPoint(70, 8)), true, 1);
    bar.AddElement(GmStretch(GmPoint(70, 8), GmPoint(70, 32)), true, 2);
    bar.AddElement(GmStretch(GmPoint(70, 32), GmPoint(0, 32)), true, 3);
    bar.Close(true);

    const GmPoint m(76, 20);
    GmContour disc;
    disc.AddElement(GmArc(GmPoint(98, 20), GmPoint(54, 20), m, GmBase::eRotCCW), true, 1);
    disc.AddElement(GmArc(GmPoint(54, 20), GmPoint(98, 20), m, GmBase::eRotCCW), true, 2);

    const int count = bar.MeltContours(&disc, true);
    const GmContour* const outline = bar.GetMaxSubContour();

    examples::CurvePicture picture;
    double sum = 0;
    for (int i = 0; i < count; ++i) {
        const GmContour& loop = *bar.GetSubContour(i);
        const bool outer = &loop == outline;
        std::cout << (outer ? "outline: " : "common part: ") << loop.ElementCount()
                  << " elements, length " << length(loop) << '\n';
        sum += length(loop);
        picture.add(loop, outer ? Style::kResult : Style::kOther);
    }
    picture.legend(Style::kResult, "outline of bar and disc");
    picture.legend(Style::kOther, "their common part");

    // Every piece of the two boundaries belongs to exactly one of the loops.
    const bool complete = std::abs(sum - length(bar) - length(disc)) < GmBase::m_scdPrec;
    const bool saved = picture.save(argc > 1 ? argv[1] : "melt_contours.svg");
    return saved && count == 2 && complete ? 0 : 1;
}
