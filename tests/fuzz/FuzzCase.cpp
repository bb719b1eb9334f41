// SPDX-License-Identifier: MIT
/// @file
/// Cases out of bytes: a stream of commands, each of a byte that says what it is and some that say
/// how. Most add a corner to the path in hand.
#include "tests/fuzz/FuzzCase.h"

#include <algorithm>
#include <cmath>

#include "region/plane/ElementWinding.h"
#include "tests/fuzz/ByteSource.h"

namespace gmregion::fuzz {

namespace {

constexpr std::size_t kMostElements = 48;  // of a heap
constexpr std::size_t kMostSteps = 6;

/// The steps of the grid, and how far it lies from the origin.
constexpr double kGrids[]{1.0, 0.1, 1e-3, 25.4};
constexpr double kOrigins[]{0.0, -16.0, 1e3, 1e7};

/// A corner of the path in hand, and the bulge from there to the next one.
struct Corner {
    Point at;
    double bulge = 0.0;
    Point next;  ///< where the element that arrives here ends; elsewhere only at a gap
};

class Decoder {
public:
    Decoder(const std::uint8_t* data, std::size_t size) : m_bytes(data, size) {}

    FuzzCase decode() {
        while (!m_bytes.isEmpty())
            command();
        endPath(true);
        return std::move(m_case);
    }

private:
    void command();
    void addCorner(Point at, double bulge);
    void addGap();
    void endPath(bool closed);
    void repeatPath();
    void changeSettings();
    void addStep();
    Point gridPoint();
    Point besideCorner();
    Point onElement();
    double bulge();
    double size();
    OffsetOptions offsetOptions();
    SimplifyOptions simplifyOptions();

    Heap& heap() { return m_case.heaps[m_heap]; }

