#include "support/Contours.h"

#include <cmath>
#include <random>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace shapes {

namespace {

constexpr double kPi = 3.14159265358979323846;

void AddSegment(GmContour& contour, GmPoint const& sp, GmPoint const& ep) {
    contour.AddElement(GmStretch(sp, ep), false, 0);
}

void AddCounterClockwise(GmContour& contour, GmPoint const& sp, GmPoint const& ep,
                         GmPoint const& m) {
    contour.AddElement(GmArc(sp, ep, m, GmBase::eRotCCW), false, 0);
}

void AddSide(GmContour& contour, GmPoint const& sp, GmPoint const& ep, double bulge) {
    if (bulge == 0.0) return AddSegment(contour, sp, ep);
    const GmPoint middle(sp, ep);
    const double dx = ep.X() - sp.X();
    const double dy = ep.Y() - sp.Y();
    const GmPoint top(middle.X() + dy * bulge / 2.0, middle.Y() - dx * bulge / 2.0);
    contour.AddElement(GmArc(sp, top, ep), false, 0);
}

GmPoint Along(GmCurve const& element, int i, int n) {
    if (element.IsArc()) return static_cast<GmArc const&>(element).SectionPoint(i, n);
    return GmPoint(element.SP() + (element.EP() - element.SP()) * (double(i) / n));
}

GmContour Transformed(GmContour const& contour, GmMatrix const& map) {
    GmContour transformed(contour);
    transformed.Transform(map);
    return transformed;
}

}  // namespace

GmContour Polyline(std::vector<GmPoint> const& points) {
    GmContour contour;
    for (size_t i = 1; i < points.size(); ++i)
        AddSegment(contour, points[i - 1], points[i]);
    return contour;
}

GmContour Polygon(std::vector<GmPoint> const& points) {
    GmContour contour = Polyline(points);
    contour.Close(false);
    return contour;
}

GmContour Square(double side) {
    return Polygon({GmPoint(0, 0), GmPoint(side, 0), GmPoint(side, side), GmPoint(0, side)});
}

GmContour Slot(double length, double r) {
    GmContour contour;
    AddSegment(contour, GmPoint(0, 0), GmPoint(length, 0));
    AddCounterClockwise(contour, GmPoint(length, 0), GmPoint(length, 2 * r), GmPoint(length, r));
    AddSegment(contour, GmPoint(length, 2 * r), GmPoint(0, 2 * r));
    AddCounterClockwise(contour, GmPoint(0, 2 * r), GmPoint(0, 0), GmPoint(0, r));
    return contour;
}

GmContour RoundedRectangle(double width, double height, double r) {
    const double w = width;
    const double h = height;
    GmContour contour;
    AddSegment(contour, GmPoint(r, 0), GmPoint(w - r, 0));
    AddCounterClockwise(contour, GmPoint(w - r, 0), GmPoint(w, r), GmPoint(w - r, r));
    AddSegment(contour, GmPoint(w, r), GmPoint(w, h - r));
    AddCounterClockwise(contour, GmPoint(w, h - r), GmPoint(w - r, h), GmPoint(w - r, h - r));
    AddSegment(contour, GmPoint(w - r, h), GmPoint(r, h));
    AddCounterClockwise(contour, GmPoint(r, h), GmPoint(0, h - r), GmPoint(r, h - r));
    AddSegment(contour, GmPoint(0, h - r), GmPoint(0, r));
    AddCounterClockwise(contour, GmPoint(0, r), GmPoint(r, 0), GmPoint(r, r));
    return contour;
}

GmContour Star(std::vector<StarCorner> const& corners) {
    const size_t n = corners.size();
    std::vector<GmPoint> points;
    for (size_t i = 0; i < n; ++i) {
        const double angle = 2.0 * kPi * double(i) / double(n);
        points.emplace_back(corners[i].r * std::cos(angle), corners[i].r * std::sin(angle));
    }
    GmContour contour;
    for (size_t i = 0; i < n; ++i) {
        AddSide(contour, points[i], points[(i + 1) % n], corners[i].bulge);
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

GmPoint Variant::Map(GmPoint const& p) const {
    GmPoint mapped(p);
    mapped.Transform(map);
    return mapped;
}

GmContour StartedAt(GmContour const& contour, int first) {
    const int n = static_cast<int>(contour.ElementCount());
    GmContour turned;
    for (int i = 0; i < n; ++i) {
        turned.AddElement(contour.GetElement((first + i) % n), false, 0);
    }
    return turned;
}

std::vector<Variant> Variants(GmContour const& contour) {
    std::vector<Variant> variants;
    const auto add = [&](std::string const& name, GmMatrix const& map, double scale,
                         bool bMirrors) {
        variants.push_back({name, Transformed(contour, map), map, scale, bMirrors});
    };
    const GmMatrix identity;
    variants.push_back({"as it is", contour, identity, 1.0, false});
    variants.push_back({"reversed", contour.Inverted(), identity, 1.0, true});
    if (contour.IsClosed()) {
        const int middle = static_cast<int>(contour.ElementCount()) / 2;
        variants.push_back({"started elsewhere", StartedAt(contour, middle), identity, 1.0, false});
    }
    add("mirrored", GmMatrix::matrixScale(GmVec(-1, 1, 1)), 1.0, true);
    add("rotated", GmMatrix::matrixRotate(GmVec(0, 0, -1), 33.0), 1.0, false);
    add("moved far", GmMatrix::matrixTranslate(4321.5, -8765.25, 0.0), 1.0, false);
    add("larger", GmMatrix::matrixScale(12.5), 12.5, false);
    add("smaller", GmMatrix::matrixScale(0.25), 0.25, false);
    return variants;
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
        for (int k = 0; k < perElement; ++k) {
            samples.push_back(Along(*contour.GetElement(i), k, perElement - 1));
        }
    }
    return samples;
}

}  // namespace shapes
