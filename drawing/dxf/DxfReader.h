// SPDX-License-Identifier: MIT
#pragma once

#include <dxflib/dl_creationadapter.h>

#include <optional>

#include "drawing/curves/FitSpline.h"
#include "drawing/curves/Nurbs.h"
#include "drawing/dxf/Drawing.h"

namespace gmdrawing {

/// Collects what the DXF library reads into a Drawing. Expects sanitized input: known kinds with
/// finite numbers.
///
/// Circles and polylines come as closed or open shapes of their own, a line or an arc as a shape of
/// one element (two when the arc nearly closes), ellipses and splines as curves. A spline goes by
/// its control points where it has any, else by the points that it was fitted to. Entities drawn on
/// the back of the plane are mirrored; entities in a tilted plane, and splines of which there is no
/// curve, are counted as unusable.
class DxfReader : public DL_CreationAdapter {
public:
    /// The drawing read so far; call it after the last entity.
    Drawing takeDrawing();

    void addBlock(const DL_BlockData& data) override;
    void endBlock() override;
    void addLine(const DL_LineData& data) override;
    void addArc(const DL_ArcData& data) override;
    void addCircle(const DL_CircleData& data) override;
    void addEllipse(const DL_EllipseData& data) override;
    void addPolyline(const DL_PolylineData& data) override;
    void addVertex(const DL_VertexData& data) override;
    void addSpline(const DL_SplineData& data) override;
    void addControlPoint(const DL_ControlPointData& data) override;
    void addFitPoint(const DL_FitPointData& data) override;
    void addKnot(const DL_KnotData& data) override;
    void endEntity() override;
    void addInsert(const DL_InsertData& data) override;

private:
    struct OpenPolyline {
        Shape shape;
        bool mirrored;
        std::vector<gmregion::Element>
            corners;  ///< start and bulge of the element behind each vertex
    };

    struct OpenSpline {
        Shape shape;
        bool closed;
        Nurbs control;
        FitPoints fit;
    };

    Block& block() { return m_block != nullptr ? *m_block : m_drawing.model; }
    bool isTilted(const std::string& kind);
    bool isMirrored();
    void skip(const std::string& kind, const std::string& layer, const char* reason);
    Shape emptyShape(const std::string& kind);
    void add(Shape shape, bool mirrored);
    void addElements(Shape shape, const std::vector<gmregion::Element>& elements, bool mirrored);
    void addCurves(Shape shape, const std::vector<Bezier>& curves, bool mirrored);
    void finishEntity();
    void finishPolyline();
    void finishSpline();

    Drawing m_drawing;
    Block* m_block = nullptr;  ///< definition being read, none in the drawing itself
    std::optional<OpenPolyline> m_polyline;
    std::optional<OpenSpline> m_spline;
};

}  // namespace gmdrawing
