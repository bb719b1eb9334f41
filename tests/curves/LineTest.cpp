#include <cmath>

#include "curves/CurveCases.h"
#include "gmkernel/GmRect.h"

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
        {"y axis", {GmPoint(0, 0), GmPoint(0, 5)}, 0, 0, GmPoint(3, 1), 3, 1},
        {"z ignored", {GmPoint(0, 0), GmPoint(0, 5)}, 0, 0, GmPoint(3, 1, 9), 3, 1},
        {"down at x = 2", {GmPoint(2, 9), GmPoint(2, 1)}, 0, 2, GmPoint(0, 0), 2, 1},
        {"not quite vertical", {GmPoint(0, 7), GmDir(2e-6, 1)}, 5e5, 7, GmPoint(-3, 7), 3, -1},
        {"vertical enough", {GmPoint(1, 7), GmDir(5e-7, 1)}, 0, 1, GmPoint(-3, 7), 4, -1},
        {"left", {GmPoint(0, 0), GmPoint(1, 1)}, 1, 0, GmPoint(0, 2), std::sqrt(2), -1},
        {"right", {GmPoint(0, 0), GmPoint(1, 1)}, 1, 0, GmPoint(2, 0), std::sqrt(2), 1},
        {"on it", {GmPoint(0, 0), GmPoint(1, 1)}, 1, 0, GmPoint(3, 3), 0, 0},
        {"flat", {GmPoint(5, 4), GmPoint(1, 4)}, 0, 4, GmPoint(0, 3.99991), 9e-5, 0},
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
    GmPoint const p(4, 5), q(8, 5);
    struct Case {
        GmLine line;
        double x, y, dirX, dirY;
    };
    Case const table[] = {
        {{line, p, ePLParallel}, 4, 5, 1, 0},
        {{line, p, ePLNormal}, 4, 5, 0, -1},
        {{line, p, ePLCopy}, 1, 1, 1, 0},
        {{p, q, ePPMidNormal}, 6, 5, 0, -1},
        {{p, q, ePPNormalFirst}, 4, 5, 0, -1},
        {{p, q, ePPNormalSecond}, 8, 5, 0, 1},
        {{p, q, ePPThrough}, 4, 5, 1, 0},
        {{p, p}, 4, 5, 0, 0},
        {{line, 2.0}, 1, -1, 1, 0},
        {{line, -2.0}, 1, 3, 1, 0},
        {line.Inverted(), 1, 1, -1, 0},
    };
    for (Case const& c : table) {
        EXPECT_TRUE(c.line.CreationOK());
        EXPECT_TRUE(IsAt(c.line.SP(), c.x, c.y));
        EXPECT_TRUE(Points(c.line.Dir(), c.dirX, c.dirY));
    }
    GmPoint const none;
    for (GmLine const& undefined :
         {GmLine(p, none), GmLine(none, GmDir(1, 0)), GmLine(line, none, ePLCopy),
          GmLine(GmLine(), p, ePLParallel), GmLine(p, p, ePPThrough), GmLine(GmLine(), 1.0),
          GmLine(line, GmLine())}) {
        EXPECT_TRUE(undefined.IsLine() && !undefined.CreationOK());
    }
}

TEST(GmLine, BisectorHalvesTheAngle) {
    GmLine const low(GmPoint(2, 0), GmDir(1, 0));
    GmLine const middle(low, GmLine(GmPoint(4, 4), GmDir(-1, 0)));
    EXPECT_TRUE(IsAt(middle.SP(), 3, 2));
    EXPECT_TRUE(Points(middle.Dir(), 1, 0)) << "of parallels the direction of the first";

    EXPECT_TRUE(rc::check("equally far from both lines and between their directions", [] {
        GmLine const a = AnyLine();
        GmLine const b = AnyLine();
        RC_PRE(!GmParallelDir(a.Dir(), b.Dir()));
        GmLine const bisector(a, b);
        GmPoint const p(bisector.SP() + 3.0 * GmVec(bisector.Dir()));
        RC_ASSERT(std::fabs(ExactDist(a, p) - ExactDist(b, p)) < 1e-6);
        RC_ASSERT(GmVec(bisector.Dir()) * GmVec(a.Dir()) > 0.0);
        RC_ASSERT(std::fabs(GmVec(GmLine(a, b.Inverted()).Dir()) * GmVec(bisector.Dir())) < 1e-9);
        RC_ASSERT(a.GetPtSol().empty());
    }));
}

