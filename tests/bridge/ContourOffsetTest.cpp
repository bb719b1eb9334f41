// SPDX-License-Identifier: MIT
#include "gmbridge/ContourOffset.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "gmkernel/gmkernel.h"
#include "tests/support/Contours.h"
#include "tests/support/OffsetLaws.h"

namespace {

using namespace gmbridge;

constexpr double kPi = 3.14159265358979323846;
constexpr int kWholeContour = 1000000;

offset_laws::Contours contoursOf(const ContourOffset& offset) {
    offset_laws::Contours contours;
    for (const LoopContour& loop : offset.contours.loops)
        contours.push_back(loop.contour.get());
    return contours;
}

double areaOf(const offset_laws::Contours& contours) {
    double sum = 0.0;
    for (const GmContour* contour : contours)
        sum += offset_laws::Area(*contour);
    return sum;
}

/// Gives a contour its identifiers back, which copies lose.
std::unique_ptr<GmContour> identified(const GmContour& contour, bool reversed) {
    auto source = std::make_unique<GmContour>();
    for (int i = 0; i < contour.ElementCount(); ++i)
        source->AddElement(*contour.GetElement(i), false, i + 1);
    if (reversed) source->Invert();
    return source;
}

/// Expects the same elements from the first on: points, kinds, identifiers, marks.
void expectSameContour(const GmContour& contour, const GmContour& byKernel) {
    EXPECT_EQ(contour.IsClosed(), byKernel.IsClosed());
    ASSERT_EQ(contour.ElementCount(), byKernel.ElementCount());
    for (int i = 0; i < contour.ElementCount(); ++i) {
        const GmContElement& a = *contour.GetContElement(i);
        const GmContElement& b = *byKernel.GetContElement(i);
        EXPECT_EQ(a.lId, b.lId) << i;
        EXPECT_EQ(a.lIndex, b.lIndex) << i;
        EXPECT_EQ(a.bInserted, b.bInserted) << i;
        EXPECT_EQ(a.pCurve->IsArc(), b.pCurve->IsArc()) << i;
        EXPECT_LT(a.pCurve->SP().Dist(b.pCurve->SP()), 1e-6) << i;
        EXPECT_LT(a.pCurve->EP().Dist(b.pCurve->EP()), 1e-6) << i;
        EXPECT_NEAR(a.pCurve->Length(), b.pCurve->Length(), 1e-6) << i;
    }
}

TEST(ContourOffset, IsTheKernelsWhereThatIsRight) {
    GmContour circle;
    circle.AddElement(GmArc(GmPoint(5, 1), GmPoint(5, 1), GmPoint(0, 1), GmBase::eRotCCW), false,
                      1);
    const GmContour shapesToTry[] = {
        shapes::Square(10),
        shapes::Slot(),
        shapes::RoundedRectangle(),
        circle,
        shapes::Path("0 0  9 0  9 3  3 3  3 9  0 9  0 0"),
        shapes::Path("0 0  12 0  ccw 12 4 12 8  8 8  cw 6 8 4 8  0 8  0 0")};
    int compared = 0;
    for (const GmContour& shape : shapesToTry) {
        for (const bool reversed : {false, true}) {
            for (const double d : {0.7, -0.7}) {
                SCOPED_TRACE(shapes::ChainLength(shape) * d);
                const auto source = identified(shape, reversed);
                const ContourOffset offset = offsetContour(*source, d);
                ASSERT_FALSE(offset.refusal) << textOf(offset.refusal);
                ASSERT_EQ(source->Offsetting(d, kWholeContour, false), 1);
                ASSERT_EQ(offset.contours.loops.size(), 1U);
                expectSameContour(*offset.contours.loops[0].contour, *source->GetSubContour(0));
                ++compared;
            }
        }
    }
    EXPECT_EQ(compared, 24);
}

TEST(ContourOffset, OpenContoursHaveParallelsOnTheSideAskedFor) {
    const auto angle = identified(shapes::Path("0 0  10 0  10 5"), false);
    const ContourOffset right = offsetContour(*angle, 1.0);
    ASSERT_EQ(right.contours.loops.size(), 1U);
    const GmContour& beside = *right.contours.loops[0].contour;
    ASSERT_EQ(beside.ElementCount(), 3);
    EXPECT_TRUE(beside.GetElement(0)->SP() == GmPoint(0, -1));
    EXPECT_TRUE(beside.GetElement(2)->EP() == GmPoint(11, 5));
    EXPECT_TRUE(beside.GetContElement(1)->bInserted);
    EXPECT_EQ(beside.GetContElement(1)->lId, angle->GetContElement(0)->lId);
    EXPECT_EQ(beside.GetContElement(2)->lId, angle->GetContElement(1)->lId);
    const ContourOffset left = offsetContour(*angle, -1.0);
    ASSERT_EQ(left.contours.loops.size(), 1U);
    EXPECT_NEAR(shapes::ChainLength(*left.contours.loops[0].contour), 9.0 + 4.0, 1e-9);

    // Between the arms of a hairpin nothing is left but what lies beside its ends and turn.
    const GmContour hairpin = shapes::Path("0 0  9 0  9 3  0 3");
    EXPECT_TRUE(offsetContour(hairpin, -2.0).contours.loops.empty());
    EXPECT_EQ(offsetContour(hairpin, -1.0).contours.loops.size(), 1U);
}

TEST(ContourOffset, IslandsOfAPlateFollowItsOutline) {
    const GmContour hole = shapes::Moved(shapes::Path("2 0  ccw 0 0 -2 0  ccw 0 0 2 0"), 6, 4.5);
    int compared = 0;
    for (const bool reversed : {false, true}) {
        for (const double d : {0.5, -0.5}) {
            const auto outline = identified(shapes::RoundedRectangle(), reversed);
            const auto island = identified(hole, !reversed);
            // Its sense does not count, but decides on where it starts.
            const ContourOffset offset = offsetPart(*outline, {island.get()}, d);
            ASSERT_FALSE(offset.refusal) << textOf(offset.refusal);
            ASSERT_EQ(offset.contours.loops.size(), 2U);
            EXPECT_FALSE(offset.contours.loops[0].hole);
            EXPECT_TRUE(offset.contours.loops[1].hole);
            outline->Offsetting(d, kWholeContour, false);
            expectSameContour(*offset.contours.loops[0].contour, *outline->GetSubContour(0));
            island->Offsetting(d, kWholeContour, false);
            expectSameContour(*offset.contours.loops[1].contour, *island->GetSubContour(0));
            ++compared;

            const auto other = identified(hole, reversed);
            const ContourOffset same = offsetPart(*outline, {other.get()}, d);
            EXPECT_NEAR(areaOf(contoursOf(same)), areaOf(contoursOf(offset)), 1e-9);
        }
    }
    EXPECT_EQ(compared, 4);
}

TEST(ContourOffset, HoldsTheLawsForStarsInAllPlaces) {
    int looked = 0;
    for (unsigned seed = 1; seed <= 12; ++seed) {
        const GmContour star = shapes::RandomStar(seed, seed % 2 == 0);
        for (const shapes::Variant& variant : shapes::Variants(star)) {
            for (const double d : {-1.5, -0.4, 0.4, 3.0}) {
                SCOPED_TRACE(std::to_string(seed) + " " + variant.name + " " + std::to_string(d));
                const double distance = variant.MapOffset(d);
                const ContourOffset offset = offsetContour(variant.contour, distance);
                ASSERT_FALSE(offset.refusal) << textOf(offset.refusal);
                looked +=
                    offset_laws::ExpectOffsetLaws(variant.contour, contoursOf(offset), distance);
            }
        }
    }
    EXPECT_GT(looked, 50000);
}

TEST(ContourOffset, PartsAtANeckAndClosesAGap) {
    // Two chambers of 10 with a neck of 2 between, and a frame with a gap of 2.
    const GmContour chambers = shapes::Path(
        "0 0  10 0  10 4  14 4  14 0  24 0  24 10  14 10  14 6  10 6  10 10  0 10  0 0");
    const ContourOffset inward = offsetContour(chambers, -1.5);
    ASSERT_EQ(inward.contours.loops.size(), 2U);
    EXPECT_NEAR(areaOf(contoursOf(inward)), 2 * 49.0, 1.0);
    EXPECT_EQ(inward.contours.loops[1].region, 1U);
    EXPECT_TRUE(inward.marginal.empty());
    EXPECT_FALSE(offsetContour(chambers, -1.0).marginal.empty());

    const GmContour frame = shapes::Path(
        "0 0  20 0  20 20  11 20  11 17  17 17  17 3  3 3  3 17  9 17  9 20  0 20  0 0");
    for (const bool reversed : {false, true}) {
        const auto source = identified(frame, reversed);
        const ContourOffset outward = offsetContour(*source, reversed ? -1.5 : 1.5);
        ASSERT_EQ(outward.contours.loops.size(), 2U);
        const double sense = reversed ? -1.0 : 1.0;
        const GmContour& inner = *outward.contours.loops[1].contour;
        EXPECT_TRUE(outward.contours.loops[1].hole);
        EXPECT_GT(sense * offset_laws::Area(*outward.contours.loops[0].contour), 500.0);
        EXPECT_LT(sense * offset_laws::Area(inner), -100.0);
    }
}

TEST(ContourOffset, IslandsMayCrossEachOtherAndTheOutline) {
    const GmContour plate = shapes::Square(20);
    const GmContour a = shapes::Moved(shapes::Square(6), 4, 4);
    const GmContour b = shapes::Moved(shapes::Square(6), 7, 7).Inverted();
    const GmContour edge = shapes::Moved(shapes::Square(4), 18, 8);
    const double covered = 400.0 - (2 * 36.0 - 9.0) - 8.0;
    const ContourOffset none = offsetPart(plate, {&a, &b, &edge}, 0.0);
    ASSERT_EQ(none.contours.loops.size(), 2U);
    EXPECT_NEAR(areaOf(contoursOf(none)), covered, 1e-9);
    const GmContour all = shapes::Moved(shapes::Square(30), -5, -5);
    const ContourOffset empty = offsetPart(plate, {&all}, 1.0);
    EXPECT_FALSE(empty.refusal);
    EXPECT_TRUE(empty.contours.loops.empty());
}

TEST(ContourOffset, IdentifiersMayBeLarge) {
    const long large = 1L << 40;
    GmContour square;
    const GmContour shape = shapes::Square(5);
    for (int i = 0; i < 4; ++i)
        square.AddElement(*shape.GetElement(i), false, large + i);
    const ContourOffset offset = offsetContour(square, 1.0);
    ASSERT_EQ(offset.contours.loops.size(), 1U);
    const std::vector<long> ids = shapes::Identifiers(*offset.contours.loops[0].contour);
    EXPECT_EQ(ids, std::vector<long>({large, large, large + 1, large + 1, large + 2, large + 2,
                                      large + 3, large + 3}));
}

TEST(ContourOffset, ACrossingHasOneSideOrIsRefused) {
    // A loop against the sense, one of it, one against it as small as rounding, and a fold.
    const GmContour curl = shapes::Path("0 0  10 0  10 10  4 10  4 -4  8 -4  8 -8  0 -8  0 0");
    EXPECT_EQ(offsetContour(curl, 1.0).refusal.reason, Reason::kNoSide);
    const GmContour doubled =
        shapes::Path("0 0  10 0  10 10  0 10  0 2  6 2  6 6  2 6  2 0.5  0 0");
    const ContourOffset inside = offsetContour(doubled, -0.1);
    EXPECT_FALSE(inside.refusal) << textOf(inside.refusal);
    EXPECT_EQ(inside.contours.loops.size(), 1U);
    // The first has too little area against its sense, the second has it in a sliver.
    const GmContour noisy =
        shapes::Path("0 0  10 0  10 10  0 10  0.00005 9.9998  0 9.9999  -0.00005 5  0 0");
    const GmContour sliver =
        shapes::Path("0 0  10 0  10 10  -5 10.00002  -5 10.0001  0 9.9999  0 0");
    for (const bool reversed : {false, true}) {
        for (const GmContour* contour : {&noisy, &sliver}) {
            const auto source = identified(*contour, reversed);
            const ContourOffset inward = offsetContour(*source, reversed ? 1.0 : -1.0);
            ASSERT_FALSE(inward.refusal) << textOf(inward.refusal);
            EXPECT_NEAR(std::fabs(areaOf(contoursOf(inward))), 64.0, 2e-3);
        }
    }
    const GmContour fold = shapes::Path("0 0  10 0  10 3  10 0  0 0");
    EXPECT_EQ(offsetContour(fold, 1.0).refusal.reason, Reason::kNoSide);
}

TEST(ContourOffset, RefusesWhatHasNoAnswer) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const GmContour square = shapes::Square(10);
    const GmContour open = shapes::Path("0 0  10 0  10 5");
    const GmContour undefined;

