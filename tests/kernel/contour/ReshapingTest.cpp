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

/// Corner rounding, arc splitting and variable parallels: operations that go over all elements.
namespace {

using shapes::Path;

struct OpenContour : GmContour {
    using GmContour::operator=;
    using GmContour::SplitArcs;
    using GmContour::SplitArcsQuadrant;
};

int Arcs(GmContour const& contour) {
    int count = 0;
    for (int i = 0; i < contour.ElementCount(); ++i)
        count += contour.GetElement(i)->IsArc() ? 1 : 0;
    return count;
}

bool IsContinuous(GmContour const& contour) {
    for (int i = 1; i < contour.ElementCount(); ++i) {
        if (contour.GetElement(i)->SP() != contour.GetElement(i - 1)->EP()) return false;
    }
    return true;
}

void ExpectSmoothArcs(GmContour const& contour, double radius) {
    const int count = static_cast<int>(contour.ElementCount());
    for (int i = 0; i < count; ++i) {
        if (!contour.GetContElement(i)->bInserted) continue;
        EXPECT_EQ(static_cast<GmArc const&>(*contour.GetElement(i)).R(), radius);
        EXPECT_EQ(contour.GetElement(i)->TangSP(),
                  contour.GetElement((i + count - 1) % count)->TangEP());
        EXPECT_EQ(contour.GetElement(i)->TangEP(), contour.GetElement((i + 1) % count)->TangSP());
    }
}

GmContour LShape() {
    return Path("0 0  10 0  10 4  ccw 7 4 7 7  4 7  4 10  0 10  0 0");
}

}  // namespace

TEST(CornerRounding, RoundsTheCornersThatTurnAsAskedFor) {
    for (shapes::Variant const& v : shapes::Variants(LShape())) {
        SCOPED_TRACE(v.name);
        struct {
            int nMode, inserted;
        } const table[] = {{-1, 4}, {0, 5}, {1, 1}};
        for (auto const& c : table) {
            GmContour contour = v.contour;
            contour.RoundCorners(0.5 * v.scale, c.nMode);
            EXPECT_EQ(contour.ElementCount(), 7 + c.inserted) << c.nMode;
            EXPECT_TRUE(contour.IsClosed() && IsContinuous(contour));
            ExpectSmoothArcs(contour, 0.5 * v.scale);
        }
    }
    GmContour tooWide = shapes::Square(2);
    tooWide.RoundCorners(3, 0);
    EXPECT_EQ(tooWide, shapes::Square(2));
    GmContour open = Path("0 0  10 0  20 0  20 10  30 10");
    open.RoundCorners(1, -1);
    EXPECT_EQ(open, Path("0 0  10 0  19 0  ccw 19 1 20 1  20 9  cw 21 9 21 10  30 10"));
    EXPECT_EQ(open.GetContElement(3)->lId, 3) << "a fillet is named by its place";
}

TEST(ArcSplitting, CutsWhereArcsCrossTheAxes) {
    EXPECT_TRUE(rc::check([] {
        const auto rot = *rc::gen::arbitrary<bool>() ? GmBase::eRotCW : GmBase::eRotCCW;
        const int from = *rc::gen::inRange(-11, 12);
        const int sweep = *rc::gen::inRange(1, 24);
        const double start = from * M_PI / 12;
        OpenContour contour;
        contour.AddElement(GmArc(GmPoint(1, 2), 5.0, start, start + rot * sweep * M_PI / 12, rot),
                           false, 7);
        const double length = shapes::ChainLength(contour);
        int axes = 0;
        for (int step = 1; step < sweep; ++step)
            axes += (from + rot * step) % 6 == 0 ? 1 : 0;
        RC_ASSERT(contour.SplitArcsQuadrant());
        RC_ASSERT(contour.ElementCount() == 1 + axes);
        RC_ASSERT(IsContinuous(contour));
        RC_ASSERT(std::fabs(shapes::ChainLength(contour) - length) < 1e-9);
        RC_ASSERT(contour.GetContElement(axes)->lId == 7);
        RC_ASSERT(contour.GetContElement(axes)->lIndex == 0);
    }));
    OpenContour contour;
    contour = Path("0 0  10 0  ccw 5 0 0 0");
    EXPECT_TRUE(contour.SplitArcs(GmDir(0, 1), true)) << "the other side is not on the arc";
    EXPECT_EQ(contour, Path("0 0  10 0  ccw 5 0 5 5  ccw 5 0 0 0"));
    OpenContour wide;
    wide.AddElement(GmArc(GmPoint(0, 0), 5, -2.5, 2.5, GmBase::eRotCCW), false, 7);
    wide.SplitArcs(GmDir(0, 1), true);
    ASSERT_EQ(wide.ElementCount(), 3) << "the opposite point lies before the first one";
    EXPECT_EQ(wide.GetElement(1)->SP(), GmPoint(0, -5));
    EXPECT_TRUE(IsContinuous(wide));
}

