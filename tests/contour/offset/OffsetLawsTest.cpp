#include <gtest/gtest.h>

#include <cmath>
#include <string>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "support/Contours.h"
#include "support/OffsetLaws.h"

namespace {

using namespace offset_laws;

constexpr int kWholeContour = 1000000;
constexpr auto kCcw = GmBase::eRotCCW;
constexpr auto kCw = GmBase::eRotCW;

/// A shape and the distances to offset it by; all of them stay clear of the radii of its arcs and
/// of half its widths, where results are points.
struct Case {
    std::string name;
    GmContour contour;
    std::vector<double> distances;
};

/// Elements one after another; arcs are given by their ends, centre and sense.
class Chain {
public:
    explicit Chain(double x, double y) : m_at(x, y) {}
    Chain& To(double x, double y) { return Add(GmStretch(m_at, GmPoint(x, y))); }
    Chain& Around(double mx, double my, GmBase::eRotDir rot, double x, double y) {
        return Add(GmArc(m_at, GmPoint(x, y), GmPoint(mx, my), rot));
    }
    GmContour const& Get() const { return m_contour; }

private:
    Chain& Add(GmCurve const& curve) {
        EXPECT_TRUE(m_contour.AddElement(curve, false, 0));
        m_at = curve.EP();
        return *this;
    }
    GmPoint m_at;
    GmContour m_contour;
};

GmContour Points(std::vector<std::pair<double, double>> const& points) {
    std::vector<GmPoint> corners;
    for (auto const& p : points)
        corners.emplace_back(p.first, p.second);
    return shapes::Polygon(corners);
}

std::vector<Case> ConvexCases() {
    return {
        {"square", shapes::Square(10), {1, 0.3, 20, -0.3, -4.9}},
        {"rounded", shapes::RoundedRectangle(12, 9, 2), {1, 5, -1.5, -2.5, -4.4}},
        {"slot", shapes::Slot(8, 3), {0.5, 4, -1, -2.9}},
        {"two half circles",
         Chain(5, 0).Around(0, 0, kCcw, -5, 0).Around(0, 0, kCcw, 5, 0).Get(),
         {1, 7, -1, -4.5}},
        {"oval of four centres",
         Chain(10, 0)
             .Around(7, 0, kCcw, 9.4, 1.8)
             .Around(3, -3, kCcw, 3, 5)
             .Around(3, -3, kCcw, -3.4, 1.8)
             .Around(-1, 0, kCcw, -4, 0)
             .To(-4, -8)
             .To(10, -8)
             .To(10, 0)
             .Get(),
         {1, 6, -1, -2.7, -4}},
        {"nearly collinear",
         Points({{0, 0}, {5, -0.002}, {10, 0}, {10.4, 4}, {10.4, 8}, {5, 8.01}, {0, 8}}),
         {1, 3, -1, -3.5}},
    };
}

std::vector<Case> OtherCases() {
    return {
        {"L", Points({{0, 0}, {10, 0}, {10, 4}, {4, 4}, {4, 10}, {0, 10}}), {0.5, 3, -1, -1.9}},
        {"neck",
         Points({{0, 0},
                 {8, 0},
                 {8, 3},
                 {12, 3},
                 {12, 0},
                 {20, 0},
                 {20, 8},
                 {12, 8},
                 {12, 5},
                 {8, 5},
                 {8, 8},
                 {0, 8}}),
         {1, 2.5, -0.7, -1.5, -3.5}},
        {"mouth",
         Points({{0, 0},
                 {12, 0},
                 {12, 5},
                 {9, 5},
                 {9, 3},
                 {3, 3},
                 {3, 9},
                 {9, 9},
                 {9, 7},
                 {12, 7},
                 {12, 12},
                 {0, 12}}),
         {0.6, 1.7, 2.9, 4, -0.6, -1.2}},
        {"notch",
         Chain(0, 0).To(12, 0).To(12, 6).To(7, 6).Around(6, 6, kCw, 5, 6).To(0, 6).To(0, 0).Get(),
         {0.5, 1.5, 4, -0.5, -1.3, -2.2}},
        {"deep notch",
         Chain(0, 0)
             .To(12, 0)
             .To(12, 9)
             .To(7, 9)
             .To(7, 6)
             .Around(6, 6, kCw, 5, 6)
             .To(5, 9)
             .To(0, 9)
             .To(0, 0)
             .Get(),
         {0.5, 0.9, 1.5, -0.5, -2.2}},
        {"kidney",
         Chain(4, 0)
             .Around(7, 0, kCcw, 10, 0)
             .Around(0, 0, kCcw, -10, 0)
             .Around(-7, 0, kCcw, -4, 0)
             .Around(0, 0, kCw, 4, 0)
             .Get(),
         {1, 3.5, 5, -1, -2.9}},
        {"star",
         shapes::Star(
             {{10, 0}, {4, 0}, {10, 0}, {4, 0}, {10, 0}, {4, 0}, {10, 0}, {4, 0}, {10, 0}, {4, 0}}),
         {0.8, 5, -0.8, -2}},
        {"zigzag",
         shapes::Polyline({GmPoint(0, 0), GmPoint(6, 1), GmPoint(7, 8), GmPoint(9, 2),
                           GmPoint(15, 3), GmPoint(16, 10), GmPoint(8, 12)}),
         {0.5, 2, -0.5, -2, 6, -6}},
        {"wave",
         Chain(0, 0)
             .Around(2, 0, kCw, 4, 0)
             .Around(6.5, 0, kCcw, 9, 0)
             .Around(10.5, 0, kCw, 12, 0)
             .To(12, -5)
             .Get(),
         {0.5, 1.8, 3, -0.5, -1.8, -3}},
        {"segment", shapes::Polyline({GmPoint(1, 2), GmPoint(7, 5)}), {1, -1, 9}},
        {"arc", Chain(3, 0).Around(0, 0, kCcw, 0, -3).Get(), {1, -1, -2.5, 4}},
    };
}

std::vector<Case> RandomCases() {
    std::vector<Case> cases;
    for (unsigned seed = 1; seed <= 12; ++seed) {
        cases.push_back({"star of seed " + std::to_string(seed),
                         shapes::RandomStar(seed, seed % 2 == 0),
                         {0.41, 1.3, 4.7, -0.41, -1.3, -3.7}});
    }
    return cases;
}

std::string Where(Case const& c, shapes::Variant const& v, double d) {
    return c.name + ", " + v.name + ", d " + std::to_string(d);
}

/// What must not change from variant to variant, in the measures of the original.
struct Fingerprint {
    size_t count;
    double length;
    double area;
};

Fingerprint FingerprintOf(shapes::Variant const& variant) {
    Fingerprint print{0, 0, 0};
    for (GmContour const* result : Results(variant.contour)) {
        ++print.count;
        print.length += shapes::ChainLength(*result) / variant.scale;
        if (!variant.contour.IsClosed()) continue;
        print.area += std::fabs(Area(*result)) / (variant.scale * variant.scale);
    }
    return print;
}

/// Holds all laws up to each variant of each case; returns how many points were looked at.
int CheckLaws(std::vector<Case> const& cases) {
    int checked = 0;
    for (Case const& c : cases) {
        for (const double d : c.distances) {
            Fingerprint first{0, 0, 0};
            for (auto& v : shapes::Variants(c.contour)) {
                const double offset = v.MapOffset(d);
                v.contour.Offsetting(offset, kWholeContour, false);
                for (Verdict const& verdict :
                     {KeepsDistance(v.contour, offset), MissesNothing(v.contour, offset),
                      IsChained(v.contour)}) {
                    EXPECT_EQ(verdict.fault, "") << Where(c, v, d);
                    checked += verdict.checked;
                }
                // The cap at the end of an open chain belongs to its offset, the one at the start
                // does not.
                if (v.name == "reversed" && !v.contour.IsClosed()) continue;
                const Fingerprint print = FingerprintOf(v);
                if (v.name == "as it is") first = print;
                const double tolerance = 0.001 * (10 + first.length);
                EXPECT_EQ(print.count, first.count) << Where(c, v, d);
                EXPECT_NEAR(print.length, first.length, tolerance) << Where(c, v, d);
                EXPECT_NEAR(print.area, first.area, tolerance) << Where(c, v, d);
                EXPECT_GT(first.count, 0u) << Where(c, v, d);
            }
        }
    }
    return checked;
}

}  // namespace

TEST(OffsetLaws, HoldForConvexShapes) {
    EXPECT_GT(CheckLaws(ConvexCases()), 20000);
}

TEST(OffsetLaws, HoldForShapesWithInnerCornersAndOpenChains) {
    EXPECT_GT(CheckLaws(OtherCases()), 40000);
}

TEST(OffsetLaws, HoldForRandomStars) {
    EXPECT_GT(CheckLaws(RandomCases()), 50000);
}
