// SPDX-License-Identifier: MIT
/// @file
/// Passes in a pocket: the outline is offset inwards and the islands outwards, until paths cross.
/// All run counter-clockwise, so a positive distance, to the right, leads outwards.
#include <iostream>
#include <string>
#include <vector>

#include "CurvePicture.h"
#include "gmkernel/gmkernel.h"

using examples::Style;

namespace {

GmContour polygon(const std::vector<GmPoint>& corners) {
    GmContour c;
    for (std::size_t i = 0; i < corners.size(); ++i)
        c.AddElement(GmStretch(corners[i], corners[(i + 1) % corners.size()]), true, 0);
    return c;
}

/// The paths of one pass; the first contour is the outline.
std::vector<GmContour> offsets(std::vector<GmContour> contours, double d) {
    std::vector<GmContour> paths;
    for (GmContour& c : contours) {
        c.ParallelContours(&c == &contours[0] ? -d : d, false, false, false);
        for (int i = 0; const GmContour* path = c.GetSubContour(i); ++i)
            paths.push_back(*path);
    }
    return paths;
}

}  // namespace

int main(int argc, char** argv) {
    const std::vector<GmContour> contours = {
        polygon({{0, 0}, {120, 0}, {120, 66}, {70, 66}, {60, 50}, {50, 66}, {0, 66}}),
        polygon({{20, 30}, {36, 14}, {52, 30}, {36, 46}}),
        polygon({{78, 20}, {100, 20}, {100, 42}, {78, 42}})};
    examples::CurvePicture picture;
    for (const GmContour& c : contours)
        picture.add(c, Style::kGiven);
    std::vector<int> crossings;
    for (const Style style : {Style::kResult, Style::kOther, Style::kHelp}) {
        crossings.push_back(0);
        const auto d = 3 * crossings.size();  // 3, 6, 9
        const std::vector<GmContour> paths = offsets(contours, static_cast<double>(d));
        for (const GmContour& path : paths) {
            for (const GmContour* other = paths.data(); other != &path; ++other)
                crossings.back() += path.Intersection(other, true);
            picture.add(path, style);
        }
        std::cout << "distance " << d << ": " << crossings.back() << " crossings\n";
        const char* const note = crossings.back() > 0 ? ": paths cross" : "";
        picture.legend(style, "distance " + std::to_string(d) + note);
    }
    const bool good = crossings == std::vector<int>{0, 0, 2};
    return picture.save(argc > 1 ? argv[1] : "offset_with_islands.svg") && good ? 0 : 1;
}
