// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "drawing/svg/SvgWriter.h"
#include "part/model/Path.h"

namespace gmdrawing {

/// An entry of a picture's legend.
struct SvgLegendEntry {
    std::string text;
    std::string colour;
};

/// A picture of paths, with y upwards: page and background, what is drawn on it, the legend under
/// it. Sizes follow the diagonal of what is drawn.
class SvgPage {
public:
    explicit SvgPage(const gmregion::Box& drawn);

    double diagonal() const { return m_diagonal; }
    /// For groups, and for what is not drawn here.
    SvgWriter& svg() { return m_svg; }

    /// Comes before anything is drawn. `rules` are style rules, one a line, besides those for all
    /// paths and texts. The legend takes as many lines as it needs, up to four; entries beyond them
    /// are left out.
    void begin(const std::string& rules, std::vector<SvgLegendEntry> legend);

    void draw(const gmpart::Path& path, const std::string& styleClass);
    void circle(gmregion::Vec2 m, double r, const std::string& styleClass);

    /// A dot at the start of a path and an arrow head a little further along it, small beside small
    /// paths. Nothing for a path without elements.
    void startMark(const gmpart::Path& path, const std::string& styleClass);

    /// The path's number beside its start, inside of what a closed path encloses or outside of it;
    /// right of the direction of travel where there is no inside. The text stands upright.
    void numberLabel(const gmpart::Path& path, const std::string& number, bool inside);

    /// Writes the legend and hands out the whole picture.
    std::string finish();

private:
    /// Text from the start of its baseline, `size` drawing units high. The font itself has a common
    /// size and is scaled: renderers hint and round fonts of a fraction of a unit, as a drawing in
    /// inches would need, until they cannot be read.
    void text(gmregion::Vec2 at, double size, SvgAttributes style, const std::string& text);

    gmregion::Box m_drawn;
    double m_diagonal;
    double m_legendSize;
    std::size_t m_perLine = 1;  // entries of the legend
    std::vector<SvgLegendEntry> m_legend;
    SvgWriter m_svg;
};

/// The course of a path as SVG path data, with y turned downwards as the picture needs it.
std::string svgPathData(const gmpart::Path& path);

}  // namespace gmdrawing
