// SPDX-License-Identifier: MIT
#include "gmkernel/GmRect.h"

#include <gtest/gtest.h>

#include <cmath>
#include <memory>

#include "gmkernel/GmLine.h"
#include "tests/kernel/values/Generators.h"

namespace {

GmRect anyRect() {
    GmPoint const a = anyPoint();
    GmPoint const b = anyPoint();
    return GmRect(a, b);
}

/// A point on a grid around the unit square: inside, outside, and exactly on its edges.
GmPoint gridPoint(int i) {
    return GmPoint((i % 5) * 0.5 - 0.5, (i / 5) * 0.5 - 0.5);
}

}  // namespace

TEST(GmRect, OrdersItsCornersAndDropsZ) {
    GmRect const r(GmPoint(5, 1, 7), GmPoint(2, 4, 8));
    EXPECT_EQ(r.Left(), 2);
    EXPECT_EQ(r.Top(), 4);
    EXPECT_EQ(r.Right(), 5);
    EXPECT_EQ(r.Bottom(), 1);
    EXPECT_EQ(r.LTPoint(), GmPoint(2, 4, 0));
    EXPECT_EQ(r, GmRect(2, 1, 5, 4));
    EXPECT_EQ(r, GmRect(GmPoint(5, 4), -3, -3));
    EXPECT_EQ(GmRect(GmRect(0, 0, 2, 4), -1.5), GmRect(0.5, 1.5, 1.5, 2.5)) << "x edges crossed";
    EXPECT_TRUE(r.IsRect() && !r.IsCurve());

    GmPoint const p(1, 2, 3);
    EXPECT_TRUE(GmRect(p, p).CreationOK());
    EXPECT_EQ(GmRect(p, p).MaxDim(), 0);
    for (GmRect const& none : {GmRect(p, GmPoint()), GmRect(GmPoint(), p), GmRect(GmRect(), 5)}) {
        EXPECT_FALSE(none.CreationOK());
        EXPECT_EQ(none, GmRect(0, 0, 0, 0));
    }
}

TEST(GmRect, IntersectsUnitesAndIncludes) {
    GmRect const unit(0, 0, 1, 1);
    EXPECT_EQ(GmRect(0, 0, 2, 2).And(GmRect(1, 1, 3, 3)), GmRect(1, 1, 2, 2));
    EXPECT_EQ(unit.And(GmRect(1, 0, 2, 1)), GmRect(1, 0, 1, 1));
    EXPECT_TRUE(unit.And(GmRect(1 + 5e-7, 0, 2, 1)).CreationOK());
    EXPECT_FALSE(unit.And(GmRect(1 + 2e-6, 0, 2, 1)).CreationOK());
    EXPECT_FALSE(unit.And(GmRect(0, 2, 1, 3)).CreationOK());
    EXPECT_FALSE(unit.And(GmRect()).CreationOK());
    EXPECT_EQ(GmRect().Or(unit), unit);
    EXPECT_EQ(unit.Or(GmRect()), unit);

    GmRect grown;
    grown.Include(GmPoint());
    EXPECT_FALSE(grown.CreationOK());
    grown.Include(GmPoint(1, 2, 3));
    EXPECT_TRUE(grown.CreationOK());
    EXPECT_EQ(grown.RBPoint(), GmPoint(1, 2, 3));

    EXPECT_TRUE(rc::check("union, intersection and inclusion agree", [] {
        GmRect const a = anyRect();
        GmRect const b = anyRect();
        RC_ASSERT(a.Or(b) == b.Or(a));
        RC_ASSERT(a.And(b) == b.And(a));
        RC_ASSERT(a.And(a.Or(b)) == a);
        GmRect both = a;
        both.Include(b.LTPoint());
        both.Include(b.RBPoint());
        RC_ASSERT(both == a.Or(b));
        std::unique_ptr<GmCurve> const wide(a.GetParallel(2));
        RC_ASSERT(a.And(wide->BoundingRect()) == a);
        RC_ASSERT(wide->BoundingRect().Width() == GmRect(a, 2).Width());
    }));
}

TEST(GmRect, SeparatesInsideBoundaryAndOutside) {
    GmRect unit(0, 0, 1, 1);
    int onBoundary = 0;
    for (int i = 0; i < 25; ++i) {
        GmPoint const p = gridPoint(i);
        EXPECT_EQ(unit.In(p) + unit.Out(p) + unit.Element(p), 1) << p.GetTraceString();
        onBoundary += unit.Element(p);
    }
    EXPECT_EQ(onBoundary, 8);
    EXPECT_TRUE(unit.Element(GmPoint(0.00005, 0.5)));
    EXPECT_TRUE(unit.Element(GmPoint(0.5, 1.00005)));
    EXPECT_FALSE(unit.Element(GmPoint(0, 1.00005))) << "the vertical edge decides alone";
    EXPECT_TRUE(unit.Element(GmPoint(0.5, 0.8), 0.3));
}

TEST(GmRect, ScalesAboutReferencePoints) {
    GmRect const square(0, 0, 2, 2);
    struct {
        eGmRefPoint ref;
        GmRect both, x, y;
    } const rows[] = {
        {eRefCenter, {-1, -1, 3, 3}, {-1, 0, 3, 2}, {0, -1, 2, 3}},
        {eRefTop, {-1, -2, 3, 2}, {-1, 0, 3, 2}, {0, -2, 2, 2}},
        {eRefTopRight, {-2, -2, 2, 2}, {-2, 0, 2, 2}, {0, -2, 2, 2}},
        {eRefRight, {-2, -1, 2, 3}, {-2, 0, 2, 2}, {0, -1, 2, 3}},
        {eRefBottomRight, {-2, 0, 2, 4}, {-2, 0, 2, 2}, {0, 0, 2, 4}},
        {eRefBottom, {-1, 0, 3, 4}, {-1, 0, 3, 2}, {0, 0, 2, 4}},
        {eRefBottomLeft, {0, 0, 4, 4}, {0, 0, 4, 2}, {0, 0, 2, 4}},
        {eRefLeft, {0, -1, 4, 3}, {0, 0, 4, 2}, {0, -1, 2, 3}},
        {eRefTopLeft, {0, -2, 4, 2}, {0, 0, 4, 2}, {0, -2, 2, 2}},
        {static_cast<eGmRefPoint>(9), square, square, square},
    };
    for (auto const& row : rows) {
        GmRect both = square, x = square, y = square;
        both.Stretch(row.ref, 2);
        x.StretchX(row.ref, 2);
        y.StretchY(row.ref, 2);
        EXPECT_EQ(both, row.both) << row.ref;
        EXPECT_EQ(x, row.x) << row.ref;
        EXPECT_EQ(y, row.y) << row.ref;
        both.Shrink(row.ref, 2);
        EXPECT_EQ(both, square) << row.ref;
    }
    GmRect own = square;
    own.Stretch(own.LTPoint(), 2);
    EXPECT_EQ(own, GmRect(0, -2, 4, 2)) << "the point may be a corner of the rectangle itself";
    own.Shrink(GmPoint(0, 2), 2);
    own.Move(GmVec(1, 2, 0));
    EXPECT_EQ(own, GmRect(1, 2, 3, 4));
}
