// SPDX-License-Identifier: MIT
#include "drawing/dxf/DxfReader.h"

#include <cmath>

namespace gmdrawing {

using gmpart::appendArc;
using gmpart::appendBulge;
using gmpart::Path;
using gmregion::Element;
using gmregion::kPi;

namespace {

constexpr double kRadiansPerDegree = kPi / 180.0;

/// Largest sideways part of a plane's unit normal that still counts as upright.
constexpr double kUprightTolerance = 1e-6;

/// Sweep in (0, 2 pi] from one direction angle to the other, both in degrees. Equal angles make the
/// full circle: an arc without extent is never drawn on purpose.
double sweepBetween(double startDegrees, double endDegrees) {
    double degrees = std::fmod(endDegrees - startDegrees, 360.0);
    if (degrees < 0.0) degrees += 360.0;
    return degrees == 0.0 ? 2.0 * kPi : degrees * kRadiansPerDegree;
}

void mirrorInX(Path& path) {
    for (Element& e : path.elements)
        e = {{-e.sp.x, e.sp.y}, {-e.ep.x, e.ep.y}, -e.bulge};
}

int atLeastOne(int count) {
    return count < 1 ? 1 : count;
}

}  // namespace

Drawing DxfReader::takeDrawing() {
    finishPolyline();
    return std::move(m_drawing);
}

void DxfReader::addBlock(const DL_BlockData& data) {
    finishPolyline();
    m_block = &m_drawing.blocks[data.name];
    m_block->base = {data.bpx, data.bpy};
}

void DxfReader::endBlock() {
    finishPolyline();
    m_block = nullptr;
}

void DxfReader::addLine(const DL_LineData& data) {
    Path path = emptyPath();
    path.elements.push_back({{data.x1, data.y1}, {data.x2, data.y2}});
    addPath(std::move(path), false);
}

void DxfReader::addArc(const DL_ArcData& data) {
    if (isTilted("ARC")) return;
    Path path = emptyPath();
    const double sweep = sweepBetween(data.angle1, data.angle2);
    const double start = std::fmod(data.angle1, 360.0) * kRadiansPerDegree;
    appendArc(path.elements, {data.cx, data.cy}, data.radius, start, sweep);
    path.closed = sweep == 2.0 * kPi;
    addPath(std::move(path), isMirrored());
}

void DxfReader::addCircle(const DL_CircleData& data) {
    if (isTilted("CIRCLE")) return;
    Path path = emptyPath();
    appendArc(path.elements, {data.cx, data.cy}, data.radius, 0.0, 2.0 * kPi);
    path.closed = true;
    addPath(std::move(path), isMirrored());
}

void DxfReader::addPolyline(const DL_PolylineData& data) {
    finishPolyline();
    if (isTilted("polyline")) return;
    constexpr unsigned kClosedFlag = 1;
    m_polyline = OpenPolyline{emptyPath(), isMirrored(), {}};
    m_polyline->path.closed = (data.flags & kClosedFlag) != 0;
}

void DxfReader::addVertex(const DL_VertexData& data) {
    if (m_polyline) m_polyline->corners.push_back({{data.x, data.y}, {}, data.bulge});
}

void DxfReader::endEntity() {
    finishPolyline();
}

void DxfReader::addInsert(const DL_InsertData& data) {
    if (isTilted("INSERT")) return;
    BlockReference reference;
    reference.block = data.name;
    reference.layer = attributes.getLayer();
    reference.at = {data.ipx, data.ipy};
    reference.scale = {data.sx, data.sy};
    reference.angle = std::fmod(data.angle, 360.0) * kRadiansPerDegree;
    reference.columns = atLeastOne(data.cols);
    reference.rows = atLeastOne(data.rows);
    reference.spacing = {data.colSp, data.rowSp};
    reference.mirrored = isMirrored();
    block().references.push_back(std::move(reference));
}

bool DxfReader::isTilted(const std::string& kind) {
    const double* normal = extrusion->getDirection();
    const double sideways = std::hypot(normal[0], normal[1]);
    if (sideways <= kUprightTolerance * std::abs(normal[2])) return false;
    ++block().skipped.unusable[{kind, attributes.getLayer(), "in a tilted plane"}];
    return true;
}

bool DxfReader::isMirrored() {
    return extrusion->getDirection()[2] < 0.0;
}

Path DxfReader::emptyPath() {
    return {{}, false, attributes.getLayer()};
}

void DxfReader::addPath(Path path, bool mirrored) {
    if (mirrored) mirrorInX(path);
    if (!path.elements.empty()) block().paths.push_back(std::move(path));
}

void DxfReader::finishPolyline() {
    if (!m_polyline) return;
    OpenPolyline polyline = std::move(*m_polyline);
    m_polyline.reset();
    std::vector<Element>& corners = polyline.corners;
    for (std::size_t i = 0; i + 1 < corners.size(); ++i)
        corners[i].ep = corners[i + 1].sp;
    if (polyline.path.closed && !corners.empty()) {
        corners.back().ep = corners.front().sp;
    } else if (!corners.empty()) {
        corners.pop_back();
    }
    for (const Element& e : corners)
        appendBulge(polyline.path.elements, e);
    addPath(std::move(polyline.path), polyline.mirrored);
}

}  // namespace gmdrawing
