// SPDX-License-Identifier: MIT
/// @file
/// Room for cutting a corner off.
///
/// The new element must meet no other contour; then only what lies wholly between it and the corner
/// can still be cut off, and of a contour that lies there any one point tells. So the elements near
/// it are intersected and the points near it are looked up. It does not find room by making the
/// transition smaller.

#include "part/kernel/CornerRoom.h"

#include "gmbridge/Curves.h"
#include "gmkernel/GmContour.h"

#include "part/kernel/PathConversion.h"
#include "part/model/Winding.h"

namespace gmpart {

CornerRoom::CornerRoom(const std::vector<Path>& contours) {
    std::vector<Box> boxes;
    std::vector<Box> starts;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        m_starts.push_back(contours[i].elements.front().sp);
        starts.push_back({m_starts.back(), m_starts.back()});
        for (const Element& e : contours[i].elements) {
            boxes.push_back(boundingBox(e));
            m_obstacles.push_back({{gmbridge::curveOf(e), boxes.back()}, i});
        }
    }
    m_obstacleBoxes.assign(boxes);
    m_startBoxes.assign(starts);
}

bool CornerRoom::allows(const BoxedCurve& made, Vec2 corner, std::size_t own) const {
    return !meetsObstacle(made, own) && !cutsOff(*made.curve, corner, own);
}

bool CornerRoom::meetsObstacle(const BoxedCurve& made, std::size_t own) const {
    return m_obstacleBoxes.anyOverlapping(made.box.grown(kKernelTolerance), [&](std::size_t i) {
        const Obstacle& obstacle = m_obstacles[i];
        return obstacle.contour != own && obstacle.curve.curve->CreationOK() &&
               meet(made, obstacle.curve);
    });
}

/// What is cut off counts as bounded by chords beside the corner.
bool CornerRoom::cutsOff(const GmCurve& made, Vec2 corner, std::size_t own) const {
    GmContour alone;
    alone.AddElement(made, false, 0);
    Path region = reversed(pathFromKernel(alone, {}).path);
    const Vec2 start = region.elements.front().sp;
    region.elements.push_back({region.elements.back().ep, corner});
    region.elements.push_back({corner, start});
    region.closed = true;
    return m_startBoxes.anyOverlapping(boundingBox(region), [&](std::size_t i) {
        return i != own && windingNumber(region, m_starts[i]) != 0;
    });
}

}  // namespace gmpart
