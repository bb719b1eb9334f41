#include <algorithm>
#include <cmath>

#include "curves/CurveCases.h"
#include "curves/kernels/AngleOrder.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"

using namespace cases;

namespace {

GmBase::eRotDir constexpr CW = GmBase::eRotCW;
GmBase::eRotDir constexpr CCW = GmBase::eRotCCW;

}  // namespace

TEST(GmArc, OrdersThreeAngles) {
    for (int code = 0; code < 27; ++code) {
        int const a = code % 3, b = code / 3 % 3, c = code / 9;
        bool const distinct = a != b && b != c && a != c;
        GmBase::eRotDir const sense = !distinct              ? GmBase::eRotNone
                                      : (b - a + 3) % 3 == 1 ? CCW
                                                             : CW;
        auto const angle = [](int i) { return GmAngle(100.0 * i - 90.0, false); };
        EXPECT_EQ(gmkernel_detail::angleOrder(angle(a), angle(b), angle(c)), sense) << a << b << c;
    }
}

TEST(GmArc, HoldsThePointsOfItsSweep) {
    GmArc const arc(GmPoint(0, 0), 5, 0, M_PI / 2, CCW);
    double const c = std::sqrt(0.5);
    EXPECT_TRUE(arc.Element(GmPoint(5.0099 * c, 5.0099 * c)));
    EXPECT_FALSE(arc.Element(GmPoint(5.0101 * c, 5.0101 * c)));
    EXPECT_FALSE(arc.Element(GmPoint(5.001 * c, 5.001 * c), 0.0005));
    EXPECT_TRUE(arc.Element(GmPoint(5, -0.00009))) << "as good as the start";
    EXPECT_FALSE(arc.Element(GmPoint(5, -0.0002)));
    EXPECT_FALSE(arc.Element(GmPoint(5 * c, -5 * c)));
    GmArc moved(arc);
    moved.SetEP(GmPoint(-9, 0));
    EXPECT_TRUE(moved.Element(GmPoint(-9, 0))) << "an end counts wherever it is";
    EXPECT_TRUE(moved.EAngDeg() == 180 && moved.R() == 5);

    EXPECT_TRUE(rc::check("the sweep and nothing else, lengths along it", [] {
        GmArc const any = AnyArc();
        double const t = *rc::gen::inRange(1, 50) / 50.0;
        GmPoint const p = Along(any, t);
        RC_ASSERT(any.Element(p, 1e-6));
        RC_ASSERT(std::fabs(any.DistSP(p) - t * any.Length()) < 1e-6);
        GmArc const rest(GmCircle(any), any.EAng(), any.SAng(), any.Dir());
        RC_ASSERT(!any.Element(Along(rest, t)));
        RC_ASSERT(std::fabs(any.Length() + rest.Length() - 2 * M_PI * any.R()) < 1e-9);
        RC_ASSERT(any.SectionPoint(7, 10).Dist(Along(any, 0.7)) < 1e-9);
        RC_ASSERT(any.HP().Dist(Along(any, 0.5)) < 1e-9);
    }));
}

TEST(GmArc, IsFullWhenItsEndsMeet) {
    GmArc const full(GmPoint(1, 2), 5, 0, 0, CW);
    EXPECT_TRUE(full.IsFullCircle());
    EXPECT_EQ(full.Ang(), 0);
    EXPECT_DOUBLE_EQ(full.Length(), 10 * M_PI);
    EXPECT_EQ(full.BoundingRect(), GmRect(-4, -3, 6, 7));
    EXPECT_EQ(full.BoundingRect(true), GmRect(6, 2, 6, 2));
    EXPECT_TRUE(IsAt(full.SectionPoint(1, 2), 6, 2));
    EXPECT_TRUE(full.Element(GmPoint(-4, 2.005)));
    EXPECT_EQ(full.DistSP(GmPoint(6.00005, 2)), 0);
    GmArc const nearlyFull(GmCircle(GmPoint(0, 0), 5, true), GmPoint(5, 0), GmPoint(5, 2e-7), CW);
    EXPECT_FALSE(nearlyFull.IsFullCircle());
    EXPECT_EQ(nearlyFull.BoundingRect(true), nearlyFull.BoundingRect(false));
}

TEST(GmArc, TangentsPointInTheDirectionOfTravel) {
    EXPECT_TRUE(rc::check("tangents follow the curve", [] {
        GmArc const arc = AnyArc();
        double const h = 1e-4;
        auto const follows = [&](GmDir const& tangent, double from, double to) {
            return (GmVec(GmDir(Along(arc, from), Along(arc, to))) - GmVec(tangent)).Length() <
                   1e-3;
        };
        RC_ASSERT(follows(arc.TangSP(), 0, h));
        RC_ASSERT(follows(arc.TangHP(), 0.5 - h, 0.5 + h));
        RC_ASSERT(follows(arc.TangEP(), 1 - h, 1));
        // The radial direction turned by exchanging components, not normalised anew.
        GmDir const radial(GmAngle(arc.SAngDeg(), false));
        double const sense = arc.Dir() == CCW ? 1.0 : -1.0;
        RC_ASSERT(arc.TangSP().X() == -sense * radial.Y());
        RC_ASSERT(arc.TangSP().Y() == sense * radial.X());
    }));
}

