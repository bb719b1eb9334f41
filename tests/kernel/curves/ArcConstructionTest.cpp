// SPDX-License-Identifier: MIT
#include <cmath>

#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

namespace {

bool runs(GmArc const& arc, GmPoint const& sp, GmPoint const& ep) {
    return arc.CreationOK() && arc.IsArc() && arc.SP() == sp && arc.EP() == ep &&
           std::fabs(arc.M().Dist(ep) - arc.R()) < 1e-7 &&
           std::fabs(arc.M().Dist(sp) - arc.R()) < 1e-7;
}

}  // namespace

TEST(ArcConstruction, ThroughThreePoints) {
    EXPECT_TRUE(rc::check("passes the points in their order", [] {
        GmPoint const a = AnyGridPoint();
        GmPoint const b = AnyGridPoint();
        GmPoint const c = AnyGridPoint();
        GmArc const arc(a, b, c);
        double const area = ((b - a) % (c - a)).Z();
        RC_ASSERT(arc.IsArc() && arc.CreationOK() == (area != 0.0));
        if (area == 0.0) return;
        RC_ASSERT(runs(arc, a, c));
        RC_ASSERT(arc.Dir() == (area > 0 ? CCW : CW));
        RC_ASSERT(ExactDist(arc, b) < 1e-6 * arc.R());
        RC_ASSERT(arc.DistSP(b) > 0 && arc.DistSP(b) < arc.Length());
    }));
    EXPECT_FALSE(GmArc(GmPoint(1, 1), GmPoint(), GmPoint(2, 5)).CreationOK());
}

TEST(ArcConstruction, OfGivenRadius) {
    GmPoint const sp(0, 0), ep(8, 0);
    EXPECT_EQ(Text(GmArc(sp, ep, 5.0, true, CCW).M()), "4,3") << "on the left";
    EXPECT_EQ(Text(GmArc(sp, ep, -5.0, false, CCW).M()), "4,-3");
    EXPECT_TRUE(GmArc(sp, ep, 4.0, true, CW).CreationOK()) << "a half circle counts as short";
    for (GmArc const& undefined : {GmArc(sp, ep, 3.9, true, CCW), GmArc(sp, sp, 5.0, true, CCW),
                                   GmArc(sp, GmPoint(), 5.0, true, CCW)}) {
        EXPECT_TRUE(undefined.IsArc() && !undefined.CreationOK());
    }
    EXPECT_TRUE(rc::check("short and long arcs in both senses", [] {
        GmStretch const chord = AnyStretch();
        double const r = chord.Length() * *rc::gen::element(0.51, 0.6, 1.0, 7.0);
        bool const bShort = *rc::gen::element(true, false);
        GmBase::eRotDir const rot = *rc::gen::element(CW, CCW);
        GmArc const arc(chord.SP(), chord.EP(), r, bShort, rot);
        RC_ASSERT(runs(arc, chord.SP(), chord.EP()));
        RC_ASSERT(arc.R() == r && arc.Dir() == rot && (arc.Ang() < M_PI) == bShort);
    }));
}

TEST(ArcConstruction, AboutACentreNearTheOneGiven) {
    GmArc const longChord(GmPoint(0, 0), GmPoint(10, 0), GmPoint(1, 0.5), CW);
    EXPECT_EQ(Text(longChord.M()), "5,7.5") << "the distance from the end gives the radius";
    GmArc const full(GmPoint(1, 0), GmPoint(1, 0.9e-7), GmPoint(7, 0), CW);
    EXPECT_TRUE(full.IsFullCircle() && full.R() == 6 && full.M() == GmPoint(7, 0));
    EXPECT_FALSE(GmArc(GmPoint(5, 0), GmPoint(0, 5), GmPoint(), CCW).CreationOK());
    EXPECT_TRUE(rc::check("ends on the circle, centre on the side of the given one", [] {
        GmStretch const chord = AnyStretch();
        GmPoint const m = AnyGridPoint();
        GmArc const arc(chord.SP(), chord.EP(), m, CCW);
        RC_ASSERT(runs(arc, chord.SP(), chord.EP()));
        RC_ASSERT(GmLine(chord).PointPos(m) * GmLine(chord).PointPos(arc.M()) >= 0);
    }));
}

TEST(ArcConstruction, OnACircle) {
    GmCircle const circle = Circle(0, 0, 5);
    GmPoint const east(5, 0), north(0, 5);
    GmArc const shortWay(circle, east, north, true), longWay(circle, east, north, false);
    EXPECT_EQ(shortWay, GmArc(circle, east, north, CCW));
    EXPECT_EQ(longWay, GmArc(circle, east, north, CW));
    EXPECT_DOUBLE_EQ(longWay.Ang(), 3 * M_PI / 2);
    EXPECT_EQ(GmArc(circle, east, east, true).Dir(), GmBase::eRotNone);
    EXPECT_TRUE(GmArc(circle, GmPoint(6.00015, 0), GmPoint(0, 6), true).CreationOK())
        << "not tested against the radius";
    EXPECT_FALSE(GmArc(circle, GmPoint(5.0003, 0), north, true).CreationOK());

    GmArc const missed(circle, east, GmPoint(0, 5.0002), CCW);
    EXPECT_TRUE(!missed.CreationOK() && missed.IsArc() && missed.R() == 5) << "keeps the circle";
    EXPECT_EQ(GmArc(circle, GmPoint(), north, CCW).R(), 0) << "undefined input clears it";
    EXPECT_FALSE(GmArc(GmCircle(), GmPoint(0, 0), GmPoint(0, 0), CCW).CreationOK());

    EXPECT_EQ(GmArc(circle, 0, 2.5 * M_PI, CCW), shortWay) << "angles are taken into one turn";
    EXPECT_FALSE(Arc(0, 0, -5, 0, 90, CCW).CreationOK()) << "negative radius";
    EXPECT_FALSE(GmArc(GmPoint(), 5, 0, 1, CCW).CreationOK());
    EXPECT_FALSE(GmArc(GmCircle(), 0, 1, CCW).CreationOK());
}

TEST(ArcConstruction, ParallelsLieOnTheRight) {
    EXPECT_FALSE(GmArc(Arc(0, 0, 10, 0, 60, CCW), -9.99995).CreationOK());
    EXPECT_FALSE(GmArc(GmArc(), 3).CreationOK());
    EXPECT_TRUE(rc::check("a positive distance goes to the right of the travel", [] {
        GmArc const source = AnyArc();
        double const d = AnyOffset();
        std::unique_ptr<GmCurve> const curve(source.GetParallel(d));
        auto const& parallel = static_cast<GmArc const&>(*curve);
        double const r = source.Dir() == CCW ? source.R() + d : source.R() - d;
        RC_ASSERT(parallel.IsArc() && parallel.CreationOK() == (r > 0));
        RC_ASSERT(parallel.R() == std::fmax(r, 0));
        if (r <= 0) return;
        GmVec const right(source.TangHP().Normalized(CW));
        RC_ASSERT(parallel.HP().Dist(GmPoint(source.HP() + d * right)) < 1e-9);
        RC_ASSERT(runs(parallel, Along(parallel, 0), Along(parallel, 1)));
        RC_ASSERT(parallel.Ang() == source.Ang() && parallel.Dir() == source.Dir());
    }));
}
