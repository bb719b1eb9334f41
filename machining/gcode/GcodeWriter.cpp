// SPDX-License-Identifier: MIT
/// @file
/// Moves as G-code.
///
/// A controller computes the radius of an arc at its start and at its end and refuses arcs whose
/// radii differ. So every element is computed anew between its rounded ends, with the bulge kept,
/// and the centre is rounded last: both radii agree within two units of the last decimal. Arcs of
/// more than a half circle come in halves, since near the full circle the ends hardly fix a centre.

#include "machining/gcode/GcodeWriter.h"

#include <cmath>
#include <optional>

#include "drawing/Text.h"

namespace gmmachining {

using gmdrawing::formatFixed;
using gmdrawing::formatReal;
using gmregion::Element;
using gmregion::Vec2;

namespace {

constexpr int kDecimals = 6;
constexpr int kSpeedDecimals = 3;
constexpr double kUnitsOfLastDecimal = 1e6;

/// Arcs nearer to their chord than this are written as straight moves.
constexpr double kFlatSagitta = 1e-4;

/// Arcs that turn further than a half circle are halved; a half circle may be off by rounding.
constexpr double kLargestBulge = 1.0 + 1e-9;

double rounded(double value) {
    return std::round(value * kUnitsOfLastDecimal) / kUnitsOfLastDecimal;
}

Vec2 rounded(Vec2 p) {
    return {rounded(p.x), rounded(p.y)};
}

std::string word(char letter, double value) {
    return std::string(" ") + letter + formatFixed(value, kDecimals);
}

/// A comment holds plain characters and no parentheses, and lines are of limited length.
std::string comment(std::string text) {
    constexpr std::size_t kLongestComment = 100;
    for (char& c : text) {
        if (c == '(') c = '[';
        if (c == ')') c = ']';
        if (c < ' ' || c > '~') c = '?';
    }
    return "(" + text.substr(0, kLongestComment) + ")\n";
}

double sagitta(const Element& e) {
    return 0.5 * std::abs(e.bulge) * distance(e.sp, e.ep);
}

class GcodeWriter {
public:
    explicit GcodeWriter(const MachineSettings& settings) : m_settings(settings) {}

    std::string run(const Toolpath& moves) {
        writeHead();
        for (const Move& move : moves) {
            writeContour(move);
            write(move);
        }
        m_text += "M5\nM2\n";
        return std::move(m_text);
    }

private:
    void writeHead() {
        const bool inches = m_settings.units == Units::kInches;
        m_text += comment("part " + m_settings.partName);
        m_text += comment("tool diameter " + formatReal(m_settings.toolDiameter) +
                          (inches ? " in" : " mm"));
        m_text += inches ? "G20\n" : "G21\n";
        m_text += "G17 G90 G94 G91.1 G40\n";
        m_text += m_settings.spindle
                      ? "M3 S" + formatFixed(*m_settings.spindle, kSpeedDecimals) + "\n"
                      : "M3\n";
    }

    void writeContour(const Move& move) {
        if (move.kind != MoveKind::kPlunge || m_contour == move.contour) return;
        m_contour = move.contour;
        m_text += comment("contour " + std::to_string(move.contour + 1));
    }

    void write(const Move& move) {
        if (move.path.elements.empty()) {
            m_text += move.kind == MoveKind::kRapid ? "G0" : "G1";
            m_text += word('Z', move.z) + feedWord(move.kind) + "\n";
        }
        for (const Element& e : move.path.elements)
            write(move.kind, {m_place.value_or(Vec2{}), rounded(e.ep), e.bulge});
    }

    void write(MoveKind kind, const Element& e) {
        if (sagitta(e) < kFlatSagitta) {
            writeLine(kind, e.ep);
        } else if (std::abs(e.bulge) > kLargestBulge) {
            const Vec2 half = rounded(halvingPoint(e));
            const double halfBulge = std::tan(0.5 * std::atan(e.bulge));
            writeArc(kind, {e.sp, half, halfBulge});
            writeArc(kind, {half, e.ep, halfBulge});
        } else {
            writeArc(kind, e);
        }
    }

    void writeLine(MoveKind kind, Vec2 to) {
        if (to == m_place) return;
        m_text += kind == MoveKind::kRapid ? "G0" : "G1";
        m_text += word('X', to.x) + word('Y', to.y) + feedWord(kind) + "\n";
        m_place = to;
    }

    void writeArc(MoveKind kind, const Element& e) {
        const Vec2 toCentre = rounded(centre(e) - e.sp);
        m_text += e.bulge > 0.0 ? "G3" : "G2";
        m_text += word('X', e.ep.x) + word('Y', e.ep.y) + word('I', toCentre.x) +
                  word('J', toCentre.y) + feedWord(kind) + "\n";
        m_place = e.ep;
    }

    /// The speed where it changes; rapid moves have none.
    std::string feedWord(MoveKind kind) {
        if (kind == MoveKind::kRapid) return {};
        const double feed = kind == MoveKind::kPlunge ? m_settings.plunge : m_settings.feed;
        if (feed == m_feed) return {};
        m_feed = feed;
        return " F" + formatFixed(feed, kSpeedDecimals);
    }

    const MachineSettings& m_settings;
    std::string m_text;
    std::optional<Vec2> m_place;  ///< unknown until the first move to a point
    double m_feed = 0.0;
    std::optional<std::size_t> m_contour;
};

}  // namespace

std::string gcodeOf(const Toolpath& moves, const MachineSettings& settings) {
    return GcodeWriter(settings).run(moves);
}

}  // namespace gmmachining
