#include <cmath>

#include "curves/CurveCases.h"

using namespace cases;

namespace {

GmBase::eRotDir constexpr CW = GmBase::eRotCW;
GmBase::eRotDir constexpr CCW = GmBase::eRotCCW;

bool sameEnds(GmArc const& arc, GmPoint const& sp, GmPoint const& ep) {
    return arc.CreationOK() && arc.IsArc() && arc.SP() == sp && arc.EP() == ep;
}

}  // namespace

TEST(ArcConstruction, ThroughThreePoints) {
    EXPECT_TRUE(rc::check("passes the points in their order", [] {
        GmPoint const a = AnyGridPoint();
        GmPoint const b = AnyGridPoint();
        GmPoint const c = AnyGridPoint();
        GmArc const arc(a, b, c);
        double const area = ((b - a) % (c - a)).Z();
        RC_ASSERT(arc.IsArc());
        RC_ASSERT(arc.CreationOK() == (area != 0.0));
        if (area == 0.0) return;
        RC_ASSERT(sameEnds(arc, a, c));
        RC_ASSERT(arc.Dir() == (area > 0 ? CCW : CW));
        RC_ASSERT(ExactDist(arc, b) < 1e-6 * arc.R());
        RC_ASSERT(arc.DistSP(b) > 0 && arc.DistSP(b) < arc.Length());
    }));
    GmPoint const p(1, 1);
    for (GmArc const& undefined : {GmArc(p, GmPoint(), GmPoint(2, 2)), GmArc(p, p, GmPoint(2, 5)),
                                   GmArc(p, GmPoint(2, 5), p)}) {
        EXPECT_TRUE(undefined.IsArc() && !undefined.CreationOK());
    }
}

TEST(ArcConstruction, OfGivenRadius) {
    GmPoint const sp(0, 0), ep(8, 0);
    EXPECT_TRUE(IsAt(GmArc(sp, ep, 5.0, true, CCW).M(), 4, 3)) << "on the left";
    EXPECT_TRUE(IsAt(GmArc(sp, ep, -5.0, false, CCW).M(), 4, -3));
    EXPECT_TRUE(IsAt(GmArc(sp, ep, 5.0, true, CW).M(), 4, -3));
    EXPECT_FALSE(GmArc(sp, ep, 3.9, true, CCW).CreationOK()) << "the chord is too long";
    EXPECT_FALSE(GmArc(sp, sp, 5.0, true, CCW).CreationOK());
    EXPECT_FALSE(GmArc(sp, GmPoint(), 5.0, true, CCW).CreationOK());
    EXPECT_TRUE(GmArc(sp, ep, 4.0, true, CW).CreationOK()) << "a half circle counts as short";

    EXPECT_TRUE(rc::check("short and long arcs in both senses", [] {
        GmStretch const chord = AnyStretch();
        double const r = chord.Length() * *rc::gen::element(0.51, 0.6, 1.0, 7.0);
        bool const bShort = *rc::gen::element(true, false);
        GmBase::eRotDir const rot = AnySense();
        GmArc const arc(chord.SP(), chord.EP(), r, bShort, rot);
        RC_ASSERT(sameEnds(arc, chord.SP(), chord.EP()));
        RC_ASSERT(arc.R() == r && arc.Dir() == rot);
        RC_ASSERT(std::fabs(arc.M().Dist(arc.EP()) - r) < 1e-9 * r);
        RC_ASSERT((arc.Ang() < M_PI) == bShort);
    }));
}