TEST(GmArc, BoundingRectIsTight) {
    EXPECT_TRUE(rc::check("contains the arc and is touched on every side", [] {
        GmArc const arc = AnyArc();
        GmRect const box = arc.BoundingRect();
        GmRect reached;
        for (int i = 0; i <= 720; ++i)
            reached.Include(Along(arc, i / 720.0));
        double const sagitta = arc.R() * 1e-4;
        for (double const excess : {reached.Left() - box.Left(), reached.Bottom() - box.Bottom(),
                                    box.Right() - reached.Right(), box.Top() - reached.Top()}) {
            RC_ASSERT(excess > -1e-9);
            RC_ASSERT(excess < sagitta);
        }
    }));
    GmArc const undecided(GmCircle(GmPoint(0, 0), 5, true), M_PI / 4, -M_PI / 4, GmBase::eRotNone);
    EXPECT_NEAR(undecided.BoundingRect().Width(), 0, 1e-9) << "without a sense only the ends count";
}

TEST(GmArc, InvertingReversesTheTravel) {
    EXPECT_TRUE(rc::check("the same points backwards", [] {
        GmArc const arc = AnyArc();
        GmArc inverse(arc);
        inverse.Invert();
        RC_ASSERT(inverse == arc.Inverted());
        RC_ASSERT(inverse != arc);
        RC_ASSERT(Along(inverse, 0.3).Dist(Along(arc, 0.7)) < 1e-9);
        RC_ASSERT(GmVec(inverse.TangSP()).equals(-GmVec(arc.TangEP()), 1e-9));
        inverse.Invert();
        RC_ASSERT(inverse == arc);
    }));
    GmArc loose(GmPoint(0, 0), 5, 0, 1, CCW);
    loose.SetEP(GmPoint(0, 9));
    EXPECT_FALSE(loose.Inverted().CreationOK()) << "an end off the circle";
}

TEST(GmArc, TransformKeepsIncidence) {
    EXPECT_TRUE(rc::check("points of the arc move with it", [] {
        GmArc const arc = AnyArc();
        bool const mirror = *rc::gen::element(true, false);
        double const scale = *rc::gen::element(0.5, 1.0, 20.0);
        GmMatrix m = GmMatrix::matrixTranslate(AnyGridPoint());
        m.Rotate(GmVec(0, 0, -1), *rc::gen::inRange(-12, 13) * 15.0);
        m.Scale(GmVec(scale, mirror ? -scale : scale, 1));
        GmArc moved(arc);
        moved.Transform(m);
        RC_ASSERT(moved.CreationOK() && moved.IsArc());
        RC_ASSERT((moved.Dir() == arc.Dir()) != mirror);
        RC_ASSERT(std::fabs(moved.R() - scale * arc.R()) < 1e-6);
        for (double const t : {0.0, 0.25, 0.8, 1.0}) {
            GmPoint p = Along(arc, t);
            p.Transform(m);
            RC_ASSERT(p.Dist(Along(moved, t)) < 1e-6);
        }
    }));
    GmArc quarter(GmPoint(1, 2), 5, 0, M_PI / 2, CCW);
    quarter.Translation(GmVec(-1, -2, 0));
    EXPECT_EQ(quarter.GetTraceString(),
              "circ3 (5.00000, 0.00000) - (0.00000, 5.00000) mp (0.00000, 0.00000)");
    quarter.Transform(GmMatrix().Scale(GmVec(1, -1, 1)));
    EXPECT_EQ(quarter, GmArc(GmPoint(0, 0), 5, 0, -M_PI / 2, CW));
    EXPECT_EQ(quarter.GetTraceString().substr(0, 6), "circ2 ");
}

TEST(GmArc, NeverHasAnInside) {
    GmArc arc(GmPoint(0, 0), 5, 0, 0, CCW);
    EXPECT_FALSE(arc.In(GmPoint(0, 0)) || arc.Out(GmPoint(9, 9)));
    EXPECT_TRUE(IsAt(arc.MinDist(GmPoint(0, 0), false), 5, 0)) << "the centre answers the start";
    GmArc const half(GmPoint(0, 0), 5, 0, M_PI, CCW);
    EXPECT_TRUE(IsAt(half.MinDist(GmPoint(0, -3), false), -5, 0)) << "a tie goes to the end";
    EXPECT_TRUE(IsAt(half.MinDist(GmPoint(-1, -3), true), 5, 0)) << "the start is preferred";
}