TEST(VarParallels, WithEqualDistancesMoveEverySideByTheDistance) {
    for (const double d : {1.0, -1.0}) {
        GmContour shape = Path("0 0  20 0  20 12  12 12  12 5  8 5  8 12  0 12  0 0");
        ASSERT_EQ(shape.VarParallelContours(GmVec(d, d, 0)), 1);
        const double area = offset_laws::Area(*shape.GetSubContour(0));
        // A square more or less at each corner, less a bevel where sides move apart.
        const int bevels = d > 0 ? 3 : 1;
        const double corners = (4 - 2 * bevels * (d > 0 ? 1 : -1)) * d * d;
        const double grown = d * shapes::ChainLength(shape) + corners;
        EXPECT_NEAR(area, offset_laws::Area(shape) + grown, 1e-9);
        EXPECT_TRUE(shape.GetSubContour(0)->IsClosed());
    }
}

TEST(VarParallels, BridgeWhatMovesApart) {
    GmContour rectangle = Path("0 0  10 0  10 5  0 5  0 0");
    ASSERT_EQ(rectangle.VarParallelContours(GmVec(1, 2, 0)), 1);
    GmContour const& result = *rectangle.GetSubContour(0);
    EXPECT_EQ(result.ElementCount(), 6);
    EXPECT_NEAR(offset_laws::Area(result), 12 * 9 - 2 * (0.5 * 2 * 4), 1e-9);
    EXPECT_EQ(rectangle.VarParallelContours(GmVec(5e-5, 5e-5, 0)), 1);
    EXPECT_EQ(*rectangle.GetSubContour(0), rectangle);
    GmContour slot = shapes::Slot();
    EXPECT_EQ(slot.VarParallelContours(GmVec(0, 0, 0)), 1);
    EXPECT_EQ(slot.ElementCount(), 6) << "arcs are split all the same";
    EXPECT_EQ(Arcs(*slot.GetSubContour(0)), 4);
}

TEST(VarParallels, TakeApartWhatCrosses) {
    // The waist is narrower than twice the distance: two loops are left.
    GmContour waist = Path("0 0  9 4  18 0  18 10  9 6  0 10  0 0");
    ASSERT_EQ(waist.VarParallelContours(GmVec(-1.25, -1.25, 0)), 2);
    for (int i = 0; i < 2; ++i) {
        GmContour& loop = *waist.GetSubContour(i);
        EXPECT_TRUE(loop.IsClosed());
        EXPECT_GT(offset_laws::Area(loop), 1.0);
    }
    // The same at many waists, so that most elements are far from each other.
    constexpr int kWaists = 60;
    std::string words = "0 0";
    for (int i = 1; i <= 2 * kWaists; ++i)
        words += "  " + std::to_string(9 * i) + (i % 2 ? " 4" : " 0");
    for (int i = 2 * kWaists; i >= 0; --i)
        words += "  " + std::to_string(9 * i) + (i % 2 ? " 6" : " 10");
    GmContour beads = Path(words + "  0 0");
    ASSERT_EQ(beads.VarParallelContours(GmVec(-1.25, -1.25, 0)), kWaists + 1);
    double inner = 0.0;
    for (int i = 0; GmContour const* const bead = beads.GetSubContour(i); ++i) {
        EXPECT_TRUE(bead->IsClosed());
        inner += offset_laws::Area(*bead);
    }
    const double ends =
        offset_laws::Area(*waist.GetSubContour(0)) + offset_laws::Area(*waist.GetSubContour(1));
    const double bead = (inner - ends) / (kWaists - 1);
    EXPECT_NEAR(bead, offset_laws::Area(*beads.GetSubContour(kWaists / 2)), 1e-6);
    GmContour open = Path("0 0  10 0  10 10  4 10  4 -5");
    EXPECT_GE(open.VarParallelContours(GmVec(0.5, 0.5, 0)), 0);
    EXPECT_EQ(GmContour().VarParallelContours(GmVec(std::nan(""), 1, 0)), 1);
    EXPECT_GE(waist.VarParallelContours(GmVec(std::nan(""), HUGE_VAL, 0)), -2);
}
