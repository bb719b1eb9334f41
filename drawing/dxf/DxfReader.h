// SPDX-License-Identifier: MIT
#pragma once

#include <dxflib/dl_creationadapter.h>

#include <optional>

#include "drawing/dxf/Drawing.h"

namespace gmdrawing {

/// Collects what the DXF library reads into a Drawing. Expects sanitized input: known kinds with
/// finite numbers.
///
/// Circles and polylines come as closed or open paths of their own, a line or an arc as a path of
/// one element (two when the arc nearly closes). Entities drawn on the back of the plane are
/// mirrored; entities in a tilted plane are counted as unusable.
class DxfReader : public DL_CreationAdapter {
public:
    /// The drawing read so far; call it after the last entity.
    Drawing takeDrawing();

    void addBlock(const DL_BlockData& data) override;
    void endBlock() override;
    void addLine(const DL_LineData& data) override;
    void addArc(const DL_ArcData& data) override;
    void addCircle(const DL_CircleData& data) override;
    void addPolyline(const DL_PolylineData& data) override;
    void addVertex(const DL_VertexData& data) override;
    void endEntity() override;
    void addInsert(const DL_InsertData& data) override;

private:
    struct OpenPolyline {
        gmpart::Path path;
        bool mirrored;
        std::vector<gmregion::Element>
            corners;  ///< start and bulge of the element behind each vertex
    };

    Block& block() { return m_block != nullptr ? *m_block : m_drawing.model; }
    bool isTilted(const std::string& kind);
    bool isMirrored();
    gmpart::Path emptyPath();
    void addPath(gmpart::Path path, bool mirrored);
    void finishPolyline();

    Drawing m_drawing;
    Block* m_block = nullptr;  ///< definition being read, none in the drawing itself
    std::optional<OpenPolyline> m_polyline;
};

}  // namespace gmdrawing