    const ContourOffset notFinite = offsetContour(square, nan);
    EXPECT_EQ(notFinite.refusal.reason, Reason::kRegions);
    EXPECT_EQ(notFinite.refusal.regions, gmregion::Reason::kNotFinite);
    EXPECT_TRUE(notFinite.contours.loops.empty());
    EXPECT_STREQ(textOf(notFinite.refusal), gmregion::textOf(gmregion::Reason::kNotFinite));

    EXPECT_EQ(offsetContour(open, 0.0).refusal.regions, gmregion::Reason::kTolerance);
    EXPECT_EQ(offsetContour(undefined, 1.0).refusal.reason, Reason::kUndefined);
    const Refusal second = offsetPart(square, {&square, nullptr}, 1.0).refusal;
    EXPECT_EQ(second.reason, Reason::kUndefined);
    EXPECT_EQ(second.contour, 2U);
    EXPECT_EQ(offsetPart(square, {&open}, 1.0).refusal.contour, 1U);
    EXPECT_EQ(offsetPart(open, {&square}, 1.0).refusal.reason, Reason::kOpen);
    GmContour huge = shapes::Square(10);
    huge.Transform(GmMatrix::matrixScale(1e13));
    EXPECT_EQ(offsetContour(huge, 1.0).refusal.regions, gmregion::Reason::kOutOfRange);
}

}  // namespace
