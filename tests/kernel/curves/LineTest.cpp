// SPDX-License-Identifier: MIT
#include <cmath>

#include "gmkernel/GmRect.h"
#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

TEST(GmLine, AnswersSlopeFormDistanceAndSide) {
    struct Case {
        char const* name;
        GmLine line;
        double k, d;
        GmPoint p;
        double dist;
        int side;
    };
    Case const table[] = {
        {"y axis, z ignored", Stretch(0, 0, 0, 5), 0, 0, GmPoint(3, 1, 9), 3, 1},
        {"down at x = 2", Stretch(2, 9, 2, 1), 0, 2, GmPoint(0, 0), 2, 1},
        {"not quite vertical", {GmPoint(0, 7), GmDir(2e-6, 1)}, 5e5, 7, GmPoint(-3, 7), 3, -1},
        {"vertical enough", {GmPoint(1, 7), GmDir(5e-7, 1)}, 0, 1, GmPoint(-3, 7), 4, -1},
        {"left", Stretch(0, 0, 1, 1), 1, 0, GmPoint(0, 2), std::sqrt(2), -1},
        {"right", Stretch(0, 0, 1, 1), 1, 0, GmPoint(2, 0), std::sqrt(2), 1},
        {"within tolerance", Stretch(5, 4, 1, 4), 0, 4, GmPoint(0, 3.99991), 9e-5, 0},
    };
    for (Case const& c : table) {
        SCOPED_TRACE(c.name);
        EXPECT_NEAR(c.line.k(), c.k, c.k * 1e-9);
        EXPECT_DOUBLE_EQ(c.line.d(), c.d);
        EXPECT_NEAR(c.line.Dist(c.p), c.dist, 1e-9);
        EXPECT_EQ(c.line.PointPos(c.p), c.side);
    }
}

TEST(GmLine, IsConstructedFromLinesAndPoints) {
    GmLine const line(GmPoint(1, 1), GmDir(1, 0));
    GmPoint const p(4, 5), q(8, 5), none;
    struct Case {
        GmLine line;
        char const *sp, *dir;
    };
    Case const table[] = {
        {{line, p, ePLParallel}, "4,5", "1,0"},  {{line, p, ePLNormal}, "4,5", "0,-1"},
        {{line, p, ePLCopy}, "1,1", "1,0"},      {{p, q, ePPMidNormal}, "6,5", "0,-1"},
        {{p, q, ePPNormalFirst}, "4,5", "0,-1"}, {{p, q, ePPNormalSecond}, "8,5", "0,1"},
        {{p, q, ePPThrough}, "4,5", "1,0"},      {{p, p}, "4,5", "0,0"},
        {line.Inverted(), "1,1", "-1,0"},        {{p, p, ePPThrough}, "none", "none"},
        {{line, none, ePLCopy}, "none", "none"}, {{GmLine(), 1.0}, "none", "none"},
        {{line, GmLine()}, "none", "none"},
    };
    for (Case const& c : table) {
        EXPECT_EQ(Text(c.line.SP()), c.sp);
        EXPECT_EQ(Text(c.line.Dir()), c.dir);
        EXPECT_TRUE(c.line.IsLine() && c.line.CreationOK() == c.line.SP().CreationOK());
    }
}

TEST(GmLine, BisectorHalvesTheAngle) {
    GmLine const middle(Stretch(2, 0, 3, 0), Stretch(4, 4, 3, 4));
    EXPECT_EQ(Text(middle.SP()) + " " + Text(middle.Dir()), "3,2 1,0") << "of parallels";
    EXPECT_TRUE(rc::check("equally far from both lines and between their directions", [] {
        GmLine const a = AnyStretch();
        GmLine const b = AnyStretch();
        RC_PRE(!GmParallelDir(a.Dir(), b.Dir()));
        GmLine const bisector(a, b);
        GmPoint const p(bisector.SP() + 3.0 * GmVec(bisector.Dir()));
        RC_ASSERT(std::fabs(ExactDist(a, p) - ExactDist(b, p)) < 1e-6);
        RC_ASSERT(GmVec(bisector.Dir()) * GmVec(a.Dir()) > 0.0);
        RC_ASSERT(GmVec(bisector.Dir()) * GmVec(b.Dir()) > 0.0);
        RC_ASSERT(a.GetPtSol().empty());
    }));
}

