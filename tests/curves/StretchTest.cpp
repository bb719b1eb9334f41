#include <cmath>

#include "curves/CurveCases.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"

using namespace cases;

TEST(GmStretch, HoldsPointsWithinItsEnds) {
    struct Case {
        char const* name;
        GmStretch stretch;
        GmPoint p;
        bool element;
    };
    GmStretch const flat(GmPoint(0, 0), GmPoint(10, 0));
    GmStretch const steep(GmPoint(1, 8), GmPoint(1, 2));
    GmStretch const diagonal(GmPoint(0, 0), GmPoint(4, 4));
    GmStretch const dot(GmPoint(3, 3), GmPoint(3, 3));
    Case const table[] = {
        {"past the end within tolerance", flat, GmPoint(10.00005, 0), true},
        {"past the end", flat, GmPoint(10.00011, 0), false},
        {"before the start within tolerance", flat, GmPoint(-0.00009, 0), true},
        {"before the start", flat, GmPoint(-0.5, 0), false},
        {"beside within tolerance", flat, GmPoint(5, 0.00009), true},
        {"beside by the tolerance", flat, GmPoint(5, 0.0001), false},
        {"beside the end", flat, GmPoint(10, 0.5), false},
        {"vertical, inside", steep, GmPoint(1, 5), true},
        {"vertical, beyond", steep, GmPoint(1, 1.9), false},
        {"diagonal, inside", diagonal, GmPoint(2, 2), true},
        {"diagonal, beyond", diagonal, GmPoint(5, 5), false},
        {"without extent, on it", dot, GmPoint(3, 3), true},
        {"without extent, beside", dot, GmPoint(3, 4), false},
    };
    for (Case const& c : table)
        EXPECT_EQ(c.stretch.Element(c.p), c.element) << c.name;
    EXPECT_TRUE(flat.Element(GmPoint(5, 0.4), 0.5));
}

TEST(GmStretch, ClampsNearestPoints) {
    GmStretch const s(GmPoint(0, 0), GmPoint(10, 0));
    EXPECT_TRUE(IsAt(s.MinDist(GmPoint(12, 3), false), 10, 0));
    EXPECT_TRUE(IsAt(s.MinDist(GmPoint(12, 3), true), 0, 0)) << "the start is preferred";
    EXPECT_TRUE(IsAt(s.MinDist(GmPoint(5, -1), true), 5, 0)) << "but a foot comes first";
    EXPECT_TRUE(IsAt(s.NP(GmPoint(-3, 4)), 0, 0));
    EXPECT_EQ(s.Dist(GmPoint(-3, 4)), 5);
    EXPECT_EQ(s.GmLine::Dist(GmPoint(-3, 4)), 4) << "of the carrier";
    GmStretch const dot(GmPoint(1, 1, 1), GmPoint(1, 1, 1));
    EXPECT_EQ(dot.Dist(GmPoint(1, 1, 3)), 2);
}

TEST(GmStretch, DirectionFollowsTheEnds) {
    GmStretch s(GmPoint(0, 0), GmPoint(10, 0));
    s.SetEP(GmPoint(0, 5));
    EXPECT_TRUE(Points(s.TangEP(), 0, 1));
    s.SetSP(GmPoint(0.00005, 5.00005));
    EXPECT_TRUE(Points(s.Dir(), 0, 1)) << "ends that meet leave the direction";
    s.SetSP(GmPoint(5, 5));
    EXPECT_TRUE(Points(s.TangSP(), -1, 0));
    s.Invert();
    EXPECT_TRUE(IsAt(s.SP(), 0, 5) && IsAt(s.EP(), 5, 5) && Points(s.TangHP(), 1, 0));
    EXPECT_NE(s, s.Inverted());
    EXPECT_EQ(s, s.Inverted().Inverted());

    GmStretch const backwards(GmPoint(1, 1), GmDir(1, 0), -3);
    EXPECT_TRUE(IsAt(backwards.EP(), -2, 1) && Points(backwards.Dir(), 1, 0));
    EXPECT_EQ(backwards.Length(), 3);
    EXPECT_TRUE(IsAt(backwards.HP(), -0.5, 1));
    EXPECT_EQ(backwards.BoundingRect(), GmRect(-2, 1, 1, 1));
    EXPECT_EQ(GmStretch(GmPoint(1, 2), GmPoint(3, 4)).GetTraceString(),
              "line (1.00000, 2.00000) - (3.00000, 4.00000)");
    for (GmStretch const& undefined :
         {GmStretch(), GmStretch(GmPoint(), GmPoint(1, 1)), GmStretch(GmPoint(1, 1), GmDir(), 2),
          GmStretch(GmStretch(), 1.0)}) {
        EXPECT_TRUE(undefined.IsStretch() && !undefined.CreationOK());
        EXPECT_FALSE(undefined.EP().CreationOK());
    }
}

TEST(GmStretch, TransformsItsEnds) {
    GmStretch s(GmPoint(1, 0), GmPoint(3, 0));
    s.Transform(GmMatrix().Translate(5, 6, 0).Rotate(GmVec(0, 0, -1), 90).Scale(GmVec(2, -1, 1)));
    EXPECT_TRUE(IsAt(s.SP(), 5, 8) && IsAt(s.EP(), 5, 12));
    EXPECT_TRUE(Points(s.Dir(), 0, 1));
    s.Translation(GmVec(-5, 0, 2));
    EXPECT_TRUE(IsAt(s.HP(), 0, 10, 2));

    GmLine line(GmPoint(1, 0), GmDir(1, 0));
    line.Transform(GmMatrix::matrixTranslate(5, 6, 0));
    EXPECT_TRUE(IsAt(line.SP(), 1, 0)) << "lines are not transformed";
}
