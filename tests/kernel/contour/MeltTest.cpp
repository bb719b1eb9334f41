// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>
#include <string>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"
#include "tests/support/OffsetLaws.h"

namespace {

using offset_laws::Area;
using shapes::Path;

/// Areas of the sub-contours in order.
std::vector<double> SubAreas(GmContour const& contour) {
    std::vector<double> areas;
    for (int i = 0; GmContour const* sub = contour.GetSubContour(i); ++i) {
        EXPECT_TRUE(sub->IsClosed());
        areas.push_back(Area(*sub));
    }
    return areas;
}

GmContour Inverted(GmContour contour) {
    contour.Invert();
    return contour;
}

/// A convex contour about (x, y): a polygon on a circle, every other side an arc of that circle.
GmContour ConvexAt(double x, double y, double r, int sides, double turn) {
    GmContour contour;
    const GmPoint m(x, y);
    const auto at = [&](int i) {
        const double angle = turn + 2 * M_PI * (i % sides) / sides;
        return GmPoint(x + r * std::cos(angle), y + r * std::sin(angle));
    };
    for (int i = 0; i < sides; ++i) {
        const GmArc arc(at(i), at(i + 1), m, GmBase::eRotCCW);
        const GmStretch side(at(i), at(i + 1));
        GmCurve const& element = i % 2 ? static_cast<GmCurve const&>(arc) : side;
        EXPECT_TRUE(contour.AddElement(element, false, i));
    }
    return contour;
}

/// A comb with teeth 4 wide and 10 high, 2 apart, upwards from a spine 3 high.
GmContour Comb(int teeth) {
    const std::string width = std::to_string(6 * teeth - 2);
    std::string words = "0 -3  " + width + " -3";
    for (int i = teeth - 1; i >= 0; --i) {
        const std::string left = std::to_string(6 * i);
        const std::string right = std::to_string(6 * i + 4);
        words += "  " + right + " 0  " + right + " 10  " + left + " 10  " + left + " 0";
    }
    return Path(words + "  0 -3");
}

/// Does a crossing come so near to a joint that it may be taken for it?
bool CrossNearJoints(GmContour const& a, GmContour const& b) {
    a.Intersection(&b, true);
    for (GmPoint const& p : a.GetPtSol()) {
        for (GmContour const* contour : {&a, &b}) {
            for (int i = 0; i < contour->ElementCount(); ++i) {
                if (contour->GetElement(i)->SP().Dist(p) < 0.01) return true;
            }
        }
    }
    return false;
}

}  // namespace

TEST(Melting, OutlineAndCommonPartHaveTheAreasOfBothContours) {
    EXPECT_TRUE(rc::check([] {
        const double turn = *rc::gen::inRange(1, 90) / 57.0;
        const double x = *rc::gen::inRange(40, 101) / 10.0;
        GmContour a = ConvexAt(3, -2, 8, *rc::gen::inRange(5, 12), 0.0123);
        GmContour b = ConvexAt(3 + x * std::cos(turn), -2 + x * std::sin(turn), 5,
                               *rc::gen::inRange(5, 12), turn);
        RC_PRE(!CrossNearJoints(a, b));
        RC_ASSERT(a.MeltContours(&b, true) == 2);
        const std::vector<double> areas = SubAreas(a);
        RC_ASSERT(std::fabs(areas[0] + areas[1] - Area(a) - Area(b)) < 1e-6);
        RC_ASSERT(std::max(areas[0], areas[1]) > std::max(Area(a), Area(b)));
        // Run against each other the boundaries give the differences, each in its own sense.
        GmContour reversed = Inverted(b);
        const int count = a.SplitContours(&reversed);
        const double common = std::min(areas[0], areas[1]);
        double parts = 0.0;
        int positive = 0;
        for (const double area : SubAreas(a)) {
            parts += area;
            positive += area > 0.0 ? 1 : 0;
        }
        RC_ASSERT(std::fabs(parts - (Area(a) - common) + (Area(b) - common)) < 1e-6);
        RC_ASSERT(count > positive);
        RC_ASSERT(a.MeltContours(&reversed, true) == positive);
    }));
}

