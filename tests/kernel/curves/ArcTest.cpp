// SPDX-License-Identifier: MIT
#include <cmath>

#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"
#include "kernel/curves/kernels/AngleOrder.h"
#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

TEST(GmArc, OrdersThreeAngles) {
    for (int code = 0; code < 27; ++code) {
        int const a = code % 3, b = code / 3 % 3, c = code / 9;
        bool const distinct = a != b && b != c && a != c;
        GmBase::eRotDir const cyclic = (b - a + 3) % 3 == 1 ? CCW : CW;
        auto const angle = [](int i) { return 100.0 * i - 90.0; };
        EXPECT_EQ(gmkernel_detail::angleOrder(angle(a), angle(b), angle(c)),
                  distinct ? cyclic : GmBase::eRotNone)
            << a << b << c;
    }
}

TEST(GmArc, HoldsThePointsOfItsSweep) {
    GmArc arc = Arc(0, 0, 5, 0, 90, CCW);
    EXPECT_TRUE(arc.Element(GmPoint(3.005, 4.006))) << "within 0.01";
    EXPECT_FALSE(arc.Element(GmPoint(3.00603, 4.00804))) << "0.01005 off";
    EXPECT_TRUE(arc.Element(GmPoint(5, -0.00009)) && !arc.Element(GmPoint(5, -0.0002)));
    arc.SetEP(GmPoint(-9, 0));
    EXPECT_TRUE(arc.Element(GmPoint(-9, 0))) << "an end counts wherever it is";
    EXPECT_TRUE(arc.EAngDeg() == 180 && arc.R() == 5);
    GmArc const steep = Arc(0, 0, 5, 45, 90, CCW);
    EXPECT_EQ(steep.DistSP(GmPoint(steep.SP() + GmVec(5e-5, -5e-5, 0))), 0)
        << "start, not a turn on";

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
    }));
}

TEST(GmArc, IsFullWhenItsEndsMeet) {
    GmArc full = Arc(1, 2, 5, 0, 0, CW);
    EXPECT_TRUE(full.IsFullCircle() && full.Ang() == 0);
    EXPECT_DOUBLE_EQ(full.Length(), 10 * M_PI);
    EXPECT_EQ(full.BoundingRect(), GmRect(-4, -3, 6, 7));
    EXPECT_EQ(full.BoundingRect(true), GmRect(6, 2, 6, 2));
    EXPECT_EQ(Text(full.SectionPoint(1, 2)), "6,2");
    EXPECT_TRUE(full.Element(GmPoint(-4, 2.005)));
    EXPECT_FALSE(full.In(GmPoint(1, 2)) || full.Out(GmPoint(9, 9)));
    full.SetEP(GmPoint(6, 2.0000002));
    EXPECT_FALSE(full.IsFullCircle());
}

TEST(GmArc, TangentsPointInTheDirectionOfTravel) {
    EXPECT_TRUE(rc::check("tangents follow the curve", [] {
        GmArc const arc = AnyArc();
        auto const follows = [&](GmDir const& tangent, double from, double to) {
            return GmVec(tangent).equals(GmVec(GmDir(Along(arc, from), Along(arc, to))), 1e-3);
        };
        RC_ASSERT(follows(arc.TangSP(), 0, 1e-4));
        RC_ASSERT(follows(arc.TangHP(), 0.4999, 0.5001));
        RC_ASSERT(follows(arc.TangEP(), 0.9999, 1));
        // The radial direction turned by exchanging its components, not normalised anew.
        RC_ASSERT(std::fabs(arc.TangSP().X()) == std::fabs(std::sin(arc.SAng())));
    }));
}

TEST(GmArc, BoundingRectIsTight) {
    EXPECT_TRUE(rc::check("contains the arc and is touched on every side", [] {
        GmArc const arc = AnyArc();
        GmRect const box = arc.BoundingRect();
        GmRect reached;
        for (int i = 0; i <= 720; ++i)
            reached.Include(Along(arc, i / 720.0));
        for (double const excess : {reached.Left() - box.Left(), reached.Bottom() - box.Bottom(),
                                    box.Right() - reached.Right(), box.Top() - reached.Top()}) {
            RC_ASSERT(excess > -1e-9 && excess < arc.R() * 1e-4);
        }
    }));
    GmArc const undecided = Arc(0, 0, 5, 45, -45, GmBase::eRotNone);
    EXPECT_NEAR(undecided.BoundingRect().Width(), 0, 1e-9) << "without a sense only the ends count";
}

TEST(GmArc, InvertingReversesTheTravel) {
    EXPECT_TRUE(rc::check("the same points backwards", [] {
        GmArc const arc = AnyArc();
        GmArc inverse(arc);
        inverse.Invert();
        RC_ASSERT(inverse == arc.Inverted() && inverse != arc);
        RC_ASSERT(Along(inverse, 0.3).Dist(Along(arc, 0.7)) < 1e-9);
        RC_ASSERT(GmVec(inverse.TangSP()).equals(-GmVec(arc.TangEP()), 1e-9));
    }));
    GmArc loose = Arc(0, 0, 5, 0, 60, CCW);
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
        RC_ASSERT(moved.CreationOK() && (moved.Dir() == arc.Dir()) != mirror);
        for (double const t : {0.0, 0.25, 0.8, 1.0}) {
            GmPoint p = Along(arc, t);
            p.Transform(m);
            RC_ASSERT(p.Dist(Along(moved, t)) < 1e-6);
        }
    }));
    GmArc quarter = Arc(1, 2, 5, 0, 90, CCW);
    quarter.Translation(GmVec(-1, -2, 0));
    EXPECT_EQ(quarter.GetTraceString(),
              "circ3 (5.00000, 0.00000) - (0.00000, 5.00000) mp (0.00000, 0.00000)");
    quarter.Transform(GmMatrix().Scale(GmVec(1, -1, 1)));
    EXPECT_EQ(quarter, Arc(0, 0, 5, 0, -90, CW));
    EXPECT_EQ(quarter.GetTraceString().substr(0, 6), "circ2 ");
}
