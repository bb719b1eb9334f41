// SPDX-License-Identifier: MIT
#include "tests/support/GcodeReader.h"

#include <cmath>
#include <map>
#include <set>
#include <sstream>

using namespace gmregion;

namespace {

constexpr double kRadiusTolerance = 1e-5;

/// Signed sweep of an arc in radians.
double sweepOf(const GcodeMove& arc) {
    const Vec2 a = arc.from - arc.centre;
    const Vec2 b = arc.to - arc.centre;
    const double turn = arc.kind == 3 ? 1.0 : -1.0;
    double angle = turn * std::atan2(cross(a, b), dot(a, b));
    if (angle <= 0.0) angle += 2.0 * kPi;
    return turn * angle;
}

class Reader {
public:
    explicit Reader(double safeZ) : m_safeZ(safeZ) {}

    GcodeProgram run(const std::string& text) {
        std::istringstream lines(text);
        while (std::getline(lines, m_line))
            readLine();
        m_line = "end";
        expect(m_ended && !m_spindle, "spindle off and program ended");
        expect(m_z >= m_safeZ, "safe height at the end");
        return std::move(m_program);
    }

private:
    void expect(bool met, const std::string& what) {
        if (!met) m_program.faults.push_back(m_line + ": expected " + what);
    }

    void readLine() {
        expect(!m_ended, "nothing behind the end");
        expect(m_line.find("-0.000000") == std::string::npos, "no minus zero");
        if (m_line.front() == '(') {
            expect(m_line.find_first_of("()", 1) == m_line.size() - 1, "one comment");
            return;
        }
        m_words.clear();
        std::istringstream words(m_line);
        for (std::string word; words >> word;)
            readWord(word);
        if (m_motion >= 0) move();
    }

    void readWord(const std::string& word) {
        static const std::set<std::string> modes = {"G17", "G90", "G91.1", "G94", "G40"};
        static const std::map<std::string, int> motions = {
            {"G0", 0}, {"G1", 1}, {"G2", 2}, {"G3", 3}};
        const auto motion = motions.find(word);
        if (motion != motions.end()) {
            m_motion = motion->second;
        } else if (modes.count(word) > 0) {
            m_modes.insert(word);
        } else if (word == "G20" || word == "G21") {
            m_modes.insert("units");
            m_program.inches = word == "G20";
        } else if (word == "M3" || word == "M5") {
            m_spindle = word == "M3";
        } else if (word == "M2") {
            m_ended = true;
        } else {
            std::size_t used = 0;
            m_words[word[0]] = std::stod(word.substr(1), &used);
            expect(used + 1 == word.size() && std::string("XYZIJFS").find(word[0]) < 7, "a word");
        }
    }

    double valueOf(char letter, double otherwise) const {
        const auto found = m_words.find(letter);
        return found == m_words.end() ? otherwise : found->second;
    }

    void move() {
        GcodeMove move{m_motion, m_place, {}, {}, m_z, valueOf('Z', m_z)};
        move.to = {valueOf('X', m_place.x), valueOf('Y', m_place.y)};
        move.centre = m_place + Vec2{valueOf('I', 0.0), valueOf('J', 0.0)};
        m_feed = valueOf('F', m_feed);
        m_motion = -1;
        m_placed = m_placed || (m_words.count('X') > 0 && m_words.count('Y') > 0);
        expect(m_placed || move.toZ >= m_safeZ, "X and Y before the tool goes down");
        expect(m_modes.size() == 6 && m_spindle, "modes and spindle set");
        expect(std::isfinite(length(move.to) + length(move.centre) + move.toZ), "finite numbers");
        move.kind == 0 ? checkRapid(move) : checkFeed(move);
        if (move.kind >= 2) checkArc(move);
        m_place = move.to;
        m_z = move.toZ;
        m_program.moves.push_back(move);
    }

    void checkRapid(const GcodeMove& move) {
        expect(move.toZ >= move.fromZ, "no rapid move downwards");
        expect(move.from == move.to || move.fromZ >= m_safeZ, "rapid moves at the safe height");
    }

    void checkFeed(const GcodeMove& move) {
        expect(m_feed > 0.0, "a feed");
        expect(move.from == move.to || (move.fromZ < 0.0 && move.toZ == move.fromZ),
               "cuts below the surface");
    }

    void checkArc(const GcodeMove& move) {
        const double difference = distance(move.centre, move.from) - distance(move.centre, move.to);
        expect(std::abs(difference) <= kRadiusTolerance, "both ends on the arc");
        expect(std::abs(sweepOf(move)) <= kPi + 1e-3, "half a circle at most");
    }

    double m_safeZ;
    GcodeProgram m_program;
    std::string m_line;
    std::map<char, double> m_words;
    std::set<std::string> m_modes;
    int m_motion = -1;
    bool m_spindle = false;
    bool m_ended = false;
    Vec2 m_place;
    bool m_placed = false;
    double m_z = 0.0;
    double m_feed = 0.0;
};

}  // namespace

std::vector<Vec2> GcodeMove::points(double step) const {
    const double sweep = kind >= 2 ? sweepOf(*this) : 0.0;
    const Vec2 r = from - centre;
    const double len = kind >= 2 ? std::abs(sweep) * length(r) : distance(from, to);
    const int count = 1 + static_cast<int>(len / step);
    std::vector<Vec2> result;
    for (int i = 0; i <= count; ++i) {
        const double t = static_cast<double>(i) / count;
        const double angle = t * sweep;
        result.push_back(kind >= 2 ? centre + std::cos(angle) * r - std::sin(angle) * rightNormal(r)
                                   : from + t * (to - from));
    }
    return result;
}

GcodeProgram readGcode(const std::string& text, double safeZ) {
    return Reader(safeZ).run(text);
}
