// SPDX-License-Identifier: MIT
#include "tests/support/DrawnParts.h"

#include <algorithm>
#include <cmath>

namespace gmregion::shapes {

namespace {

struct Disc {
    Vec2 m;
    double r;
};

Vec2 polar(Vec2 m, double r, double angle) {
    return {m.x + r * std::cos(angle), m.y + r * std::sin(angle)};
}

double bulgeOfTurn(double angle) {
    return std::tan(0.25 * angle);
}

/// Corners of a rectangle about the origin.
std::vector<Vec2> corners(double width, double height) {
    const double x = 0.5 * width;
    const double y = 0.5 * height;
    return {{-x, -y}, {x, -y}, {x, y}, {-x, y}};
}

/// The normal of the common outer tangent that leaves both discs on its left.
Vec2 tangentNormal(const Disc& a, const Disc& b) {
    const Vec2 along = b.m - a.m;
    const double square = dot(along, along);
    const double sine = a.r - b.r;
    const double height = std::sqrt(square - sine * sine);
    return (1.0 / square) * (sine * along + height * rightNormal(along));
}

/// The belt about discs in counter-clockwise order.
Elements belt(const std::vector<Disc>& discs) {
    const std::size_t count = discs.size();
    Elements loop;
    for (std::size_t i = 0; i < count; ++i) {
        const Disc& disc = discs[i];
        const Disc& next = discs[(i + 1) % count];
        const Vec2 in = tangentNormal(discs[(i + count - 1) % count], disc);
        const Vec2 out = tangentNormal(disc, next);
        double turn = std::atan2(cross(in, out), dot(in, out));
        if (turn < 0.0) turn += 2.0 * kPi;
        const Vec2 from = disc.m + disc.r * in;
        const Vec2 to = disc.m + disc.r * out;
        // Above a half circle in two, so that no bulge is above 1.
        if (turn > kPi) {
            const Vec2 top = polar(disc.m, disc.r, std::atan2(in.y, in.x) + 0.5 * turn);
            loop.push_back({from, top, bulgeOfTurn(0.5 * turn)});
            loop.push_back({top, to, bulgeOfTurn(0.5 * turn)});
        } else {
            loop.push_back({from, to, bulgeOfTurn(turn)});
        }
        loop.push_back({to, next.m + next.r * tangentNormal(disc, next), 0.0});
    }
    return loop;
}

Elements slot(Vec2 a, Vec2 b, double r) {
    return belt({{a, r}, {b, r}});
}

/// Base and nose of a cam, with flanks of a larger radius, all tangent to each other.
Elements archedCam(double base, double nose, double height, double flank) {
    const double a = flank - base;
    const double b = flank - nose;
    const double y = (a * a - b * b + height * height) / (2.0 * height);
    const double x = std::sqrt(a * a - y * y);
    const Vec2 right{-x, y};  // centre of the flank on the other side
    const double below = std::atan2(-right.y, -right.x);
    const double above = std::atan2(height - right.y, -right.x);
    const Vec2 low = polar(right, flank, below);
    const Vec2 high = polar(right, flank, above);
    const Vec2 highLeft{-high.x, high.y};
    const Vec2 lowLeft{-low.x, low.y};
    return {{low, high, bulgeOfTurn(above - below)},
            {high, highLeft, bulgeOfTurn(kPi - 2.0 * above)},
            {highLeft, lowLeft, bulgeOfTurn(above - below)},
            {lowLeft, {0.0, -base}, bulgeOfTurn(0.5 * kPi + below)},
            {{0.0, -base}, low, bulgeOfTurn(0.5 * kPi + below)}};
}

/// Teeth with straight flanks; tips and roots are rounded.
Elements gear(int teeth, double inner, double outer, double r) {
    std::vector<Vec2> points;
    const double pitch = 2.0 * kPi / teeth;
    for (int i = 0; i < teeth; ++i) {
        points.push_back(polar({}, inner, (i + 0.05) * pitch));
        points.push_back(polar({}, outer, (i + 0.25) * pitch));
        points.push_back(polar({}, outer, (i + 0.55) * pitch));
        points.push_back(polar({}, inner, (i + 0.75) * pitch));
    }
    return rounded(points, r);
}

void addBolts(DrawnPart& part, int count, double about, double r) {
    for (int i = 0; i < count; ++i)
        part.loops.push_back(circle(polar({}, about, 2.0 * kPi * i / count), r));
}

DrawnPart plate(const char* name, double r) {
    DrawnPart part{name, {rounded(corners(60, 40), r)}, {r, 0.4 * r, 0.3 * r, 20.0}};
    for (const Vec2 m : corners(60 - 2 * r, 40 - 2 * r))
        part.loops.push_back(circle(m, 0.4 * r));
    return part;
}

DrawnPart slottedPlate() {
    DrawnPart part{"plate with slots", {rounded(corners(80, 50), 6)}, {6, 3, 2.5, 10, 25}};
    for (const double x : {-24.0, 0.0, 24.0})
        part.loops.push_back(slot({x - 4, -9}, {x + 4, 9}, 3));
    part.loops.push_back(slot({-30, 19}, {30, 19}, 2.5));
    return part;
}

DrawnPart gasket() {
    DrawnPart part{"gasket", {}, {7, 3, 4, 2, 12}};
    part.loops.push_back(
        belt({{{-35, -20}, 7}, {{35, -20}, 7}, {{42, 8}, 5}, {{0, 24}, 12}, {{-42, 8}, 5}}));
    part.loops.push_back(rounded(corners(44, 20), 4));
    for (const Vec2 m : {Vec2{-35, -20}, Vec2{35, -20}, Vec2{0, 24}})
        part.loops.push_back(circle(m, 3));
    for (const Vec2 m : {Vec2{42, 8}, Vec2{-42, 8}})
        part.loops.push_back(circle(m, 2));
    return part;
}

DrawnPart flange() {
    std::vector<Vec2> waves;
    for (int i = 0; i < 12; ++i)
        waves.push_back(polar({}, i % 2 == 0 ? 40 : 26, kPi * i / 6.0));
    DrawnPart part{"flange with bolts", {rounded(waves, 5), circle({}, 14)}, {5, 14, 2.5, 3.5}};
    addBolts(part, 6, 31, 2.5);
    return part;
}

}  // namespace

Elements rounded(const std::vector<Vec2>& points, double r) {
    const std::size_t count = points.size();
    Elements arcs;
    for (std::size_t i = 0; i < count; ++i) {
        const Vec2 p = points[i];
        const Vec2 in = unit(p - points[(i + count - 1) % count]);
        const Vec2 out = unit(points[(i + 1) % count] - p);
        const double turn = std::atan2(cross(in, out), dot(in, out));
        const double cut = r * std::tan(0.5 * std::fabs(turn));
        arcs.push_back({p - cut * in, p + cut * out, bulgeOfTurn(turn)});
    }
    Elements loop;
    for (std::size_t i = 0; i < count; ++i) {
        loop.push_back(arcs[i]);
        loop.push_back({arcs[i].ep, arcs[(i + 1) % count].sp, 0.0});
    }
    return loop;
}

std::vector<DrawnPart> drawnParts() {
    std::vector<DrawnPart> parts{
        plate("plate, corners of 1", 1),
        plate("plate, corners of 5", 5),
        slottedPlate(),
        {"slot", {slot({-25, 0}, {25, 0}, 8)}, {8, 4}},
        gasket(),
        flange(),
        {"cam with straight flanks", {belt({{{0, 0}, 20}, {{0, 30}, 6}})}, {20, 6, 5}},
        {"cam with arched flanks", {archedCam(20, 6, 26, 60)}, {20, 6, 5}},
        {"gear of 18 teeth", {gear(18, 30, 38, 1), circle({}, 10)}, {1, 10, 20}},
        {"gear of 60 teeth", {gear(60, 94, 100, 0.5), circle({}, 30)}, {0.5, 30, 64}}};
    for (DrawnPart* cam : {&parts[6], &parts[7]})
        cam->loops.push_back(circle({}, 5));
    addBolts(parts[9], 8, 60, 10);
    return parts;
}

DrawnPart regularPolygon(int count) {
    std::vector<Vec2> points;
    for (int i = 0; i < count; ++i)
        points.push_back(polar({}, 50, 2.0 * kPi * i / count));
    return {"polygon of " + std::to_string(count) + " corners",
            {polygon(points)},
            {count > 360 ? 10.0 : 50.0}};
}

double roundingOf(const Drawing& drawing) {
    return std::pow(10.0, -drawing.decimals);
}

std::vector<Elements> drawn(const DrawnPart& part, const Drawing& drawing) {
    const double unit = std::pow(10.0, drawing.decimals);
    const auto round = [&](Vec2 p) {
        return Vec2{std::round(p.x * unit) / unit, std::round(p.y * unit) / unit};
    };
    std::vector<Elements> loops;
    for (const Elements& loop : part.loops) {
        Elements turned = placed(loop, {0, 0}, drawing.degrees * kPi / 180.0);
        for (Element& e : turned)
            e = {round(e.sp), round(e.ep), e.bulge};
        const auto start = static_cast<std::ptrdiff_t>(drawing.start % turned.size());
        std::rotate(turned.begin(), turned.begin() + start, turned.end());
        loops.push_back(std::move(turned));
    }
    return loops;
}

std::size_t startsOf(const DrawnPart& part) {
    std::size_t most = 0;
    for (const Elements& loop : part.loops)
        most = std::max(most, loop.size());
    return most;
}

}  // namespace gmregion::shapes
