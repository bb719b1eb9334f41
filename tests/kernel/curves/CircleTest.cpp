// SPDX-License-Identifier: MIT
#include <cmath>

#include "gmkernel/GmRect.h"
#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

TEST(GmCircle, IntersectsLinesInFixedOrder) {
    GmCircle const circle(GmPoint(0, 0, 2), 5.0, true);
    struct Case {
        char const* name;
        GmLine line;
        char const* hits;
    };
    Case const table[] = {
        {"secant", Stretch(9, 3, 10, 3), "-4,3,2 4,3,2"},
        {"its sense does not matter", Stretch(9, 3, 8, 3), "-4,3,2 4,3,2"},
        {"falling, the larger root first", Stretch(5, 0, 0, 5), "5,0,2 0,5,2"},
        {"rising, the smaller root first", Stretch(-5, 0, 0, 5), "-5,0,2 0,5,2"},
        {"touching", Stretch(9, 5, 10, 5), "0,5,2"},
        {"touching below", Stretch(9, -5, 10, -5), "0,-5,2"},
        {"touching a slope", Stretch(3, 4, 7, 1), "3,4,2"},
        {"passing just outside", Stretch(9, 5.00009, 10, 5.00009), "0,5,2"},
        {"passing outside", Stretch(9, 5.00011, 10, 5.00011), ""},
        {"dipping in by less than the tolerance", Stretch(9, 5 - 1e-10, 8, 5 - 1e-10), "0,5,2"},
        {"vertical, upper first", Stretch(3, 9, 3, 1), "3,4,2 3,-4,2"},
        {"vertical, touching", Stretch(5, 9, 5, 10), "5,0,2"},
        {"vertical, just outside", Stretch(5.00005, 9, 5.00005, 10), ""},
    };
    for (Case const& c : table) {
        circle.IntersectionWithLine(c.line);
        EXPECT_EQ(TextOf(circle.GetPtSol()), c.hits) << c.name;
    }
    EXPECT_EQ(circle.IntersectionWithLine(Stretch(4.999999, 9, 4.999999, 8)), 2)
        << "a vertical line merges its points only when they are as good as one";
    GmStretch const beside = Stretch(7, 5, 9, 5);
    EXPECT_EQ(circle.IntersectionWithLine(beside), 0) << "a stretch is touched only where it is";
}

TEST(GmCircle, IntersectsCirclesInFixedOrder) {
    GmCircle const circle(GmPoint(0, 0, 2), 5.0, true);
    struct Case {
        char const* name;
        GmCircle other;
        char const* hits;
    };
    Case const table[] = {
        {"right of the centre line first", Circle(8, 0, 5), "4,-3,2 4,3,2"},
        {"from the other side", Circle(-8, 0, 5), "-4,3,2 -4,-3,2"},
        {"touching outside", Circle(10, 0, 5), "5,0,2"},
        {"touching inside", Circle(0, 3, 2), "0,5,2"},
        {"touched by an enclosing one", Circle(0, -3, 8), "0,5,2"},
        {"apart", Circle(10.00001, 0, 5), ""},
        {"nested", Circle(1, 0, 2), ""},
        {"enclosing", Circle(1, 0, 9), ""},
        {"identical", Circle(0, 0, 5), ""},
    };
    for (Case const& c : table) {
        circle.IntersectionWithCircle(c.other);
        EXPECT_EQ(TextOf(circle.GetPtSol()), c.hits) << c.name;
    }
}

TEST(GmCircle, IsBuiltFromCentreAndRadius) {
    EXPECT_EQ(Circle(0, 0, -3).R(), 3);
    EXPECT_EQ(GmCircle(Circle(1, 2, 5), -4.5), Circle(1, 2, 0.5));
    GmCircle const vanished(Circle(1, 2, 5), -4.99991);
    EXPECT_TRUE(!vanished.CreationOK() && vanished.R() == 0 && vanished.IsCircle());
    EXPECT_FALSE(GmCircle(GmPoint(), 3, true).CreationOK());
    EXPECT_FALSE(GmCircle(GmCircle(), 3).CreationOK());
    GmCircle tilted(GmPoint(1, 2), GmDir(1, 0, 0), 3);
    EXPECT_EQ(tilted, Circle(1, 2, 3)) << "the axis does not count";
    EXPECT_NE(tilted, Circle(1, 2, 3 + 1e-12)) << "radii compare exactly";
    EXPECT_EQ(tilted.GetTraceString(), "circ (1.00000, 2.00000) R = 3.00000");
    EXPECT_EQ(tilted.BoundingRect(), GmRect(-2, -1, 4, 5));
    tilted = Arc(1, 2, 5, 0, 90, CCW);
    EXPECT_TRUE(tilted.IsCircle() && tilted == Circle(1, 2, 5));
}

