// SPDX-License-Identifier: MIT
#include "gmkernel/GmMatrix.h"
#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

TEST(GmStretch, HoldsPointsWithinItsEnds) {
    struct Case {
        char const* name;
        GmStretch stretch;
        GmPoint p;
        bool element;
    };
    GmStretch const flat = Stretch(0, 0, 10, 0);
    Case const table[] = {
        {"past the end within tolerance", flat, GmPoint(10.00009, 0), true},
        {"past the end", flat, GmPoint(10.00011, 0), false},
        {"before the start within tolerance", flat, GmPoint(-0.00009, 0), true},
        {"beside within tolerance", flat, GmPoint(5, 0.00009), true},
        {"beside by the tolerance", flat, GmPoint(5, 0.0001), false},
        {"vertical, inside", Stretch(1, 8, 1, 2), GmPoint(1, 5), true},
        {"vertical, beyond", Stretch(1, 8, 1, 2), GmPoint(1, 1.9), false},
        {"diagonal, beyond", Stretch(0, 0, 4, 4), GmPoint(5, 5), false},
        {"without extent, on it", Stretch(3, 3, 3, 3), GmPoint(3, 3), true},
        {"without extent, beside", Stretch(3, 3, 3, 3), GmPoint(3, 4), false},
    };
    for (Case const& c : table)
        EXPECT_EQ(c.stretch.Element(c.p), c.element) << c.name;
}

TEST(GmStretch, ClampsNearestPoints) {
    GmStretch const s = Stretch(0, 0, 10, 0);
    EXPECT_EQ(Text(s.MinDist(GmPoint(12, 3), true)), "0,0") << "the start is preferred";
    EXPECT_EQ(Text(s.MinDist(GmPoint(5, -1), true)), "5,0") << "but a foot comes first";
    EXPECT_EQ(s.GmLine::Dist(GmPoint(-3, 4)), 4) << "of the supporting line";
    EXPECT_EQ(Text(Stretch(3, 1, 3, 1).MinDist(GmPoint(3, 9), false)), "3,1");
    GmStretch const backwards(GmPoint(1, 0), GmDir(1, 0), -2);
    EXPECT_EQ(Text(backwards.MinDist(GmPoint(0, 9), false)), "0,0");
    EXPECT_EQ(Text(backwards.MinDist(GmPoint(2, 9), false)), "1,0");
}

TEST(GmStretch, DirectionFollowsTheEnds) {
    GmStretch s = Stretch(0, 0, 10, 0);
    s.SetEP(GmPoint(0, 5));
    EXPECT_EQ(Text(s.TangEP()), "0,1");
    s.SetSP(GmPoint(0.00005, 5.00005));
    EXPECT_EQ(Text(s.Dir()), "0,1") << "ends that meet leave the direction";
    s.SetSP(GmPoint(5, 5));
    EXPECT_EQ(Text(s.TangSP()), "-1,0");
    s.Invert();
    EXPECT_EQ(TextOf({s.SP(), s.HP(), s.EP()}) + " " + Text(s.TangHP()), "0,5 2.5,5 5,5 1,0");
    EXPECT_TRUE(s != s.Inverted() && s == s.Inverted().Inverted());

    GmStretch const backwards(GmPoint(1, 1), GmDir(1, 0), -3);
    EXPECT_EQ(Text(backwards.EP()) + " " + Text(backwards.Dir()), "-2,1 1,0");
    EXPECT_EQ(backwards.GetTraceString(), "line (1.00000, 1.00000) - (-2.00000, 1.00000)");
    for (GmStretch const& undefined :
         {GmStretch(GmPoint(), GmPoint(1, 1)), GmStretch(GmStretch(), 1.0),
          GmStretch(GmPoint(1, 1), GmDir(), 2)}) {
        EXPECT_TRUE(undefined.IsStretch() && !undefined.CreationOK());
    }
}

TEST(GmStretch, TransformsItsEnds) {
    GmStretch s = Stretch(1, 0, 3, 0);
    s.Transform(GmMatrix().Translate(5, 6, 0).Rotate(GmVec(0, 0, -1), 90).Scale(GmVec(2, -1, 1)));
    EXPECT_EQ(TextOf({s.SP(), s.EP()}) + " " + Text(s.Dir()), "5,8 5,12 0,1");
    s.Translation(GmVec(-5, 0, 2));
    EXPECT_EQ(Text(s.HP()), "0,10,2");
}