TEST(Melting, ABarAcrossALongCombHasALoopForEveryToothAndEverySlot) {
    constexpr int kTeeth = 150;
    GmContour comb = Comb(kTeeth);
    GmContour bar = Path("-5 4  1000 4  1000 6  -5 6  -5 4");
    const double both = Area(comb) + Area(bar);
    for (GmContour* const first : {&comb, &bar}) {
        GmContour* const second = first == &comb ? &bar : &comb;
        EXPECT_EQ(first->SplitContours(second), 2 * kTeeth);
        int teeth = 0;
        int slots = 0;  // 2 wide, between the bar and the spine 4 high
        double sum = 0.0;
        for (const double area : SubAreas(*first)) {
            sum += area;
            teeth += std::fabs(area - 8.0) < 1e-9 ? 1 : 0;
            slots += std::fabs(area + 8.0) < 1e-9 ? 1 : 0;
        }
        EXPECT_EQ(teeth, kTeeth);
        EXPECT_EQ(slots, kTeeth - 1);
        EXPECT_NEAR(sum, both, 1e-6);
        EXPECT_EQ(first->MeltContours(second, true), kTeeth + 1);
    }
}

TEST(Melting, AnswersContoursThatDoNotMelt) {
    GmContour square = shapes::Square(10);
    GmContour apart = shapes::Moved(square, 20, 0);
    GmContour open = Path("5 5  15 5  15 15");
    GmContour overlapping = shapes::Moved(square, 5, 5);
    EXPECT_EQ(square.MeltContours(&overlapping, true), 2);
    EXPECT_EQ(square.MeltContours(&open, true), -1);
    EXPECT_EQ(open.SplitContours(&square), -1);
    EXPECT_EQ(square.MeltContours(nullptr, true), -1);
    EXPECT_NE(square.GetSubContour(1), nullptr) << "a refusal changes nothing";
    GmContour twin(*square.GetSubContour(0));
    GmContour other(square);
    EXPECT_EQ(square.MeltContours(square.GetSubContour(0), true), other.MeltContours(&twin, true));
    EXPECT_EQ(square.MeltContours(&apart, true), 0);
    EXPECT_EQ(square.GetSubContour(0), nullptr);
    EXPECT_EQ(square, shapes::Square(10));
    EXPECT_GE(square.MeltContours(&square, true), 0) << "with itself";
}

TEST(Splitting, PutsAJointWhereThePointLies) {
    GmContour slot = shapes::Slot();
    const double length = shapes::ChainLength(slot);
    EXPECT_FALSE(slot.SplitAt(GmPoint(4, 1)));
    EXPECT_FALSE(slot.GetLastInsertPoint().CreationOK());
    EXPECT_TRUE(slot.SplitAt(GmPoint(11, 3)));
    EXPECT_EQ(slot.GetLastInsertPoint(), GmPoint(11, 3));
    EXPECT_EQ(shapes::Identifiers(slot), (std::vector<long>{1, 2, 2, 3, 4}));
    EXPECT_TRUE(slot.GetContElement(2)->bInserted && slot.GetContElement(2)->lIndex == 1);
    EXPECT_TRUE(slot.SplitAt(GmPoint(8, 0)));
    EXPECT_EQ(slot.ElementCount(), 5) << "a joint stays one";
    EXPECT_TRUE(slot.IsClosed());
    EXPECT_NEAR(shapes::ChainLength(slot), length, 1e-12);

    GmLine across(GmPoint(2, 0), GmDir(0, 1));
    EXPECT_TRUE(slot.SplitAt(&across));
    EXPECT_EQ(slot.ElementCount(), 7);
    EXPECT_TRUE(slot.SplitAtMinDist(GmPoint(6, -5)));
    EXPECT_EQ(slot.GetLastInsertPoint(), GmPoint(6, 0));
    GmContour other = shapes::Moved(shapes::Square(4), 3, 12);
    EXPECT_TRUE(slot.SplitBothAtMinDist(&other));
    EXPECT_FALSE(slot.SplitBothAtMinDist(nullptr));
    EXPECT_FALSE(GmContour().SplitAtMinDist(GmPoint(6, -5), GmPoint(0, 0)));
    EXPECT_NEAR(shapes::ChainLength(slot), length, 1e-12);
}
