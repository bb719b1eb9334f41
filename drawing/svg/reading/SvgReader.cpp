// SPDX-License-Identifier: MIT
/// @file
/// Walking through an SVG drawing.
///
/// The walk goes down the groups with their placement and layer; references (`use`) are followed to
/// what they show, with a limit to how deep things may lie in each other. Style sheets are not
/// read, only what stands with an element.

#include "drawing/svg/reading/SvgReader.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <map>
#include <pugixml.hpp>
#include <string_view>
#include <utility>
#include <vector>

#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/svg/reading/SvgGrammar.h"
#include "drawing/svg/reading/SvgLength.h"
#include "drawing/svg/reading/SvgShapes.h"

namespace gmdrawing {

using gmregion::Vec2;

namespace {

constexpr double kUserUnitsInInch = 96.0;

/// Elements that lie deeper in each other are taken for a mistake.
constexpr int kMaxDepth = 200;

std::string_view localName(const pugi::xml_node& node) {
    const std::string_view name = node.name();
    const std::size_t colon = name.find(':');
    return colon == std::string_view::npos ? name : name.substr(colon + 1);
}

template <std::size_t Count>
bool isOneOf(const std::array<std::string_view, Count>& names, std::string_view name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

bool isContainer(std::string_view name) {
    constexpr std::array<std::string_view, 4> kNames = {"g", "a", "svg", "switch"};
    return isOneOf(kNames, name);
}

/// Elements that would be seen, but have no outline.
bool isUnusable(std::string_view name) {
    constexpr std::array<std::string_view, 5> kNames = {"text", "image", "foreignObject",
                                                        "flowRoot", "video"};
    return isOneOf(kNames, name);
}

/// Whether a declaration stands in the style of an element, or as an attribute of its own.
bool declares(const pugi::xml_node& node, const char* property, std::string_view value) {
    if (node.attribute(property).value() == value) return true;
    std::string style = node.attribute("style").value();
    style.erase(std::remove(style.begin(), style.end(), ' '), style.end());
    const std::string wanted = std::string(property) + ":" + std::string(value);
    const std::size_t at = style.find(wanted);
    if (at == std::string::npos) return false;
    const std::size_t end = at + wanted.size();
    return (at == 0 || style[at - 1] == ';') && (end == style.size() || style[end] == ';');
}

bool isHidden(const pugi::xml_node& node) {
    return declares(node, "display", "none") || declares(node, "visibility", "hidden");
}

std::vector<double> numbersOf(std::string_view text) {
    std::vector<double> numbers;
    while (!text.empty()) {
        const std::size_t end = text.find_first_of(" ,\t\r\n");
        const std::string_view word = text.substr(0, end);
        if (!word.empty()) numbers.push_back(parseReal(word).value_or(0.0));
        text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
    }
    return numbers;
}

/// The page of a drawing: what part of the plane it shows, and how large that is.
struct Page {
    Vec2 low;
    std::optional<Vec2> size;  ///< in user units
    double factor = 1.0;       ///< from user units of the drawing to those of the page

    explicit Page(const pugi::xml_node& root) {
        const auto width = svgLength(root.attribute("width").value());
        const auto height = svgLength(root.attribute("height").value());
        const std::vector<double> box = numbersOf(root.attribute("viewBox").value());
        const bool hasBox = box.size() == 4 && box[2] > 0.0 && box[3] > 0.0;
        if (width && height) size = Vec2{*width, *height};
        if (!hasBox) return;
        low = {box[0], box[1]};
        size = Vec2{box[2], box[3]};
        if (width && *width > 0.0) factor = *width / box[2];
        if (height && *height > 0.0) factor = std::min(width ? factor : HUGE_VAL, *height / box[3]);
    }

    /// From the drawing to the plane with the y axis up.
    Placement placement(double scale) const {
        const double foot = size ? low.y + size->y : 0.0;
        const double left = size ? low.x : 0.0;
        return Placement::toAxes({-scale * left, scale * foot}, {scale, 0.0}, {0.0, -scale});
    }
};

/// Where the walk is.
struct Surroundings {
    Placement placement;
    std::string layer = "0";
    int depth = 0;
};

class Walk {
public:
    Walk(const pugi::xml_node& root, PathCollector& collector) : m_collector(collector) {
        root.find_node([&](const pugi::xml_node& node) {
            const std::string_view id = node.attribute("id").value();
            if (!id.empty()) m_named.emplace(id, node);
            return false;
        });
    }

    void children(const pugi::xml_node& parent, const Surroundings& around) {
        for (const pugi::xml_node child : parent.children()) {
            if (child.type() == pugi::node_element) visit(child, around);
        }
    }

private:
    void visit(const pugi::xml_node& node, const Surroundings& around) {
        const std::string_view name = localName(node);
        const bool draws =
            isContainer(name) || isSvgShape(name) || isUnusable(name) || name == "use";
        if (!draws) return;
        const Surroundings inside = layered(node, name, around);
        const std::string kind(name);
        if (isHidden(node)) return m_collector.leaveOut(kind, inside.layer, "not displayed");
        if (isUnusable(name)) return m_collector.skip(kind, inside.layer, "kind cannot be used");
        if (around.depth >= kMaxDepth) {
            return skip(kind, inside.layer, "nested too deeply");
        }
        const auto placement = placementOf(node.attribute("transform").value());
        if (!placement) return skip(kind, inside.layer, "broken transformation");
        enter(node, name, {around.placement.after(*placement), inside.layer, around.depth + 1});
    }

    void enter(const pugi::xml_node& node, std::string_view name, const Surroundings& inside) {
        if (isContainer(name)) return children(node, inside);
        if (name == "use") return follow(node, inside);
        const auto shapes = svgShapes(node, name);
        if (!shapes) return skip(std::string(name), inside.layer, "broken");
        for (const Shape& shape : *shapes)
            m_collector.add(shape, inside.placement, inside.layer);
    }

    /// Counts what may belong to an outline.
    void skip(const std::string& kind, const std::string& layer, const char* reason) {
        m_collector.skip(kind, layer, reason);
        m_collector.addPlace({kind, layer, {}}, {}, layer);
    }

    /// Groups that an editor marks are layers wherever they are; outermost groups with a name are,
    /// too.
    static Surroundings layered(const pugi::xml_node& node, std::string_view name,
                                const Surroundings& around) {
        Surroundings inside = around;
        const bool marked =
            node.attribute("inkscape:groupmode").value() == std::string_view("layer");
        if (!marked && (name != "g" || around.depth > 0)) return inside;
        for (const char* attribute : {"inkscape:label", "data-name", "id"}) {
            const std::string label = node.attribute(attribute).value();
            if (label.empty()) continue;
            inside.layer = label;
            return inside;
        }
        return inside;
    }

    void follow(const pugi::xml_node& use, const Surroundings& around) {
        m_collector.countPlaced();
        const pugi::xml_node target = referenced(use);
        if (!target) return skip("use", around.layer, "refers to nothing");
        const Vec2 at{svgLength(use.attribute("x").value()).value_or(0.0),
                      svgLength(use.attribute("y").value()).value_or(0.0)};
        Surroundings inside = around;
        inside.placement = around.placement.after(Placement::toAxes(at, {1.0, 0.0}, {0.0, 1.0}));
        if (localName(target) == "symbol") {
            children(target, inside);
        } else {
            visit(target, inside);
        }
    }

    pugi::xml_node referenced(const pugi::xml_node& use) const {
        std::string_view reference = use.attribute("href").value();
        if (reference.empty()) reference = use.attribute("xlink:href").value();
        if (reference.empty() || reference.front() != '#') return {};
        reference.remove_prefix(1);
        const auto found = m_named.find(reference);
        return found == m_named.end() ? pugi::xml_node() : found->second;
    }

    PathCollector& m_collector;
    std::map<std::string_view, pugi::xml_node> m_named;  ///< by their ids
};

}  // namespace

struct SvgDrawing::Document {
    pugi::xml_document xml;
    pugi::xml_node root;
};

bool isXml(const std::string& text) {
    constexpr std::string_view kMark = "\xEF\xBB\xBF";
    std::string_view rest = text;
    if (rest.substr(0, kMark.size()) == kMark) rest.remove_prefix(kMark.size());
    const std::size_t first = rest.find_first_not_of(" \t\r\n");
    return first != std::string_view::npos && rest[first] == '<';
}

SvgDrawing::SvgDrawing(const std::string& text) : m_document(std::make_unique<Document>()) {
    const pugi::xml_parse_result parsed = m_document->xml.load_buffer(text.data(), text.size());
    if (!parsed) throw InputError(std::string("damaged SVG file: ") + parsed.description());
    m_document->root = m_document->xml.document_element();
    if (localName(m_document->root) != "svg") throw InputError("XML, but no SVG drawing");
}

SvgDrawing::~SvgDrawing() = default;

DrawingUnits SvgDrawing::units(std::optional<int> option) const {
    if (option) return {*option, UnitSource::kOption};
    const int ruler = rulerUnit(m_document->root.attribute("width").value());
    if (ruler != kNoUnit) return {ruler, UnitSource::kDrawing};
    return {kMillimetre, UnitSource::kAssumed};
}

PlacedPaths SvgDrawing::read(const DrawingUnits& units, double scale, double curveTolerance,
                             const LayerChoice& layers) const {
    const Page page(m_document->root);
    const double ofPage =
        page.factor * millimetresIn(kInch) / kUserUnitsInInch / millimetresIn(units.code);
    const double factor = units.source == UnitSource::kOption ? 1.0 : ofPage;
    PathCollector collector(curveTolerance * scale, layers);
    Walk(m_document->root, collector)
        .children(m_document->root, {page.placement(scale * factor), "0", 0});
    return collector.take();
}

}  // namespace gmdrawing
