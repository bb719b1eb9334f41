// SPDX-License-Identifier: MIT
#include "tests/kernel/contour/offset/PlainOffsetting.h"

#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>
#include <ostream>
#include <random>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContElement.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

namespace {

/// Everything that results must have in common, digit by digit.
std::vector<double> Digits(GmContour const& contour) {
    std::vector<double> digits{double(contour.IsClosed())};
    for (int i = 0; i < contour.ElementCount(); ++i) {
        GmContElement const& e = *contour.GetContElement(i);
        digits.insert(digits.end(), {double(e.lId), double(e.lIndex), double(e.bInserted)});
        std::vector<GmPoint> points{e.pCurve->SP(), e.pCurve->EP()};
        if (e.pCurve->IsArc()) {
            GmArc const& arc = static_cast<GmArc const&>(*e.pCurve);
            points.push_back(arc.M());
            digits.insert(digits.end(), {arc.R(), arc.SAng(), arc.EAng(), double(arc.Dir())});
        }
        for (GmPoint const& p : points)
            digits.insert(digits.end(), {p.X(), p.Y(), p.Z()});
    }
    return digits;
}

/// Results that both forms of the algorithm agree on, -1 when they differ.
int AgreedResults(GmContour& source, double d, int nSpan, bool bKeepOpen) {
    const auto plain = PlainOffsetting(source, d, nSpan, bKeepOpen);
    const int count = source.Offsetting(d, nSpan, bKeepOpen);
    if (count != static_cast<int>(plain.size())) return -1;
    for (int i = 0; i < count; ++i) {
        if (Digits(*plain[size_t(i)]) != Digits(*source.GetSubContour(i))) return -1;
    }
    return count;
}

/// Chains without any regard for sense: on a grid, where ends, tangents and distances coincide, or
/// beside it by anything from 1e-9 to 1; crossing themselves; with elements of no length, arcs of
/// the radius of the distance, and all far from the origin at times.
class WildChain {
public:
    explicit WildChain(unsigned seed) : m_engine(seed), m_onGrid(Chance(3)) {
        m_at = Chance(4) ? GmPoint(1e5, -3e4) : GmPoint(0, 0);
    }

    GmContour Make() {
        const int n = 1 + Below(9);
        for (int i = 0; i < n; ++i) {
            if (Chance(2)) {
                AddSegment();
            } else {
                AddArc();
            }
        }
        if (Chance(2)) m_contour.Close(false);
        return std::move(m_contour);
    }

    double Distance() { return (Chance(2) ? 1 : -1) * (1 + Below(4)) * Factor(); }
    int Span() { return Chance(2) ? 1000000 : Below(12) - 1; }
    bool Chance(int n) { return Below(n) == 0; }

private:
    int Below(int n) { return static_cast<int>(m_engine() % static_cast<unsigned>(n)); }
    double Noise() {
        return Chance(2) ? 0 : std::pow(10.0, -Below(10)) * (2.0 * Below(1000) / 999 - 1);
    }
    double Factor() { return m_onGrid ? 1 : 0.5 + Below(1000) / 500.0; }
    GmPoint Beside(double x, double y) {
        if (m_onGrid) return GmPoint(m_at.X() + x, m_at.Y() + y);
        return GmPoint(m_at.X() + x + Noise(), m_at.Y() + y + Noise());
    }
    void Add(GmCurve const& curve) {
        if (m_contour.AddElement(curve, false, Below(5))) m_at = curve.EP();
    }
    void AddSegment() { Add(GmStretch(m_at, Beside(Below(13) - 6, Below(13) - 6))); }
    void AddArc() {
        const GmPoint m = Beside(Below(7) - 3, Below(7) - 3);
        const double sweep = (1 + Below(8)) * std::acos(0.0) / 2 + Noise();
        const GmVec r = m_at - m;
        const GmPoint ep(m.X() + r.X() * std::cos(sweep) - r.Y() * std::sin(sweep),
                         m.Y() + r.X() * std::sin(sweep) + r.Y() * std::cos(sweep));
        Add(GmArc(m_at, ep, m, Chance(2) ? GmBase::eRotCW : GmBase::eRotCCW));
    }

    std::mt19937 m_engine;
    bool m_onGrid;
    GmPoint m_at;
    GmContour m_contour;
};

/// Segments to and fro along an axis, on it or beside it by 1e-9 to 1e-4, and at last away from it:
/// their bands are cut next to joints, where angles and lines are taken for those of the axis.
GmContour AlongAnAxis(std::mt19937& engine) {
    const auto unit = [&engine] { return double(engine()) / double(std::mt19937::max()); };
    const double axis = double(engine() % 4) * std::acos(0.0);
    GmContour chain;
    GmPoint at(0, 0);
    const int n = 3 + static_cast<int>(engine() % 5);
    for (int i = 1; i <= n; ++i) {
        const double side = engine() % 2 == 0 ? 1.0 : -1.0;
        const double back = engine() % 3 == 0 ? std::acos(-1.0) : 0.0;
        const double beside = engine() % 2 == 0 ? 0.0 : std::pow(10.0, -4.0 - 5.0 * unit());
        const double turn = i < n ? side * beside : side;
        const double length = 6.0 * std::pow(10.0, -2.0 * unit());
        const GmDir towards(GmAngle(axis + back + turn, true));
        const GmPoint to(at + length * GmVec(towards));
        chain.AddElement(GmStretch(at, to), false, i);
        at = to;
    }
    return chain;
}

}  // namespace

TEST(PlainOffsetting, GivesTheSameDigitsOnContours) {
    int results = 0;
    for (unsigned seed = 0; seed < 12; ++seed) {
        for (auto& variant : shapes::Variants(shapes::RandomStar(seed, seed % 3 != 0))) {
            for (const double d : {1.0, -0.4, -2.5, 7.0}) {
                const int span = seed % 2 == 0 ? 1000000 : 3;
                const int agreed =
                    AgreedResults(variant.contour, variant.MapOffset(d), span, false);
                EXPECT_GE(agreed, 0) << "seed " << seed << ", " << variant.name << ", d " << d;
                results += agreed;
            }
        }
    }
    EXPECT_GT(results, 300);
}

TEST(PlainOffsetting, GivesTheSameDigitsOnWildChains) {
    int results = 0;
    EXPECT_TRUE(rc::check([&results] {
        const unsigned seed = *rc::gen::inRange(0u, 1000000u);
        for (unsigned i = 0; i < 5; ++i) {
            WildChain wild(seed * 5 + i);
            GmContour chain = wild.Make();
            const double d = wild.Distance();
            const int span = wild.Span();
            const int agreed = AgreedResults(chain, d, span, wild.Chance(2));
            RC_LOG() << "chain " << seed * 5 + i << ", d " << d << ", span " << span << "\n";
            RC_ASSERT(agreed >= 0);
            results += agreed;
        }
    }));
    EXPECT_GT(results, 300);
}

TEST(PlainOffsetting, GivesTheSameDigitsAlongAnAxis) {
    std::mt19937 engine(1);
    int results = 0;
    for (int i = 0; i < 3000; ++i) {
        GmContour chain = AlongAnAxis(engine);
        const double d = std::pow(10.0, double(engine() % 3000) / 1500.0 - 0.8);
        const int agreed = AgreedResults(chain, engine() % 2 == 0 ? d : -d, 1000000, true);
        ASSERT_GE(agreed, 0) << "chain " << i << ", d " << d;
        results += agreed;
    }
    EXPECT_GT(results, 1000);
}