    ByteSource m_bytes;
    FuzzCase m_case;
    std::size_t m_heap = 0;
    double m_grid = kGrids[0];
    double m_origin = kOrigins[0];
    std::vector<Corner> m_corners;
    std::vector<Point> m_known;  ///< all corners so far
    std::vector<std::vector<Element>> m_paths;
};

void Decoder::command() {
    switch (m_bytes.byte() % 16) {
        case 0:
        case 1:
        case 2:
            return addCorner(gridPoint(), 0.0);
        case 3:
        case 4: {
            const Point at = gridPoint();
            return addCorner(at, bulge());
        }
        case 5: {
            const Point at = gridPoint();
            const double beside = m_bytes.nearZero();
            return addCorner({at.x + beside, at.y}, bulge());
        }
        case 6:
        case 7: {
            const Point at = besideCorner();
            return addCorner(at, bulge());
        }
        case 8: {
            const Point at = onElement();
            return addCorner(at, bulge());
        }
        case 9: {
            const double x = m_bytes.real();
            return addCorner({x, m_bytes.real()}, bulge());
        }
        case 10:
            return endPath(true);
        case 11:
            return endPath(m_bytes.byte() % 8 != 0);
        case 12:
            return repeatPath();
        case 13:
            return m_bytes.byte() % 4 == 0 ? addGap() : changeSettings();
        default:
            return addStep();
    }
}

void Decoder::addCorner(Point at, double bulge) {
    if (heap().paths.elementCount() + m_corners.size() >= kMostElements) return;
    m_corners.push_back({at, bulge, at});
    m_known.push_back(at);
}

/// The element that arrives at the last corner ends beside it.
void Decoder::addGap() {
    if (!m_corners.empty()) m_corners.back().next.y += m_bytes.nearZero();
}

void Decoder::endPath(bool closed) {
    std::vector<Element> path;
    for (std::size_t i = 0; i < m_corners.size(); ++i) {
        const Corner& next = m_corners[(i + 1) % m_corners.size()];
        path.push_back({m_corners[i].at, next.next, m_corners[i].bulge});
    }
    if (!closed && !path.empty()) path.pop_back();
    m_corners.clear();
    if (path.empty()) return;
    // Both heaps have numbers of their own, and none of them is the place of the path in its heap.
    const std::size_t id = 100 * (m_heap + 1) + heap().paths.size();
    heap().paths.add(path, closed, static_cast<std::int64_t>(id));
    m_paths.push_back(std::move(path));
}

/// An earlier path moved, turned, and the other way round, or not so.
void Decoder::repeatPath() {
    endPath(true);
    if (m_paths.empty()) return;
    const std::vector<Element>& path = m_paths[m_bytes.below(m_paths.size())];
    if (heap().paths.elementCount() + path.size() > kMostElements) return;
    const bool reversed = m_bytes.byte() % 2 != 0;
    const Point by{m_bytes.nearZero(), m_bytes.nearZero()};
    const double t = m_bytes.nearZero();
    const double c = (1.0 - t * t) / (1.0 + t * t);
    const double s = 2.0 * t / (1.0 + t * t);
    const Point about = path.front().sp;
    std::vector<Element> copy;
    for (const Element& e : path) {
        const auto placed = [&](Point p) {
            const Point d{p.x - about.x, p.y - about.y};
            return Point{about.x + c * d.x - s * d.y + by.x, about.y + s * d.x + c * d.y + by.y};
        };
        const Element there{placed(e.sp), placed(e.ep), e.bulge};
        copy.push_back(reversed ? Element{there.ep, there.sp, -there.bulge} : there);
    }
    if (reversed) std::reverse(copy.begin(), copy.end());
    const std::size_t id = 100 * (m_heap + 1) + heap().paths.size();
    heap().paths.add(copy, true, static_cast<std::int64_t>(id));
}

void Decoder::changeSettings() {
    endPath(true);
    const std::uint8_t b = m_bytes.byte();
    m_heap = b % 2;
    heap().options.rule = static_cast<FillRule>(b / 2 % 3);
    switch (m_bytes.byte() % 8) {
        case 0:
            m_grid = kGrids[m_bytes.below(4)];
            break;
        case 1:
            m_origin = kOrigins[m_bytes.below(4)];
            break;
        case 2:
            heap().options.tolerance = m_bytes.real();
            break;
        case 3:
            heap().options.tolerance = m_bytes.nearZero();
            break;
        default:
            break;
    }
}

void Decoder::addStep() {
    endPath(true);
    if (m_case.steps.size() == kMostSteps) return;
    Step step;
    step.task = static_cast<Task>(m_bytes.below(kTaskCount));
    const std::uint8_t operands = m_bytes.byte();
    step.first = operands % 16;
    step.second = operands / 16;
    step.size = size();
    if (step.task == Task::kQuestions) step.at = besideCorner();
    if (step.task == Task::kOffset || step.task == Task::kOffsetSeries ||
        step.task == Task::kThicken)
        step.offset = offsetOptions();
    if (step.task == Task::kSimplify || step.task == Task::kSimplifyCurve)
        step.simplify = simplifyOptions();
    m_case.steps.push_back(step);
}

Point Decoder::gridPoint() {
    const double x = m_bytes.onGrid();
    return {m_origin + m_grid * x, m_origin + m_grid * m_bytes.onGrid()};
}

Point Decoder::besideCorner() {
    const std::size_t corner = m_bytes.below(m_known.size());
    const double x = m_bytes.nearZero();
    const double y = m_bytes.nearZero();
    if (m_known.empty()) return {x, y};
    return {m_known[corner].x + x, m_known[corner].y + y};
}

/// A point of an earlier path's element, up to rounding.
Point Decoder::onElement() {
    if (m_paths.empty()) return gridPoint();
    const std::vector<Element>& path = m_paths[m_bytes.below(m_paths.size())];
    const Element& e = path[m_bytes.below(path.size())];
    if (e.bulge != 0.0) return middleOf(e);
    const double t = m_bytes.byte() / 256.0;
    return {e.sp.x + t * (e.ep.x - e.sp.x), e.sp.y + t * (e.ep.y - e.sp.y)};
}

double Decoder::bulge() {
    constexpr double kQuarter = 0.41421356237309505;
    const std::uint8_t b = m_bytes.byte();
    const double sign = b / 8 % 2 == 0 ? 1.0 : -1.0;
    switch (b % 8) {
        case 0:
            return 0.0;
        case 1:
            return sign;
        case 2:
            return sign * kQuarter;
        case 3:
            return sign * (b / 16) / 4.0;
        case 4:
            return std::ldexp(sign, -4 * (b / 16));
        case 5:
            return sign / kQuarter;
        case 6:
            return sign * (kQuarter + m_bytes.nearZero());
        default:
            return m_bytes.real();
    }
}

/// A length: in steps of the grid, any, or such that parallels touch.
double Decoder::size() {
    const std::uint8_t kind = m_bytes.byte();
    const double sign = kind / 4 % 2 == 0 ? 1.0 : -1.0;
    switch (kind % 4) {
        case 0:
            return sign * m_grid * m_bytes.onGrid();
        case 1:
            return sign * m_grid * m_bytes.nearZero();
        case 2:
            return m_bytes.real();
        default:
            break;
    }
    if (m_known.empty()) return 0.0;
    const Point a = m_known[m_bytes.below(m_known.size())];
    const Point b = m_known[m_bytes.below(m_known.size())];
    return 0.5 * sign * std::hypot(b.x - a.x, b.y - a.y) + m_bytes.nearZero();
}

OffsetOptions Decoder::offsetOptions() {
    OffsetOptions options;
    const std::uint8_t b = m_bytes.byte();
    options.join = static_cast<Join>(b % 3);
    options.end = static_cast<End>(b / 3 % 3);
    if (b / 9 % 4 == 0) options.miterLimit = m_bytes.real();
    if (b / 9 % 4 == 1) options.miterLimit = 1.0 + m_bytes.onGrid();
    return options;
}

SimplifyOptions Decoder::simplifyOptions() {
    SimplifyOptions options;
    const std::uint8_t b = m_bytes.byte();
    if (b % 4 == 0) options.corner = m_bytes.byte() / 256.0;
    if (b % 4 == 1) options.smooth = std::fabs(m_bytes.nearZero());
    if (b == 255) options.corner = m_bytes.real();
    return options;
}

}  // namespace

FuzzCase decode(const std::uint8_t* data, std::size_t size) {
    return Decoder(data, size).decode();
}

}  // namespace gmregion::fuzz
