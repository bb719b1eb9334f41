// SPDX-License-Identifier: MIT
#include "gmbridge/ContourPaths.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <memory>

#include "gmbridge/Curves.h"
#include "gmbridge/SetContours.h"
#include "gmkernel/gmkernel.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Questions.h"
#include "tests/support/Contours.h"
#include "tests/support/OffsetLaws.h"

namespace {

using namespace gmbridge;

constexpr double kPi = 3.14159265358979323846;

GmContour circle(GmPoint const& m, double r, GmBase::eRotDir rot) {
    const GmPoint sp(m.X() + r, m.Y());
    GmContour contour;
    contour.AddElement(GmArc(sp, sp, m, rot), false, 1);
    return contour;
}

/// The regions of one contour, on whichever side it has them.
gmregion::RegionSet regionOf(const ContourPaths& paths) {
    const gmregion::Outcome outcome = gmregion::cleanUp(paths.paths());
    EXPECT_FALSE(outcome.refusal) << gmregion::textOf(outcome.refusal.reason);
    return outcome.regions;
}

void expectSamePlace(const GmPoint& a, const GmPoint& b) {
    EXPECT_LT(a.Dist(b), 1e-9) << a.GetTraceString() << ", " << b.GetTraceString();
}

/// Ends, kind, sense, sweep and identifier.
void expectSameElement(const GmContElement& a, const GmContElement& b) {
    EXPECT_EQ(a.lId, b.lId);
    expectSamePlace(a.pCurve->SP(), b.pCurve->SP());
    expectSamePlace(a.pCurve->EP(), b.pCurve->EP());
    ASSERT_EQ(a.pCurve->IsArc(), b.pCurve->IsArc());
    if (!a.pCurve->IsArc()) return;
    const auto& arc = static_cast<const GmArc&>(*a.pCurve);
    const auto& other = static_cast<const GmArc&>(*b.pCurve);
    EXPECT_EQ(arc.Dir(), other.Dir());
    expectSamePlace(arc.M(), other.M());
    EXPECT_NEAR(arc.R(), other.R(), 1e-9);
    EXPECT_NEAR(arc.Ang2Pi(), other.Ang2Pi(), 1e-7);
}

/// Takes a contour to a set and back, and compares the elements from the lowest identifier on.
void expectRoundTrip(const GmContour& contour) {
    ContourPaths paths;
    ASSERT_FALSE(paths.add(contour));
    const auto sense = offset_laws::Area(contour) < 0.0 ? GmBase::eRotCW : GmBase::eRotCCW;
    const SetContours back = contoursOf(regionOf(paths), paths, sense);
    EXPECT_TRUE(back.closedUp.empty());
    EXPECT_TRUE(back.lost.empty());
    ASSERT_EQ(back.loops.size(), 1U);
    const GmContour& result = *back.loops.front().contour;
    EXPECT_EQ(result.IsClosed(), contour.IsClosed());
    const auto count = static_cast<int>(contour.ElementCount());
    ASSERT_EQ(result.ElementCount(), count);
    int first = 0;
    while (contour.GetContElement(first)->lId != result.GetContElement(0)->lId)
        ++first;
    for (int i = 0; i < count; ++i)
        expectSameElement(*contour.GetContElement((first + i) % count), *result.GetContElement(i));
    EXPECT_EQ(result.GetContElement(0)->lId, 1);
}

TEST(ContourPaths, RoundTripKeepsElements) {
    const GmContour contours[] = {
        shapes::Square(10),
        shapes::Slot(),
        shapes::RoundedRectangle(),
        shapes::Path("3 0  ccw 0 0 -3 0  ccw 0 0 3 0"),               // a circle of two halves
        shapes::Path("3 1  ccw 0 1 0 4  cw -1 4 -2 4  ccw 0 1 3 1"),  // bulges of both senses
        shapes::Path("2.4 0.7  ccw 0 0 2.4 -0.7  2.4 0.7"),           // more than 300 degrees
        circle(GmPoint(40, -3), 5, GmBase::eRotCCW),
    };
    for (const GmContour& contour : contours) {
        SCOPED_TRACE(shapes::ChainLength(contour));
        // Copies have no identifiers, so that they are given anew.
        for (const bool reversed : {false, true}) {
            GmContour source;
            for (int i = 0; i < contour.ElementCount(); ++i)
                source.AddElement(*contour.GetElement(i), false, i + 1);
            if (reversed) source.Invert();
            expectRoundTrip(source);
        }
    }
}

TEST(ContourPaths, ArcsOfAnySweepKeepTheirPoints) {
    int compared = 0;
    for (const double sweep : {1e-7, 1e-3, 0.5, kPi, 4.0, 5.2, 5.3, 6.2, 6.283, 2.0 * kPi}) {
        for (const auto rot : {GmBase::eRotCW, GmBase::eRotCCW}) {
            const double r = 300.0;
            const double start = 1.2;
            const double end = sweep == 2.0 * kPi ? start : start + rot * sweep;
            const GmArc arc(GmPoint(100, -70), r, start, end, rot);
            GmContour contour;
            ASSERT_TRUE(contour.AddElement(arc, false, 5));
            ContourPaths paths;
            ASSERT_FALSE(paths.add(contour));
            const gmregion::PathView path = paths.paths()[0];
            EXPECT_EQ(path.closed, sweep == 2.0 * kPi);
            EXPECT_EQ(path.size(), sweep > 5.236 ? 2U : 1U);
            double turned = 0.0;
            for (const gmregion::Element& e : path) {
                turned += 4.0 * std::atan(e.bulge);
                const auto curve = curveOf(e);
                const auto* const back = dynamic_cast<const GmArc*>(curve.get());
                ASSERT_NE(back, nullptr) << sweep;
                // The kernel's own circle, off by the rounding of the chord.
                EXPECT_NEAR(back->R(), r, 1e-13 * r / sweep);
                ++compared;
            }
            EXPECT_NEAR(turned, rot * sweep, 1e-13);
        }
    }
    EXPECT_EQ(compared, 28);
}

TEST(ContourPaths, JointsWithinTheToleranceAreClosed) {
    GmContour contour;
    ASSERT_TRUE(contour.AddElement(GmStretch(GmPoint(0, 0), GmPoint(10, 0)), false, 1));
    ASSERT_TRUE(
        contour.AddElement(GmStretch(GmPoint(10.00009, 0.00009), GmPoint(10, 10)), false, 2));
    ASSERT_TRUE(contour.AddElement(
        GmArc(GmPoint(9.99991, 10), GmPoint(0.00009, -0.00009), GmPoint(5, 5), GmBase::eRotCCW),
        false, 3));
    ASSERT_TRUE(contour.IsClosed());
    ContourPaths paths;
    ASSERT_FALSE(paths.add(contour));
    const gmregion::PathView path = paths.paths()[0];
    ASSERT_EQ(path.size(), 3U);
    EXPECT_TRUE(path.closed);
    for (std::size_t i = 0; i < path.size(); ++i)
        EXPECT_EQ(path.first[i].ep, path.first[(i + 1) % path.size()].sp) << i;
    EXPECT_NEAR(gmregion::area(regionOf(paths)), offset_laws::Area(contour), 0.003);
}

TEST(ContourPaths, OpenContoursStayOpen) {
    ContourPaths paths;
    ASSERT_FALSE(paths.add(shapes::Path("0 0  10 0  ccw 10 5 10 10")));
    ASSERT_FALSE(paths.add(shapes::Square(1)));
    ASSERT_EQ(paths.paths().size(), 2U);
    EXPECT_FALSE(paths.paths()[0].closed);
    EXPECT_TRUE(paths.paths()[1].closed);
    EXPECT_EQ(paths.paths()[1].id, 1);
}

struct Refused {
    Reason reason;
    long element;
    std::unique_ptr<GmContour> contour;
};

/// A side, and a curve behind it.
std::unique_ptr<GmContour> sideAnd(const GmCurve& curve) {
    auto contour = std::make_unique<GmContour>();
    contour->AddElement(GmStretch(GmPoint(5, 0), GmPoint(0, 0)), false, 1);
    EXPECT_TRUE(contour->AddElement(curve, false, 2));
    return contour;
}

TEST(ContourPaths, RefusesWhatIsNoChainOfSegmentsAndArcs) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    std::vector<Refused> cases;
    cases.push_back({Reason::kUndefined, 0, std::make_unique<GmContour>()});
    cases.push_back({Reason::kUndefined, 0, std::make_unique<GmContour>(GmApprDepData{})});
    const GmPoint o(0, 0);
    const GmPoint m(1, 0);
    cases.push_back({Reason::kElement, 1, sideAnd(GmHelix(o, GmPoint(2, 0), m, GmBase::eRotCW))});
    cases.push_back({Reason::kElement, 1, sideAnd(GmArc())});
    cases.push_back({Reason::kElement, 1, sideAnd(GmStretch())});
    cases.push_back({Reason::kElement, 1, sideAnd(GmArc(o, GmPoint(2, 0), m, GmBase::eRotNone))});
    cases.push_back({Reason::kElement, 1, sideAnd(GmStretch(o, GmPoint(nan, 0)))});
    cases.push_back({Reason::kElement, 1, sideAnd(GmLine(o, GmPoint(2, 0)))});
    cases.push_back({Reason::kGap, 1, std::make_unique<GmContour>(shapes::Square(4))});
    cases.back().contour->RemoveElement(1);
    cases.push_back({Reason::kGap, 0, std::make_unique<GmContour>(shapes::Square(4))});
    cases.back().contour->RemoveElement(3);

    ContourPaths paths;
    ASSERT_FALSE(paths.add(shapes::Square(4)));
    for (std::size_t i = 0; i < cases.size(); ++i) {
        SCOPED_TRACE(i);
        const Refusal refusal = paths.add(*cases[i].contour);
        EXPECT_EQ(refusal.reason, cases[i].reason) << textOf(refusal);
        EXPECT_EQ(refusal.element, cases[i].element);
        EXPECT_EQ(refusal.contour, 1U);
        EXPECT_EQ(paths.paths().size(), 1U);
        EXPECT_EQ(paths.paths().elementCount(), 4U);
    }
}

}  // namespace
