#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <memory>

#include "contour/GmContourArray.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmStretch.h"
#include "support/Contours.h"

namespace {

struct OpenContour : GmContour {
    using GmContour::InitAll;
    using GmContour::operator=;
    void AddSub(GmContour const& sub) { m_pSubConts->Add(sub.Clone()); }
    void Mark(GmPoint const& lastInsert) {
        m_LastInsertPoint = lastInsert;
        m_bCreationOK = false;
    }
};

GmContour SquareAt(double x, double side) {
    GmContour square = shapes::Square(side);
    square.Translation(GmVec(x, x, 0));
    return square;
}

}  // namespace

TEST(ContourModel, AnEmptyContourAnswersTheDefaults) {
    GmContour empty;
    EXPECT_TRUE(empty.IsContour() && empty.CreationOK() && !empty.IsClosed());
    EXPECT_FALSE(empty.SP().CreationOK() || empty.GetLastInsertPoint().CreationOK());
    for (const int index : {-1, 0}) {
        EXPECT_TRUE(empty.GetSubContour(index) == nullptr && empty.GetElement(index) == nullptr);
        EXPECT_EQ(empty.GetContElement(index), nullptr);
        EXPECT_EQ(empty.GetNewElement(index), nullptr);
    }
    EXPECT_EQ(empty.GetMaxSubContour(), nullptr);
    EXPECT_EQ(empty.GetNearSubContour(GmPoint(0, 0)), nullptr);
}

TEST(ContourModel, CopiesAreEqualIndependentAndWithoutIdentifiers) {
    EXPECT_TRUE(rc::check([](unsigned seed) {
        OpenContour source;
        source = shapes::RandomStar(seed, true);
        source.GetContElement(1)->lId = 7;
        source.GetContElement(1)->bInserted = true;
        source.AddSub(source);
        GmContour copy(source);
        RC_ASSERT(copy == source);
        RC_ASSERT(!(copy != source));
        RC_ASSERT(copy.IsClosed());
        RC_ASSERT(copy.GetSubContour(0) == nullptr);
        for (int i = 0; i < copy.ElementCount(); ++i) {
            GmContElement const& record = *copy.GetContElement(i);
            RC_ASSERT(record.lId == 0 && record.lIndex == i && !record.bInserted);
            RC_ASSERT(record.pCurve != source.GetElement(i));
        }
        copy.Translation(GmVec(1, 0, 0));
        RC_ASSERT(copy != source);
    }));
}

TEST(ContourModel, ACopyOfABrokenChainLosesWhatDoesNotJoin) {
    GmContour broken = shapes::Square(10);
    broken.RemoveElement(1);
    EXPECT_TRUE(broken.IsClosed());
    const GmContour copy(broken);
    EXPECT_EQ(copy.ElementCount(), 1);
    EXPECT_FALSE(copy.IsClosed());
    GmContour assigned;
    assigned = broken;
    EXPECT_EQ(assigned.ElementCount(), 1);
    EXPECT_TRUE(assigned.IsClosed());
}

TEST(ContourModel, AssignmentTakesFlagsAndPointAndOutlivesTheSource) {
    auto source = std::make_unique<OpenContour>();
    *source = shapes::Square(10);
    source->Mark(GmPoint(3, 4));
    const GmStretch probe(GmPoint(5, -5), GmPoint(5, 15));
    source->Intersection(&probe);
    const GmContour copy(*source);
    EXPECT_TRUE(copy.GetPtSol().size() == 2u && !copy.CreationOK());
    OpenContour target;
    target.AddSub(shapes::Square(1));
    target = *source;
    source.reset();
    EXPECT_EQ(target, shapes::Square(10));
    EXPECT_EQ(target.GetLastInsertPoint(), GmPoint(3, 4));
    EXPECT_FALSE(target.CreationOK());
    EXPECT_EQ(target.GetPtSol().size(), 2u);
    EXPECT_EQ(target.GetSubContour(0), nullptr);
    GmContour& same = target;
    target = same;
    EXPECT_EQ(target.ElementCount(), 4);
}

