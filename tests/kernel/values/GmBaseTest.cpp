// SPDX-License-Identifier: MIT
#include "gmkernel/GmBase.h"

#include <gtest/gtest.h>

#include <memory>
#include <typeinfo>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/GmRect.h"

namespace {

/// Only the base itself, without a class of its own.
struct Bare : GmBase {
    using GmBase::m_eType;
    Bare* Clone() const override { return new Bare(*this); }
    GmRect BoundingRect() const override { return GmRect(); }
};

int countOfTrueTests(GmBase const& o) {
    return o.IsVec() + o.IsDir() + o.IsAngle() + o.IsPoint() + o.IsRect() + o.IsLine() +
           o.IsCircle() + o.IsStretch() + o.IsBeam() + o.IsArc() + o.IsHelix() + o.IsContour();
}

}  // namespace

TEST(GmBase, TagTestsAnswerForExactlyOneClass) {
    struct {
        int tag;
        bool (GmBase::*test)() const;
    } const rows[] = {
        {1, &GmBase::IsVec},      {2, &GmBase::IsDir},       {3, &GmBase::IsAngle},
        {10, &GmBase::IsPoint},   {20, &GmBase::IsRect},     {101, &GmBase::IsLine},
        {102, &GmBase::IsCircle}, {103, &GmBase::IsStretch}, {104, &GmBase::IsBeam},
        {200, &GmBase::IsArc},    {201, &GmBase::IsHelix},   {300, &GmBase::IsContour}};
    Bare object;
    EXPECT_EQ(object.GetType(), -1);
    EXPECT_EQ(countOfTrueTests(object), 0);
    EXPECT_FALSE(object.IsCurve());
    for (auto const& row : rows) {
        object.m_eType = static_cast<GmBase::eGmTypes>(row.tag);
        EXPECT_TRUE((object.*row.test)()) << row.tag;
        EXPECT_EQ(countOfTrueTests(object), 1) << row.tag;
        EXPECT_EQ(object.IsCurve(), row.tag >= 100) << row.tag;
    }
    object.m_eType = GmBase::eGmCurve;
    EXPECT_EQ(countOfTrueTests(object), 0);
    EXPECT_TRUE(object.IsCurve());
}

TEST(GmBase, AssignmentKeepsOrCopiesTheTagAsTheClassDemands) {
    GmVec vec;
    vec = GmPoint(1, 2, 3);
    EXPECT_TRUE(vec.IsVec());
    EXPECT_TRUE(vec.CreationOK());
    GmVec const sliced(GmPoint(1, 2, 3));
    EXPECT_TRUE(sliced.IsVec());

    Bare base;
    static_cast<GmBase&>(base) = vec;
    EXPECT_TRUE(base.IsVec());
    EXPECT_TRUE(base.CreationOK());
    GmBase const& same = base;
    base = static_cast<Bare const&>(same);
    EXPECT_TRUE(base.IsVec());
}
