// SPDX-License-Identifier: MIT
#include "drawing/svg/SvgWriter.h"

#include <cmath>
#include <utility>

#include "drawing/Text.h"

namespace gmdrawing {

namespace {

constexpr double kPi = 3.14159265358979323846;

/// The text as it can stand in XML: what means something there escaped, what is not printable
/// replaced.
std::string escaped(std::string_view text) {
    std::string result;
    for (const char c : printable(text)) {
        switch (c) {
            case '&':
                result += "&amp;";
                break;
            case '<':
                result += "&lt;";
                break;
            case '>':
                result += "&gt;";
                break;
            case '"':
                result += "&quot;";
                break;
            default:
                result += c;
        }
    }
    return result;
}

/// The start of an element, without the bracket that ends its tag.
std::string tagOf(const std::string& name, const SvgAttributes& attributes) {
    std::string tag = "<" + name;
    for (const SvgAttribute& attribute : attributes)
        tag += " " + attribute.name + "=\"" + escaped(attribute.value) + "\"";
    return tag;
}

}  // namespace

std::string svgNumbers(std::initializer_list<double> numbers) {
    std::string text;
    for (const double number : numbers)
        text += (text.empty() ? "" : " ") + formatReal(number);
    return text;
}

std::string svgPathData(const std::vector<SvgStep>& steps, bool closed) {
    std::string data;
    for (const SvgStep& to : steps) {
        if (data.empty()) {
            data = "M ";
        } else if (to.sweep == 0.0) {
            data += " L ";
        } else {
            data += " A " + svgNumbers({to.r, to.r}) + " 0 ";
            data += std::abs(to.sweep) > kPi ? "1 " : "0 ";
            data += to.sweep > 0.0 ? "1 " : "0 ";
        }
        data += svgNumbers({to.x, to.y});
    }
    return closed && !steps.empty() ? data + " Z" : data;
}

std::string svgRule(const std::string& selector, const SvgAttributes& properties) {
    std::string rule = selector + " { ";
    for (const SvgAttribute& property : properties)
        rule += property.name + ": " + property.value + "; ";
    return rule + "}\n";
}

void SvgWriter::element(const std::string& name, const SvgAttributes& attributes,
                        std::string_view text) {
    m_svg += tagOf(name, attributes);
    m_svg += text.empty() ? "/>\n" : ">" + escaped(text) + "</" + name + ">\n";
}

void SvgWriter::style(std::string_view rules) {
    begin("style", {});
    m_svg += rules;
    end();
}

void SvgWriter::begin(const std::string& name, const SvgAttributes& attributes) {
    m_svg += tagOf(name, attributes) + ">\n";
    m_open.push_back(name);
}

void SvgWriter::end() {
    m_svg += "</" + m_open.back() + ">\n";
    m_open.pop_back();
}

std::string SvgWriter::finish() {
    while (!m_open.empty())
        end();
    return std::move(m_svg);
}

}  // namespace gmdrawing
