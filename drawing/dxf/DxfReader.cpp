// SPDX-License-Identifier: MIT
#include "drawing/dxf/DxfReader.h"

#include <cmath>

#include "drawing/curves/EllipseArcs.h"

namespace gmdrawing {

using gmpart::appendArc;
using gmpart::appendBulge;
using gmregion::Element;
using gmregion::kPi;
using gmregion::Vec2;

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

/// Turned over the y axis.
Shape mirroredInX(const Shape& shape) {
    const Placement mirror = Placement::toAxes({}, {-1.0, 0.0}, {0.0, 1.0});
    Shape result = shape;
    for (Stroke& stroke : result.strokes) {
        if (Element* e = std::get_if<Element>(&stroke)) *e = mirror.apply(*e);
        if (Bezier* curve = std::get_if<Bezier>(&stroke)) *curve = mapped(*curve, mirror);
    }
    return result;
}

/// Moves the end of a row to its start where both differ by rounding, and tells whether it did.
bool closeByRounding(std::vector<Bezier>& curves) {
    constexpr double kRounding = 1e-9;
    double size = 0.0;
    for (const Bezier& curve : curves)
        size += controlLength(curve);
    const Vec2 start = curves.front().front().p;
    if (!(distance(start, curves.back().back().p) <= kRounding * size)) return false;
    curves.back().back().p = start;
    return true;
}

int atLeastOne(int count) {
    return count < 1 ? 1 : count;
}

}  // namespace

Drawing DxfReader::takeDrawing() {
    finishEntity();
    return std::move(m_drawing);
}

void DxfReader::addBlock(const DL_BlockData& data) {
    finishEntity();
    m_block = &m_drawing.blocks[data.name];
    m_block->base = {data.bpx, data.bpy};
}

void DxfReader::endBlock() {
    finishEntity();
    m_block = nullptr;
}

void DxfReader::addLine(const DL_LineData& data) {
    addElements(emptyShape("LINE"), {{{data.x1, data.y1}, {data.x2, data.y2}}}, false);
}

void DxfReader::addArc(const DL_ArcData& data) {
    if (isTilted("ARC")) return;
    const double sweep = sweepBetween(data.angle1, data.angle2);
    const double start = std::fmod(data.angle1, 360.0) * kRadiansPerDegree;
    std::vector<Element> elements;
    appendArc(elements, {data.cx, data.cy}, data.radius, start, sweep);
    Shape shape = emptyShape("ARC");
    shape.closed = sweep == 2.0 * kPi;
    addElements(std::move(shape), elements, isMirrored());
}

void DxfReader::addCircle(const DL_CircleData& data) {
    if (isTilted("CIRCLE")) return;
    std::vector<Element> elements;
    appendArc(elements, {data.cx, data.cy}, data.radius, 0.0, 2.0 * kPi);
    Shape shape = emptyShape("CIRCLE");
    shape.closed = true;
    addElements(std::move(shape), elements, isMirrored());
}

/// Unlike arcs, ellipses on the back of the plane have the place of the front; only their sense of
/// rotation is the other one.
void DxfReader::addEllipse(const DL_EllipseData& data) {
    if (isTilted("ELLIPSE")) return;
    const double side = isMirrored() ? -1.0 : 1.0;
    const Vec2 major{data.mx, data.my};
    const Vec2 minor{-side * data.ratio * major.y, side * data.ratio * major.x};
    if (length(major) == 0.0 || data.ratio == 0.0) {
        return skip("ELLIPSE", attributes.getLayer(), "without width");
    }
    const double sweep =
        sweepBetween(data.angle1 / kRadiansPerDegree, data.angle2 / kRadiansPerDegree);
    constexpr double kWhole = 2.0 * kPi - 1e-6;
    Shape shape = emptyShape("ELLIPSE");
    shape.closed = sweep > kWhole;
    addCurves(std::move(shape),
              ellipseArc({{data.cx, data.cy}, major, minor}, std::fmod(data.angle1, 2.0 * kPi),
                         sweep > kWhole ? 2.0 * kPi : sweep),
              false);
}

