#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "region/model/Box.h"

namespace gmdrawing {

/// An entry of a picture's legend.
struct SvgLegendEntry {
    std::string text;
    std::string colour;
};

/// The frame of a picture of paths, with y upwards: page, background, legend. Sizes follow the
/// diagonal of what is drawn.
class SvgPage {
public:
    explicit SvgPage(const gmregion::Box& drawn);

    double diagonal() const { return m_diagonal; }

    /// The whole picture: page and background, the drawn `body`, the legend under it. `rules` are
    /// style rules, one a line, besides those for all paths and texts. The legend takes as many
    /// lines as it needs, up to four; entries beyond them are left out.
    std::string picture(const std::string& rules, const std::string& body,
                        const std::vector<SvgLegendEntry>& legend) const;

private:
    double legendSize() const;
    std::size_t entriesPerLine() const;
    std::string head(const std::string& rules, std::size_t legendLines) const;
    std::string legendText(const std::vector<SvgLegendEntry>& entries) const;

    gmregion::Box m_drawn;
    double m_diagonal;
};

/// The course of a path as SVG path data, with y turned downwards as the picture needs it.
std::string svgPathData(const gmregion::Path& path);

std::string svgPathTag(const gmregion::Path& path, const std::string& styleClass);

}  // namespace gmdrawing
