// SPDX-License-Identifier: MIT
#pragma once

#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

namespace gmdrawing {

/// Numbers with spaces between: a decimal point, at most 12 significant digits, an exponent below
/// 1e-4 and from 1e12 on, no -0. What is not finite is a word, at which SVG stops reading a path.
std::string svgNumbers(std::initializer_list<double> numbers);

/// Where an element of a path leads, y downwards: a segment, or an arc when it turns.
struct SvgStep {
    double x;
    double y;
    double r = 0.0;
    double sweep = 0.0;  ///< in radians, positive from x to y, clockwise on the screen
};

/// The data of a path that begins in the first step. SVG leaves out arcs that end where they start.
std::string svgPathData(const std::vector<SvgStep>& steps, bool closed);

/// An attribute of an element, or a property in a style rule.
struct SvgAttribute {
    SvgAttribute(std::string_view key, std::string_view text) : name(key), value(text) {}
    SvgAttribute(std::string_view key, double number) : name(key), value(svgNumbers({number})) {}

    std::string name;
    std::string value;
};
using SvgAttributes = std::vector<SvgAttribute>;

/// A style rule on a line of its own; nothing is escaped.
std::string svgRule(const std::string& selector, const SvgAttributes& properties);

/// Writes the elements of a picture, each on a line of its own. Values and texts may be anything:
/// markup is escaped, and what is no printable UTF-8 becomes '?'. Names are taken as they are.
class SvgWriter {
public:
    /// An element with nothing but text in it, or nothing at all.
    void element(const std::string& name, const SvgAttributes& attributes,
                 std::string_view text = {});
    /// A style sheet of whole lines; nothing is escaped.
    void style(std::string_view rules);
    /// Begins an element that holds all that follow up to its end().
    void begin(const std::string& name, const SvgAttributes& attributes);
    /// Ends the innermost element that is open; there must be one.
    void end();
    /// Ends all that is open and hands out the picture.
    std::string finish();

private:
    std::string m_svg;
    std::vector<std::string> m_open;
};

}  // namespace gmdrawing