void DxfReader::addPolyline(const DL_PolylineData& data) {
    finishEntity();
    if (isTilted("polyline")) return;
    constexpr unsigned kClosedFlag = 1;
    m_polyline = OpenPolyline{emptyShape("polyline"), isMirrored(), {}};
    m_polyline->shape.closed = (data.flags & kClosedFlag) != 0;
}

void DxfReader::addVertex(const DL_VertexData& data) {
    if (m_polyline) m_polyline->corners.push_back({{data.x, data.y}, {}, data.bulge});
}

void DxfReader::addSpline(const DL_SplineData& data) {
    finishEntity();
    constexpr int kClosedFlags = 1 | 2;
    m_spline = OpenSpline{emptyShape("SPLINE"), (data.flags & kClosedFlags) != 0, {}, {}};
    m_spline->control.degree = data.degree;
    m_spline->fit.startDirection = Vec2{data.tangentStartX, data.tangentStartY};
    m_spline->fit.endDirection = Vec2{data.tangentEndX, data.tangentEndY};
}

void DxfReader::addControlPoint(const DL_ControlPointData& data) {
    if (m_spline) m_spline->control.points.push_back({{data.x, data.y}, data.w});
}

void DxfReader::addFitPoint(const DL_FitPointData& data) {
    if (m_spline) m_spline->fit.points.push_back({data.x, data.y});
}

void DxfReader::addKnot(const DL_KnotData& data) {
    if (m_spline) m_spline->control.knots.push_back(data.k);
}

void DxfReader::endEntity() {
    finishEntity();
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
    skip(kind, attributes.getLayer(), "in a tilted plane");
    return true;
}

bool DxfReader::isMirrored() {
    return extrusion->getDirection()[2] < 0.0;
}

void DxfReader::skip(const std::string& kind, const std::string& layer, const char* reason) {
    ++block().report.unusable[{kind, layer, reason}];
    block().report.places.push_back({kind, layer, {}});
}

Shape DxfReader::emptyShape(const std::string& kind) {
    return {kind, attributes.getLayer()};
}

void DxfReader::addElements(Shape shape, const std::vector<Element>& elements, bool mirrored) {
    shape.strokes.assign(elements.begin(), elements.end());
    add(std::move(shape), mirrored);
}

void DxfReader::addCurves(Shape shape, const std::vector<Bezier>& curves, bool mirrored) {
    shape.strokes.assign(curves.begin(), curves.end());
    add(std::move(shape), mirrored);
}

void DxfReader::add(Shape shape, bool mirrored) {
    if (shape.strokes.empty()) return;
    block().shapes.push_back(mirrored ? mirroredInX(shape) : std::move(shape));
}

void DxfReader::finishEntity() {
    finishPolyline();
    finishSpline();
}

void DxfReader::finishPolyline() {
    if (!m_polyline) return;
    OpenPolyline polyline = std::move(*m_polyline);
    m_polyline.reset();
    std::vector<Element>& corners = polyline.corners;
    for (std::size_t i = 0; i + 1 < corners.size(); ++i)
        corners[i].ep = corners[i + 1].sp;
    if (polyline.shape.closed && !corners.empty()) {
        corners.back().ep = corners.front().sp;
    } else if (!corners.empty()) {
        corners.pop_back();
    }
    std::vector<Element> elements;
    for (const Element& e : corners)
        appendBulge(elements, e);
    addElements(std::move(polyline.shape), elements, polyline.mirrored);
}

/// A spline is closed where its ends meet but for rounding.
void DxfReader::finishSpline() {
    if (!m_spline) return;
    OpenSpline spline = std::move(*m_spline);
    m_spline.reset();
    spline.fit.closed = spline.closed;
    const bool byPoints = spline.control.points.empty();
    if (!byPoints) {
        const char* fault = faultOf(spline.control);
        if (*fault != '\0') return skip("SPLINE", spline.shape.layer, fault);
    }
    std::vector<Bezier> curves =
        byPoints ? splineThrough(spline.fit) : bezierPieces(spline.control);
    if (curves.empty()) return skip("SPLINE", spline.shape.layer, "too few points");
    spline.shape.closed = closeByRounding(curves);
    addCurves(std::move(spline.shape), curves, false);
}

}  // namespace gmdrawing