TEST(GmLine, ParallelsOfStraightCurvesLieOnTheRight) {
    EXPECT_TRUE(rc::check("a positive distance goes to the right", [] {
        GmStretch const stretch = AnyStretch();
        GmLine const line(stretch);
        GmBeam const beam(stretch.SP(), stretch.Dir());
        double const d = AnyOffset();
        std::unique_ptr<GmCurve> const parallels[] = {
            std::unique_ptr<GmCurve>(line.GetParallel(d)),
            std::unique_ptr<GmCurve>(beam.GetParallel(d)), std::make_unique<GmBeam>(beam, d),
            std::unique_ptr<GmCurve>(stretch.GetParallel(d))};
        for (auto const& parallel : parallels) {
            RC_ASSERT(std::fabs(line.Dist(parallel->SP()) - std::fabs(d)) < 1e-9);
            RC_ASSERT(line.PointPos(parallel->SP()) == (d > 0 ? 1 : -1));
            RC_ASSERT(static_cast<GmLine const&>(*parallel).Dir() == line.Dir());
        }
        RC_ASSERT(parallels[1]->IsLine());
        RC_ASSERT(Text(parallels[3]->EP()) ==
                  Text(GmPoint(stretch.EP() + d * GmVec(line.Normal()))));
    }));
}

TEST(GmLine, ComparesSupportingLinesAndKeepsItsKind) {
    GmLine const line(GmPoint(0, 0), GmDir(1, 0));
    EXPECT_EQ(line, GmLine(GmPoint(9, 0), GmDir(-1, 0)));
    EXPECT_NE(line, GmLine(GmPoint(9, 0), GmDir(0, 1)));
    EXPECT_NE(line, GmLine(GmPoint(0, 1), GmDir(1, 0)));
    EXPECT_EQ(line.Dist(GmLine(GmPoint(7, 3), GmDir(-1, 0))), 3);
    EXPECT_EQ(line.Dist(GmLine(GmPoint(7, 3), GmDir(1, 1))), 0);
    EXPECT_EQ(line.IntersectionWithLine(line.Inverted()), 0) << "coincident lines";
    EXPECT_EQ(line.BoundingRect(), GmRect(0, 0, 0, 0));
    GmBeam beam(GmPoint(1, 2), GmDir(0, 1));
    EXPECT_TRUE(GmLine(beam).IsLine());
    static_cast<GmLine&>(beam) = line;
    EXPECT_TRUE(beam.IsBeam() && beam == GmBeam(GmPoint(0, 0), GmDir(1, 0)));
}

TEST(GmBeam, EndsAtItsOriginOnly) {
    GmBeam const beam(GmPoint(0, 0), GmDir(1, 0)), ahead(GmPoint(3, 0), GmDir(1, 0));
    EXPECT_TRUE(beam.Element(GmPoint(5, 0)) && !beam.Element(GmPoint(-1, 0)));
    EXPECT_TRUE(beam.Element(GmPoint(-0.00009, 0))) << "as good as the origin";
    EXPECT_FALSE(beam.Element(GmPoint(-0.00011, 0)));
    EXPECT_EQ(Text(beam.MinDist(GmPoint(-3, 2), false)), "0,0");
    EXPECT_EQ(beam.Dist(GmPoint(-3, 2)), 2) << "of the supporting line";
    EXPECT_EQ(beam.PointPos(GmPoint(-3, 0)), -1) << "behind the origin is not on the ray";
    EXPECT_TRUE(beam == ahead && !(ahead == beam)) << "only one origin is on the other ray";

    GmBeam inverse(beam);
    inverse.Invert();
    EXPECT_TRUE(inverse.Element(GmPoint(-1, 0)) && !inverse.Element(GmPoint(1, 0)));
    EXPECT_TRUE(inverse == beam.Inverted() && inverse != beam);
    EXPECT_FALSE(GmBeam(GmBeam(), 1.5).CreationOK());
    EXPECT_FALSE(GmBeam(GmPoint(0, 0), GmDir()).CreationOK());
    EXPECT_TRUE(GmBeam(GmPoint(), GmPoint(1, 1)).IsBeam());
}
