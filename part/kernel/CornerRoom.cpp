// SPDX-License-Identifier: MIT
/// @file
/// Room for cutting a corner off.
///
/// The new element must meet nothing but its neighbours; then only what lies wholly between it and
/// the corner can still be cut off, and of a contour that lies there any one point tells. So the
/// elements are intersected and one point of every other contour is looked up. Boxes spare most
/// intersections. It does not find room by making the transition smaller.

#include "part/kernel/CornerRoom.h"

#include <algorithm>

#include "gmbridge/Curves.h"
#include "gmkernel/GmRect.h"
#include "part/kernel/PathConversion.h"
#include "part/model/Winding.h"

namespace gmpart {

namespace {

Box boxOf(const GmCurve& curve) {
    const GmRect rect = curve.BoundingRect();
    return {{rect.Left(), rect.Bottom()}, {rect.Right(), rect.Top()}};
}

bool meets(const GmCurve& element, const Box& box, const GmCurve& other, const Box& otherBox) {
    return box.grown(kKernelTolerance).overlaps(otherBox) && element.Intersection(&other) > 0;
}

bool meetsOwnContour(const GmContour& contour, int index) {
    const int count = static_cast<int>(contour.ElementCount());
    const GmCurve& element = *contour.GetElement(index);
    const Box box = boxOf(element);
    for (int i = 0; i < count; ++i) {
        const int apart = std::min((i - index + count) % count, (index - i + count) % count);
        const GmCurve& other = *contour.GetElement(i);
        if (apart > 1 && meets(element, box, other, boxOf(other))) return true;
    }
    return false;
}

}  // namespace

CornerRoom::CornerRoom(const std::vector<Path>& contours, std::size_t own) {
    for (std::size_t i = 0; i < contours.size(); ++i) {
        if (i == own || contours[i].elements.empty()) continue;
        m_starts.push_back(contours[i].elements.front().sp);
        for (const Element& e : contours[i].elements)
            m_obstacles.push_back({boundingBox(e), gmbridge::curveOf(e)});
    }
}

bool CornerRoom::allows(const GmContour& contour, int index, Vec2 corner) const {
    const GmCurve& element = *contour.GetElement(index);
    return !meetsOwnContour(contour, index) && !meetsObstacle(element) && !cutsOff(element, corner);
}

bool CornerRoom::meetsObstacle(const GmCurve& element) const {
    const Box box = boxOf(element);
    return std::any_of(m_obstacles.begin(), m_obstacles.end(), [&](const Obstacle& obstacle) {
        return obstacle.curve->CreationOK() && meets(element, box, *obstacle.curve, obstacle.box);
    });
}

/// What is cut off counts as bounded by chords beside the corner.
bool CornerRoom::cutsOff(const GmCurve& element, Vec2 corner) const {
    GmContour alone;
    alone.AddElement(element, false, 0);
    Path region = reversed(pathFromKernel(alone, {}).path);
    const Vec2 start = region.elements.front().sp;
    region.elements.push_back({region.elements.back().ep, corner});
    region.elements.push_back({corner, start});
    region.closed = true;
    return std::any_of(m_starts.begin(), m_starts.end(),
                       [&](Vec2 p) { return windingNumber(region, p) != 0; });
}

}  // namespace gmpart