TEST(ContourModel, AContourCanBecomeItsOwnSubContour) {
    // The target's sub-contours are released by the assignment, the source among them.
    OpenContour contour;
    contour.AddSub(shapes::Slot(5, 2));
    contour = *contour.GetSubContour(0);
    EXPECT_EQ(contour, shapes::Slot(5, 2));
    EXPECT_EQ(contour.GetSubContour(0), nullptr);
}

TEST(ContourModel, HandsOutNewElementsOfBothKindsOnly) {
    GmContour contour = shapes::Slot(5, 2);
    contour.AddElement(GmLine(GmPoint(0, 0), GmPoint(1, 0)), false, 0);
    ASSERT_EQ(contour.ElementCount(), 5) << "a line from the end of the chain passes the tests";
    const std::unique_ptr<GmCurve> segment(contour.GetNewElement(0));
    const std::unique_ptr<GmCurve> arc(contour.GetNewElement(1));
    EXPECT_TRUE(segment->IsStretch() && arc->IsArc());
    EXPECT_EQ(static_cast<GmArc&>(*arc), static_cast<GmArc&>(*contour.GetElement(1)));
    EXPECT_NE(arc.get(), contour.GetElement(1));
    EXPECT_EQ(contour.GetNewElement(4), nullptr);
}

TEST(ContourModel, FindsTheEnclosingSubContourInAnyOrder) {
    const GmContour inner = SquareAt(4, 2);
    const GmContour middle = SquareAt(2, 6);
    const GmContour outer = SquareAt(0, 10);
    const GmContour* orders[][3] = {{&inner, &middle, &outer},
                                    {&outer, &inner, &middle},
                                    {&middle, &outer, &inner},
                                    {&middle, &inner, &outer}};
    for (auto const& order : orders) {
        OpenContour contour;
        contour.AddSub(GmContour());
        for (GmContour const* sub : order)
            contour.AddSub(*sub);
        ASSERT_NE(contour.GetMaxSubContour(), nullptr);
        EXPECT_EQ(*contour.GetMaxSubContour(), outer);
        contour.AddSub(SquareAt(5, 10));
        EXPECT_EQ(contour.GetMaxSubContour(), nullptr);
    }
}

TEST(ContourModel, FindsTheNearSubContourByItsStart) {
    OpenContour contour;
    for (GmContour const& sub : {GmContour(), SquareAt(0, 9), SquareAt(4, 1), SquareAt(4, 2)}) {
        contour.AddSub(sub);
    }
    EXPECT_EQ(contour.GetNearSubContour(GmPoint(1, 1)), contour.GetSubContour(1));
    EXPECT_EQ(contour.GetNearSubContour(GmPoint(9, 9)), contour.GetSubContour(2));
    EXPECT_EQ(contour.GetNearSubContour(GmPoint(2, 2)), contour.GetSubContour(1));
    EXPECT_EQ(contour.GetSubContour(4), nullptr);
    EXPECT_EQ(contour.GetSubContour(-1), nullptr);
}

TEST(ContourModel, AnOffsetByNothingLeavesOneCopyWithItsIdentifiers) {
    OpenContour contour;
    contour.AddSub(GmContour());
    contour.AddSub(GmContour());
    for (int i = 0; i < 3; ++i) {
        contour.AddElement(GmStretch(GmPoint(i, 0), GmPoint(i + 1, 0)), false, 10 + i);
    }
    EXPECT_EQ(contour.SimpleOffsetting(0.0), 1);
    ASSERT_EQ(contour.GetSubContour(1), nullptr);
    EXPECT_EQ(*contour.GetSubContour(0), contour);
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(contour.GetSubContour(0)->GetContElement(i)->lId, 10 + i);
    }
    contour.InitAll();
    EXPECT_EQ(contour.GetSubContour(0), nullptr);
    EXPECT_EQ(contour.ElementCount(), 0);
}
