// SPDX-License-Identifier: MIT
#include "drawing/dxf/DxfWriter.h"

#include <dxflib/dl_dxf.h>
#include <utf8.h>

#include <array>
#include <cstdint>
#include <cstdio>
#include <fstream>
#include <iterator>
#include <map>
#include <memory>

#include "drawing/Text.h"
#include "drawing/dxf/NumberLocale.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Element;
using gmregion::Vec2;

namespace {

/// The oldest version with layers and bulges, which every program reads: it needs neither handles
/// nor objects.
constexpr DL_Codes::version kVersion = DL_Codes::AC1009;

constexpr int kBlack = 7;

/// Colour numbers of the passes; further passes start again at the first.
constexpr std::array<int, 8> kPassColours = {1, 5, 3, 6, 30, 4, 200, 94};

constexpr const char* kLineType = "CONTINUOUS";
constexpr const char* kSourceLayer = "SOURCE";

/// The name as files of this version hold it: characters outside ASCII as \U+XXXX. Those beyond
/// four digits have no such form.
std::string escaped(const std::string& name) {
    constexpr std::uint32_t kLastOfAscii = 0x7F;
    constexpr std::uint32_t kLastOfFourDigits = 0xFFFF;
    const std::string sound = printable(name);
    std::string text;
    for (auto it = sound.begin(); it != sound.end();) {
        const std::uint32_t code = utf8::unchecked::next(it);
        if (code <= kLastOfAscii) {
            text += static_cast<char>(code);
        } else if (code > kLastOfFourDigits) {
            text += '?';
        } else {
            std::array<char, 8> digits{};
            std::snprintf(digits.data(), digits.size(), "\\U+%04X", code);
            text += digits.data();
        }
    }
    return text;
}

class DxfWriter {
public:
    DxfWriter(const ResultDrawing& drawing, const std::string& fileName)
        : m_drawing(drawing), m_out(m_dxf.out(fileName.c_str(), kVersion)) {}

    bool run() {
        if (m_out == nullptr) return false;
        m_dxf.writeHeader(*m_out);
        m_out->dxfString(9, "$INSUNITS");
        m_out->dxfInt(70, m_drawing.units);
        m_out->sectionEnd();
        writeTables();
        writeEntities();
        m_out->dxfEOF();
        m_out->close();
        return true;
    }

private:
    void writeTables() {
        m_out->sectionTables();
        m_out->tableLinetypes(1);
        m_dxf.writeLinetype(*m_out, DL_LinetypeData(kLineType, "", 0, 0, 0.0));
        m_out->tableEnd();
        writeLayers();
        m_out->sectionEnd();
    }

    void writeLayers() {
        const std::map<std::string, int> layers = layerColours();
        m_out->tableLayers(static_cast<int>(layers.size()));
        for (const auto& [name, colour] : layers)
            writeLayer(name, colour);
        m_out->tableEnd();
    }

    std::map<std::string, int> layerColours() const {
        std::map<std::string, int> colours = {{"0", kBlack}};
        if (!m_drawing.replacesSources) colours[kSourceLayer] = kBlack;
        for (const std::vector<ResultPath>& results : m_drawing.results) {
            for (const ResultPath& result : results)
                colours.emplace(escaped(layerOf(result)), kBlack);
        }
        for (std::size_t pass = 0; pass < m_drawing.passes.size(); ++pass) {
            const std::string& layer = m_drawing.passes[pass].layer;
            if (!layer.empty()) colours[layer] = kPassColours[pass % kPassColours.size()];
        }
        return colours;
    }

    const std::string& layerOf(const ResultPath& result) const {
        const std::string& layer = m_drawing.passes[result.pass].layer;
        return layer.empty() ? result.path.layer : layer;
    }

    void writeLayer(const std::string& name, int colour) {
        constexpr int kDefaultWidth = -3;
        m_dxf.writeLayer(*m_out, DL_LayerData(name, 0),
                         DL_Attributes(name, colour, kDefaultWidth, kLineType, 1.0));
    }

    void writeEntities() {
        m_out->sectionEntities();
        if (!m_drawing.replacesSources) {
            for (const Path& contour : m_drawing.contours)
                writePolyline(contour, kSourceLayer);
        }
        for (const std::vector<ResultPath>& results : m_drawing.results) {
            for (const ResultPath& result : results)
                writePolyline(result.path, escaped(layerOf(result)));
        }
        m_out->sectionEnd();
    }

    void writePolyline(const Path& path, const std::string& layer) {
        constexpr int kByLayer = 256;
        constexpr int kWidthByLayer = -1;
        const DL_Attributes attributes(layer, kByLayer, kWidthByLayer, "BYLAYER", 1.0);
        const int vertices = static_cast<int>(path.elements.size()) + (path.closed ? 0 : 1);
        m_dxf.writePolyline(*m_out, DL_PolylineData(vertices, 0, 0, path.closed ? 1 : 0),
                            attributes);
        for (const Element& e : path.elements)
            writeVertex(e.sp, e.bulge);
        if (!path.closed) writeVertex(path.elements.back().ep, 0.0);
        m_dxf.writePolylineEnd(*m_out);
    }

    void writeVertex(Vec2 p, double bulge) {
        m_dxf.writeVertex(*m_out, DL_VertexData(p.x, p.y, 0.0, bulge));
    }

    const ResultDrawing& m_drawing;
    DL_Dxf m_dxf;
    std::unique_ptr<DL_WriterA> m_out;
};

/// The DXF library does not tell of failed writes, so the end of the file is looked at.
bool endsWithEndMark(const std::string& fileName) {
    std::ifstream stream(fileName, std::ios::binary | std::ios::ate);
    constexpr std::streamoff kTail = 8;
    if (!stream || stream.tellg() < kTail) return false;
    stream.seekg(-kTail, std::ios::end);
    const std::string tail(std::istreambuf_iterator<char>(stream), {});
    return tail.find("EOF") != std::string::npos;
}

}  // namespace

bool writeDxf(const ResultDrawing& drawing, const std::string& fileName) {
    requirePlainNumbers();
    return DxfWriter(drawing, fileName).run() && endsWithEndMark(fileName);
}

}  // namespace gmdrawing
