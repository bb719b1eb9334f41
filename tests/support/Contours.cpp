// SPDX-License-Identifier: MIT
#include "tests/support/Contours.h"

#include <gtest/gtest.h>

#include <cmath>
#include <random>
#include <sstream>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace shapes {

namespace {

constexpr double kPi = 3.14159265358979323846;

GmPoint ReadPoint(std::istream& words) {
    double x = std::nan("");
    double y = std::nan("");
    words >> x >> y;
    return GmPoint(x, y);
}

GmPoint Along(GmCurve const& element, int i, int n) {
    if (element.IsArc()) return static_cast<GmArc const&>(element).SectionPoint(i, n);
    return GmPoint(element.SP() + (element.EP() - element.SP()) * (double(i) / n));
}

}  // namespace

GmContour Path(std::string const& words) {
    GmContour path;
    std::istringstream input(words);
    GmPoint sp = ReadPoint(input);
    while (input >> std::ws && !input.eof()) {
        std::string sense;
        if (std::isalpha(input.peek())) input >> sense;
        const GmPoint m = sense.empty() ? sp : ReadPoint(input);
        const GmPoint ep = ReadPoint(input);
        const GmArc arc(sp, ep, m, sense == "cw" ? GmBase::eRotCW : GmBase::eRotCCW);
        const GmStretch segment(sp, ep);
        GmCurve const& next = sense.empty() ? static_cast<GmCurve const&>(segment) : arc;
        EXPECT_TRUE(input && path.AddElement(next, false, path.ElementCount() + 1)) << words;
        sp = ep;
    }
    return path;
}

GmContour Square(double side) {
    GmContour square = Path("0 0  1 0  1 1  0 1  0 0");
    square.Transform(GmMatrix::matrixScale(side));
    return square;
}

GmContour Slot() {
    return Path("0 0  8 0  ccw 8 3 8 6  0 6  ccw 0 3 0 0");
}

GmContour RoundedRectangle() {
    return Path(
        "2 0  10 0  ccw 10 2 12 2  12 7  ccw 10 7 10 9  2 9  ccw 2 7 0 7  0 2  ccw 2 2 2 0");
}

GmContour Star(std::vector<StarCorner> const& corners) {
    constexpr double kFlattestBulge = 1e-3;
    const size_t n = corners.size();
    const auto at = [&](size_t i) {
        const double angle = 2.0 * kPi * double(i % n) / double(n);
        return GmPoint(corners[i % n].r * std::cos(angle), corners[i % n].r * std::sin(angle));
    };
    GmContour contour;
    for (size_t i = 0; i < n; ++i) {
        const GmPoint sp = at(i);
        const GmPoint ep = at(i + 1);
        const GmVec side = ep - sp;
        const double bulge = corners[i].bulge;
        const GmVec rise = GmVec(side.Y(), -side.X(), 0) * (bulge / 2.0);
        // Three points that are nearly in line make no arc.
        if (std::fabs(bulge) < kFlattestBulge) {
            contour.AddElement(GmStretch(sp, ep), false, 0);
        } else {
            contour.AddElement(GmArc(sp, GmPoint(sp.Mean(ep) + rise), ep), false, 0);
        }
    }
    return contour;
}

GmContour RandomStar(unsigned seed, bool bWithArcs) {
    std::mt19937 engine(seed);
    // Own mapping to a range: the standard's distributions differ between libraries.
    const auto in = [&engine](double low, double high) {
        return low + (high - low) * (double(engine()) / double(std::mt19937::max()));
    };
    std::vector<StarCorner> corners(5 + engine() % 8);
    for (StarCorner& corner : corners) {
        corner.r = in(6.0, 10.0);
        corner.bulge = bWithArcs && engine() % 2 == 0 ? in(-0.15, 0.15) : 0.0;
    }
    return Star(corners);
}

GmContour StartedAt(GmContour const& contour, int first) {
    const int n = static_cast<int>(contour.ElementCount());
    GmContour turned;
    for (int i = 0; i < n; ++i)
        turned.AddElement(contour.GetElement((first + i) % n), false, 0);
    return turned;
}

GmContour Moved(GmContour contour, double dx, double dy) {
    contour.Translation(GmVec(dx, dy, 0));
    return contour;
}

std::vector<Variant> Variants(GmContour const& contour) {
    const GmMatrix identity;
    std::vector<Variant> variants{{"as it is", contour, identity, 1.0, false},
                                  {"reversed", contour.Inverted(), identity, 1.0, true}};
    if (contour.IsClosed()) {
        const int middle = static_cast<int>(contour.ElementCount()) / 2;
        variants.push_back({"started elsewhere", StartedAt(contour, middle), identity, 1.0, false});
    }
    const auto add = [&](char const* name, GmMatrix const& map, double scale, bool bMirrors) {
        variants.push_back({name, contour, map, scale, bMirrors});
        variants.back().contour.Transform(map);
    };
    add("mirrored", GmMatrix::matrixScale(GmVec(-1, 1, 1)), 1.0, true);
    add("rotated", GmMatrix::matrixRotate(GmVec(0, 0, -1), 33.0), 1.0, false);
    add("moved far", GmMatrix::matrixTranslate(4321.5, -8765.25, 0.0), 1.0, false);
    add("larger", GmMatrix::matrixScale(12.5), 12.5, false);
    add("smaller", GmMatrix::matrixScale(0.25), 0.25, false);
    return variants;
}

std::vector<long> Identifiers(GmContour const& contour) {
    std::vector<long> ids;
    for (int i = 0; i < contour.ElementCount(); ++i)
        ids.push_back(contour.GetContElement(i)->lId);
    return ids;
}

double ChainLength(GmContour const& contour) {
    double length = 0.0;
    for (int i = 0; i < contour.ElementCount(); ++i)
        length += contour.GetElement(i)->Length();
    return length;
}

std::vector<GmPoint> Samples(GmContour const& contour, int perElement) {
    std::vector<GmPoint> samples;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        for (int k = 0; k < perElement; ++k)
            samples.push_back(Along(*contour.GetElement(i), k, perElement - 1));
    }
    return samples;
}

}  // namespace shapes