TEST(ArcConstruction, AboutACentreNearTheOneGiven) {
    GmArc const exact(GmPoint(5, 0), GmPoint(0, 5), GmPoint(0, 0), CCW);
    EXPECT_TRUE(IsAt(exact.M(), 0, 0) && exact.R() == 5);
    EXPECT_NEAR(exact.EAng() - exact.SAng(), M_PI / 2, 1e-12);
    GmArc const longChord(GmPoint(0, 0), GmPoint(10, 0), GmPoint(1, 0.5), CW);
    EXPECT_TRUE(IsAt(longChord.M(), 5, 7.5)) << "the distance from the end gives the radius";
    EXPECT_DOUBLE_EQ(longChord.R(), std::sqrt(81.25));
    GmArc const full(GmPoint(1, 0), GmPoint(1, 0), GmPoint(7, 0), CW);
    EXPECT_TRUE(full.IsFullCircle() && full.R() == 6);
    EXPECT_FALSE(GmArc(GmPoint(5, 0), GmPoint(0, 5), GmPoint(), CCW).CreationOK());

    EXPECT_TRUE(rc::check("ends on the circle, centre on the side of the given one", [] {
        GmStretch const chord = AnyStretch();
        GmPoint const m = AnyGridPoint();
        GmArc const arc(chord.SP(), chord.EP(), m, CCW);
        RC_ASSERT(sameEnds(arc, chord.SP(), chord.EP()));
        RC_ASSERT(std::fabs(arc.M().Dist(arc.SP()) - arc.R()) < 1e-7);
        RC_ASSERT(std::fabs(arc.M().Dist(arc.EP()) - arc.R()) < 1e-7);
        GmLine const line(chord);
        RC_ASSERT(line.PointPos(m) * line.PointPos(arc.M()) >= 0);
    }));
}

TEST(ArcConstruction, OnACircle) {
    GmCircle const circle(GmPoint(0, 0), 5, true);
    GmPoint const east(5, 0), north(0, 5), off(5.0002, 0);
    GmArc const shortWay(circle, east, north, true);
    EXPECT_EQ(shortWay.Dir(), CCW);
    EXPECT_DOUBLE_EQ(shortWay.Ang(), M_PI / 2);
    GmArc const longWay(circle, east, north, false);
    EXPECT_EQ(longWay.Dir(), CW);
    EXPECT_DOUBLE_EQ(longWay.Ang(), 3 * M_PI / 2);
    EXPECT_EQ(GmArc(circle, east, east, true).Dir(), GmBase::eRotNone);
    EXPECT_FALSE(GmArc(circle, GmPoint(5.0003, 0), north, true).CreationOK());
    EXPECT_TRUE(GmArc(circle, GmPoint(6, 0), GmPoint(0, 6), true).CreationOK())
        << "radius not tested";

    EXPECT_EQ(GmArc(circle, east, north, CCW), shortWay);
    GmArc const missed(circle, off, north, CCW);
    EXPECT_TRUE(!missed.CreationOK() && missed.IsArc());
    EXPECT_TRUE(missed.R() == 5 && !missed.SP().CreationOK()) << "keeps the circle";
    EXPECT_EQ(GmArc(circle, GmPoint(), north, CCW).R(), 0) << "undefined input clears it";
    EXPECT_FALSE(GmArc(GmCircle(), GmPoint(0, 0), GmPoint(0, 0), CCW).CreationOK());

    GmArc const byAngles(circle, 0, 2.5 * M_PI, CCW);
    EXPECT_TRUE(sameEnds(byAngles, east, north));
    EXPECT_NEAR(byAngles.EAngDeg(), 90, 1e-9) << "angles are taken into one turn";
    EXPECT_FALSE(GmArc(GmPoint(0, 0), -5, 0, 1, CCW).CreationOK()) << "negative radius";
    EXPECT_FALSE(GmArc(GmPoint(), 5, 0, 1, CCW).CreationOK());
    EXPECT_FALSE(GmArc(GmCircle(), 0, 1, CCW).CreationOK());
}

TEST(ArcConstruction, ParallelsLieOnTheRight) {
    GmArc const arc(GmPoint(0, 0), 10, 0, 1, CCW);
    EXPECT_EQ(GmArc(arc, 3).R(), 13);
    EXPECT_FALSE(GmArc(arc, -9.99995).CreationOK());
    EXPECT_TRUE(GmArc(arc, -9.9998).CreationOK());
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
        GmVec const shift = parallel.HP() - source.HP();
        GmVec const right(source.TangHP().Normalized(CW));
        RC_ASSERT((shift - d * right).Length() < 1e-9);
        RC_ASSERT(std::fabs(parallel.SP().Dist(source.SP()) - std::fabs(d)) < 1e-9);
        RC_ASSERT(parallel.Ang() == source.Ang() && parallel.Dir() == source.Dir());
    }));
}
