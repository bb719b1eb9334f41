// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "drawing/Units.h"
#include "drawing/curves/PathCollector.h"

namespace gmdrawing {

/// Whether a text is XML rather than anything else that drawings are in.
bool isXml(const std::string& text);

/// A drawing in SVG that was parsed.
class SvgDrawing {
public:
    /// Throws InputError for a text that is no XML, or holds no svg element at its root.
    explicit SvgDrawing(const std::string& text);
    ~SvgDrawing();
    SvgDrawing(const SvgDrawing&) = delete;
    SvgDrawing& operator=(const SvgDrawing&) = delete;

    /// Inches or millimetres, as the size of the page is written; where it is in neither, 96 user
    /// units are taken for an inch and lengths are in millimetres, which is an assumption. With an
    /// option user units are that unit.
    DrawingUnits units(std::optional<int> option) const;

    /// Everything that the drawing shows, in these units, with the y axis up: the foot of the page
    /// is at 0. Groups that editors mark as layers are the layers, else the outermost groups by
    /// their names; the rest is on layer "0". Texts and pictures cannot be used; what is not
    /// displayed is left out.
    PlacedPaths read(const DrawingUnits& units, double scale, double curveTolerance,
                     const LayerChoice& layers) const;

private:
    struct Document;
    std::unique_ptr<Document> m_document;
};

}  // namespace gmdrawing
