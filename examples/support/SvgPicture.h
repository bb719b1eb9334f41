// SPDX-License-Identifier: MIT
/// @file
/// The pictures that the examples write.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "gmregion/Element.h"
#include "gmregion/Paths.h"
#include "gmregion/Questions.h"
#include "gmregion/RegionSet.h"

namespace examples {

/// What a curve stands for; decides about colour, width and dashes.
enum class Style {
    kGiven,   ///< input, dark
    kResult,  ///< what the example is about, orange
    kOther,   ///< a second result, blue
    kThird,   ///< a third result, green
    kHelp,    ///< construction lines, grey and dashed
};

/// Collects paths, sets and marked points and writes them as one SVG picture of fixed width, y up.
///
/// The picture shows the boxes of all that was added, of endless lines that of their start; these
/// run on to its edge. What came first lies below. The legend stands under the picture, in the
/// order in which its texts came.
class SvgPicture {
public:
    using Elements = std::vector<gmregion::Element>;

    /// Draws what follows moved, as often as wanted, each time from where it is.
    void moveNext(gmregion::Point by) { m_shift = by; }

    /// A path of segments and arcs.
    void add(const Elements& path, bool closed, Style style);
    void add(const gmregion::Paths& paths, Style style);
    /// Outlines and holes of a set.
    void add(const gmregion::RegionSet& set, Style style);
    /// An element that runs on in both directions; it must be a segment.
    void addEndless(const gmregion::Element& line, Style style);
    /// Tints what a set covers.
    void fill(const gmregion::RegionSet& set, Style style);

    /// Explains a style: one line of text.
    void legend(Style style, const std::string& text);
    /// A dot.
    void mark(gmregion::Point p, Style style);
    /// An arrow head in the end of an element, along its direction of travel.
    void arrow(const gmregion::Element& element, Style style);

    /// Writes the picture; false when the file cannot be written.
    bool save(const std::string& fileName) const;

private:
    enum class Drawn { kOpen, kClosed, kEndless };

    /// One path of the picture, of one chain or more.
    struct Stroke {
        std::vector<Elements> chains;
        Drawn drawn;
        std::string name;  ///< of its class in the style sheet
    };

    template <typename T>
    using Styled = std::pair<T, Style>;

    gmregion::Element placed(const gmregion::Element& e) const;
    void include(const gmregion::Element& e);
    void include(gmregion::Point p);
    Elements taken(const gmregion::Element* first, const gmregion::Element* last);
    std::vector<Elements> taken(const gmregion::RegionSet& set);

    std::vector<Stroke> m_strokes;
    std::vector<Styled<gmregion::Element>> m_arrows;
    std::vector<Styled<gmregion::Point>> m_marks;
    std::vector<Styled<std::string>> m_legend;
    gmregion::Bounds m_box;
    bool m_hasBox = false;
    gmregion::Point m_shift;
};

}  // namespace examples
