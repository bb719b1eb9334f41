// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <memory>

#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/GmContourArray.h"
#include "tests/support/Contours.h"

namespace {

struct OpenContour : GmContour {
    using GmContour::operator=;
    void AddSub(GmContour const& sub) { m_pSubConts->Add(sub.Clone()); }
    void Mark(GmPoint const& lastInsert) {
        m_LastInsertPoint = lastInsert;
        m_bCreationOK = false;
    }
};

GmContour SquareAt(double x, double side) {
    return shapes::Moved(shapes::Square(side), x, x);
}

}  // namespace

TEST(ContourModel, CopiesAreEqualIndependentAndWithoutIdentifiers) {
    EXPECT_TRUE(rc::check([](unsigned seed) {
        OpenContour source;
        source = shapes::RandomStar(seed, true);
        source.GetContElement(1)->lId = 7;
        source.GetContElement(1)->bInserted = true;
        source.AddSub(source);
        GmContour copy(source);
        RC_ASSERT(copy == source && !(copy != source));
        RC_ASSERT(copy.IsClosed());
        RC_ASSERT(copy.GetSubContour(0) == nullptr);
        for (int i = 0; i < copy.ElementCount(); ++i) {
            GmContElement const& record = *copy.GetContElement(i);
            RC_ASSERT(record.lId == 0 && record.lIndex == i && !record.bInserted);
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
    EXPECT_TRUE(copy.ElementCount() == 1 && !copy.IsClosed());
    GmContour assigned;
    assigned = broken;
    EXPECT_TRUE(assigned.ElementCount() == 1 && assigned.IsClosed());
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
    GmContour& same = target;
    target = same;
    EXPECT_EQ(target, shapes::Square(10));
    EXPECT_EQ(target.GetLastInsertPoint(), GmPoint(3, 4));
    EXPECT_FALSE(target.CreationOK());
    EXPECT_EQ(target.GetPtSol().size(), 2u);
    EXPECT_EQ(target.GetSubContour(0), nullptr);
}

TEST(ContourModel, AContourCanBecomeItsOwnSubContour) {
    // The target's sub-contours are released by the assignment, the source among them.
    OpenContour contour;
    contour.AddSub(shapes::Slot());
    contour = *contour.GetSubContour(0);
    EXPECT_EQ(contour, shapes::Slot());
    EXPECT_EQ(contour.GetSubContour(0), nullptr);
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
