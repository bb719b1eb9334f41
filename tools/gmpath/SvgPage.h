#pragma once

#include <string>
#include <vector>

#include "Measure.h"

namespace gmpath {

/// An entry of a picture's legend.
struct SvgLegendEntry {
    std::string text;
    std::string colour;
};

/// The frame of a picture of paths, with y upwards: page, background, legend. Sizes follow the
/// diagonal of what is drawn.
class SvgPage {
public:
    explicit SvgPage(const Box& drawn);

    double diagonal() const { return m_diagonal; }

    /// The opening of the picture up to its background. `rules` are style rules, one a line,
    /// besides those for all paths and texts.
    std::string head(const std::string& rules) const;

    /// A line of text under the picture: what each colour stands for. Ends where the page does.
    std::string legend(const std::vector<SvgLegendEntry>& entries) const;

private:
    double legendSize() const;

    Box m_drawn;
    double m_diagonal;
};

/// The course of a path as SVG path data, with y turned downwards as the picture needs it.
std::string svgPathData(const Path& path);

std::string svgPathTag(const Path& path, const std::string& styleClass);

}  // namespace gmpath