TEST(GmCircle, TellsInsideOutsideAndRim) {
    GmCircle circle = Circle(0, 0, 5);
    GmPoint const rim(3, 4), inside(3, 3.9999), outside(3, 4.00001);
    EXPECT_TRUE(!circle.In(rim) && !circle.Out(rim));
    EXPECT_TRUE(circle.In(inside) && circle.Out(outside) && circle.Element(outside));
    EXPECT_EQ(Text(circle.Tangent(GmPoint(5, 0)).Dir()), "0,-1");
    EXPECT_EQ(Text(circle.TangDir(GmPoint(0, 5))), "1,0");
    EXPECT_FALSE(circle.Tangent(GmPoint(5.1, 0)).CreationOK());
    EXPECT_EQ(Text(circle.TangDir(GmPoint(5.1, 0))), "none");
    // The radial direction turned by exchanging its components, not normalised anew.
    for (int i = 0; i < 40; ++i) {
        GmPoint const p = Along(circle, i / 40.0);
        EXPECT_EQ(circle.TangDir(p).X(), GmDir(circle.M(), p).Y()) << i;
    }
}

TEST(GmCircle, MeasuresGapsAndTouchingPoints) {
    GmCircle circle = Circle(0, 0, 5);
    struct Case {
        GmCircle other;
        double gap;
        char const* touching;
    };
    Case const table[] = {
        {Circle(1, 0, 1), 3, "none"}, {Circle(10, 0, 1), 4, "none"}, {Circle(10, 0, 6), 0, "none"},
        {Circle(1, 0, 9), 3, "none"}, {Circle(8, 0, 3), 0, "5,0"},   {Circle(3, 0, 2), 0, "5,0"},
        {Circle(3, 0, 8), 0, "-5,0"}, {Circle(0, 0, 5), 0, "none"},
    };
    for (Case const& c : table) {
        EXPECT_DOUBLE_EQ(circle.Dist(c.other), c.gap) << c.other.GetTraceString();
        EXPECT_EQ(Text(circle.GetTangPoint(c.other)), c.touching) << c.other.GetTraceString();
    }
    EXPECT_DOUBLE_EQ(circle.Dist(Stretch(3, 9, 9, 9)), std::sqrt(90) - 5);
    EXPECT_EQ(circle.Dist(Stretch(-9, 1, 9, 1)), 0);
    EXPECT_EQ(Text(circle.GetTangPoint(Stretch(-9, 5.00005, 9, 5.00005))), "0,5.00005");
    EXPECT_EQ(Text(circle.GetTangPoint(Stretch(-9, 5.0002, 9, 5.0002))), "none");
}

TEST(GmCircle, FacesOtherCurves) {
    GmCircle const circle = Circle(0, 0, 5), right = Circle(12, 0, 2);
    GmArc const rightHalf = Arc(0, 0, 5, -90, 90, CCW), leftHalf = Arc(0, 0, 5, 90, -90, CCW);
    GmArc const inner = Arc(0, 0, 2, 0, 60, CCW);
    GmStretch const wall = Stretch(9, 3, 9, 4);
    GmRect const rect(0, 0, 1, 1);
    EXPECT_EQ(Text(circle.NP(GmPoint(-1, 0))), "-5,0");
    EXPECT_EQ(Text(circle.NP(GmPoint(0, 0))), "none");
    EXPECT_EQ(Text(rightHalf.NP(GmPoint(0, 0))), "0,-5") << "the centre answers the start";
    EXPECT_EQ(Text(leftHalf.NP(GmPoint(10, 0))), "-5,0") << "the only point on the line of centres";
    struct Case {
        char const* name;
        GmCircle const& circle;
        GmCurve const& other;
        char const* point;
    };
    Case const table[] = {
        {"the nearer to a straight curve", circle, wall, "5,0"},
        {"the only one", leftHalf, wall, "-5,0"},
        {"of two points the farther one", circle, right, "-5,0"},
        {"the only one on the line of centres", rightHalf, right, "5,0"},
        {"concentric circles", circle, circle, "none"},
        {"arc in a circle", rightHalf, circle, "0,-5"},
        {"arc about an arc that starts at 0 degrees", rightHalf, inner, "5,0"},
        {"other kinds", circle, rect, "none"},
    };
    for (Case const& c : table)
        EXPECT_EQ(Text(c.circle.NP(&c.other)), c.point) << c.name;
}