TEST(GmLine, ParallelsOfStraightCurvesLieOnTheRight) {
    EXPECT_TRUE(rc::check("a positive distance goes to the right", [] {
        GmStretch const stretch = AnyStretch();
        GmLine const line(stretch);
        GmBeam const beam(stretch.SP(), stretch.Dir());
        double const d = AnyOffset();
        for (GmLine const* curve :
             {&line, static_cast<GmLine const*>(&beam), static_cast<GmLine const*>(&stretch)}) {
            std::unique_ptr<GmCurve> const parallel(curve->GetParallel(d));
            RC_ASSERT(curve->IsStretch() ? parallel->IsStretch() : parallel->IsLine());
            RC_ASSERT(std::fabs(line.Dist(static_cast<GmLine const&>(*parallel)) - std::fabs(d)) <
                      1e-9);
            RC_ASSERT(line.PointPos(parallel->SP()) == (d > 0 ? 1 : -1));
        }
        std::unique_ptr<GmCurve> const parallel(stretch.GetParallel(d));
        RC_ASSERT(line.PointPos(parallel->EP()) == (d > 0 ? 1 : -1));
        RC_ASSERT(std::fabs(parallel->Length() - stretch.Length()) < 1e-9);
    }));
}

TEST(GmLine, ComparesCarriersAndKeepsItsKind) {
    GmLine const line(GmPoint(0, 0), GmDir(1, 0));
    EXPECT_EQ(line, GmLine(GmPoint(9, 0), GmDir(-1, 0)));
    EXPECT_NE(line, GmLine(GmPoint(9, 0), GmDir(0, 1)));
    EXPECT_NE(line, GmLine(GmPoint(0, 1), GmDir(1, 0)));
    EXPECT_EQ(line.Dist(GmLine(GmPoint(7, 3), GmDir(-1, 0))), 3);
    EXPECT_EQ(line.Dist(GmLine(GmPoint(7, 3), GmDir(1, 1))), 0);
    EXPECT_EQ(line.IntersectionWithLine(line.Inverted()), 0) << "coincident carriers";
    EXPECT_EQ(line.BoundingRect(), GmRect(0, 0, 0, 0));

    GmBeam beam(GmPoint(1, 2), GmDir(0, 1));
    GmLine target;
    target = beam;
    EXPECT_TRUE(target.IsLine() && target.CreationOK());
    EXPECT_TRUE(GmLine(beam).IsLine());
    GmLine& asLine = beam;
    asLine = line;
    EXPECT_TRUE(beam.IsBeam());
    EXPECT_EQ(beam, GmBeam(GmPoint(0, 0), GmDir(1, 0)));
}

TEST(GmBeam, EndsAtItsOriginOnly) {
    GmBeam const beam(GmPoint(0, 0), GmDir(1, 0));
    EXPECT_FALSE(beam.Element(GmPoint(-1, 0)));
    EXPECT_TRUE(beam.Element(GmPoint(5, 0)));
    EXPECT_TRUE(beam.Element(GmPoint(0, 0.00005)));
    EXPECT_TRUE(beam.Element(GmPoint(-0.00009, 0))) << "as good as the origin";
    EXPECT_FALSE(beam.Element(GmPoint(-0.00011, 0)));
    EXPECT_TRUE(IsAt(beam.MinDist(GmPoint(-3, 2), false), 0, 0));
    EXPECT_EQ(beam.Dist(GmPoint(-3, 2)), 2) << "of the carrier";
    EXPECT_EQ(beam.PointPos(GmPoint(-3, 0)), 1) << "behind the origin is not on the ray";

    GmBeam inverse(beam);
    inverse.Invert();
    EXPECT_TRUE(inverse.Element(GmPoint(-1, 0)) && !inverse.Element(GmPoint(1, 0)));
    EXPECT_EQ(inverse, beam.Inverted());
    EXPECT_NE(inverse, beam);
    EXPECT_EQ(GmBeam(GmPoint(3, 0), GmDir(1, 0)).Inverted().Inverted(),
              GmBeam(GmPoint(3, 0), GmDir(1, 0)));
    EXPECT_TRUE(beam == GmBeam(GmPoint(3, 0), GmDir(1, 0))) << "the other origin is on this ray";
    EXPECT_FALSE(GmBeam(GmPoint(3, 0), GmDir(1, 0)) == beam);

    GmBeam moved(beam);
    moved.SetSP(GmPoint(2, 2));
    EXPECT_TRUE(IsAt(moved.SP(), 2, 2) && Points(moved.TangSP(), 1, 0));
    EXPECT_TRUE(IsAt(GmBeam(moved, 1.5).SP(), 2, 0.5));
    EXPECT_FALSE(GmBeam(GmBeam(), 1.5).CreationOK());
    EXPECT_FALSE(GmBeam(GmPoint(0, 0), GmDir()).CreationOK());
    EXPECT_TRUE(GmBeam(GmPoint(), GmPoint(1, 1)).IsBeam());
}
