// SPDX-License-Identifier: MIT
/// @file
/// The pictures that the examples write.
#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "gmkernel/GmCurve.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/GmRect.h"

namespace examples {

/// What a curve stands for; decides about colour, width and dashes.
enum class Style {
    kGiven,   ///< input, dark
    kResult,  ///< what the example is about, orange
    kOther,   ///< a second result, blue
    kHelp,    ///< construction lines, grey and dashed
};

/// Collects curves and marked points and writes them as one SVG picture of fixed width, y up.
///
/// The picture shows the bounding boxes of the curves and of the marks, of lines that of their
/// start; these run on to its edge. The legend stands below it, in the order in which its texts
/// came.
class SvgPicture {
public:
    /// Keeps a copy of a segment, arc, circle, line or contour; other curves are not drawn.
    void add(const GmCurve& curve, Style style);
    /// Explains a style: one line of text.
    void legend(Style style, const std::string& text);
    /// A dot.
    void mark(const GmPoint& p, Style style);
    /// An arrow head in the end of an element, along its direction of travel.
    void arrow(const GmCurve& element, Style style);
    /// Writes the picture; false when the file cannot be written.
    bool save(const std::string& fileName) const;

private:
    template <typename T>
    using Styled = std::pair<T, Style>;

    std::vector<Styled<std::unique_ptr<GmCurve>>> m_curves;
    std::vector<Styled<std::unique_ptr<GmCurve>>> m_arrows;
    std::vector<Styled<GmPoint>> m_marks;
    std::vector<Styled<std::string>> m_legend;
    GmRect m_box;
};

}  // namespace examples
