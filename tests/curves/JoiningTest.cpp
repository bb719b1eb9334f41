#include <cmath>
#include <stdexcept>

#include "curves/CurveCases.h"
#include "gmkernel/GmRect.h"

using namespace cases;

namespace {

GmBase::eRotDir constexpr CW = GmBase::eRotCW;
GmBase::eRotDir constexpr CCW = GmBase::eRotCCW;

GmStretch stretch(double x1, double y1, double x2, double y2) {
    return GmStretch(GmPoint(x1, y1), GmPoint(x2, y2));
}

GmArc arc(double x, double y, double r, double startDeg, double endDeg, GmBase::eRotDir rot) {
    return GmArc(GmPoint(x, y), r, startDeg * M_PI / 180, endDeg * M_PI / 180, rot);
}

struct Case {
    char const* name;
    std::shared_ptr<GmCurve> first;
    std::shared_ptr<GmCurve> next;
    bool joined;
    GmPoint joint;
};

template <class A, class B>
Case joining(char const* name, A const& first, B const& next, GmPoint const& joint) {
    return {name, std::make_shared<A>(first), std::make_shared<B>(next), true, joint};
}

template <class A, class B>
Case failing(char const* name, A const& first, B const& next) {
    return {name, std::make_shared<A>(first), std::make_shared<B>(next), false, GmPoint()};
}

/// Both curves end and start at the joint, or neither has moved.
template <class Join>
void expectJoint(Case const& c, Join const& join) {
    SCOPED_TRACE(c.name);
    GmPoint const end = c.joined ? c.joint : c.first->EP();
    GmPoint const start = c.joined ? c.joint : c.next->SP();
    EXPECT_EQ(join(*c.first, *c.next), c.joined);
    EXPECT_TRUE(IsAt(c.first->EP(), end.X(), end.Y()));
    EXPECT_EQ(c.next->SP(), start) << c.next->SP().GetTraceString();
}

GmStretch const flat = stretch(0, 0, 10, 0);

}  // namespace

TEST(Joining, TrimCutsBothCurvesToTheirCrossing) {
    GmStretch const across = stretch(-10, 3, 10, 3);
    Case const table[] = {
        joining("stretches", flat, stretch(5, -5, 5, 5), GmPoint(5, 0)),
        joining("already meeting", flat, stretch(10, 0.00005, 5, 5), GmPoint(10, 0)),
        failing("apart", flat, stretch(20, -5, 20, 5)),
        joining("the farther of two", flat, arc(5, 0, 2, -10, 190, CCW), GmPoint(7, 0)),
        joining("from the right", arc(0, 0, 5, -80, 170, CCW), across, GmPoint(-4, 3)),
        joining("from the left", arc(0, 0, 5, -100, 170, CCW), across, GmPoint(4, 3)),
        joining("a tie takes the first", arc(0, 0, 5, -90, 170, CCW), across, GmPoint(-4, 3)),
        joining("arcs", arc(0, 0, 5, -90, 90, CCW), arc(8, 0, 5, 200, 90, CW), GmPoint(4, 3)),
        failing("arcs whose circles cross elsewhere", arc(0, 0, 5, 90, 180, CCW),
                arc(8, 0, 5, 200, 90, CW)),
    };
    for (Case const& c : table) {
        expectJoint(c, [](GmCurve& a, GmCurve& b) { return a.Trim(&b); });
    }
    GmRect rect(0, 0, 1, 1);
    GmStretch s = flat;
    EXPECT_THROW(s.Trim(&rect), std::runtime_error);
    EXPECT_FALSE(s.Trim(nullptr));
    GmLine line(flat);
    EXPECT_FALSE(line.Trim(&s)) << "lines have no end";
}

TEST(Joining, ConcatMeetsOnTheCarriers) {
    Case const table[] = {
        joining("extended", flat, stretch(20, -5, 20, 5), GmPoint(20, 0)),
        joining("shortened", flat, stretch(4, 1, 4, 5), GmPoint(4, 0)),
        failing("parallel", flat, stretch(20, 1, 30, 1)),
        joining("onto an arc's circle", flat, arc(15, 0, 3, 90, 0, CW), GmPoint(12, 0)),
        joining("at the smaller angle, not distance", stretch(0, 4, 10, 4),
                arc(12, 0, 5, 0, 90, CCW), GmPoint(9, 4)),
        failing("past an arc", flat, arc(15, 9, 3, 90, 0, CW)),
        failing("other kinds", flat, GmCircle(GmPoint(5, 0), 2, true)),
        joining("arc to stretch", arc(0, 0, 5, 180, 80, CW), stretch(4, 9, 4, 5), GmPoint(4, 3)),
        failing("arc past stretch", arc(0, 0, 5, 180, 80, CW), stretch(6, 9, 6, 5)),
        joining("arc to arc", arc(0, 0, 5, 180, 10, CW), arc(8, 0, 5, 170, 90, CW), GmPoint(4, 3)),
        failing("arcs apart", arc(0, 0, 5, 180, 10, CW), arc(20, 0, 5, 170, 90, CW)),
        joining("concentric arcs that meet", arc(0, 0, 5, 180, 90, CW), arc(0, 0, 5, 90, 0, CW),
                GmPoint(0, 5)),
        failing("arc to other kinds", arc(0, 0, 5, 180, 80, CW), GmCircle(GmPoint(5, 0), 2, true)),
    };
    for (Case const& c : table) {
        expectJoint(c, [](GmCurve& a, GmCurve const& b) { return a.Concat(b); });
    }
}

TEST(Joining, ConnectsWithAStretchOrAnArc) {
    GmStretch s = flat;
    GmArc a = arc(10, -3, 3, 180, 90, CW);
    struct Row {
        char const* name;
        GmStretch next;
        bool round;
        GmPoint centre;
    };
    Row const table[] = {
        {"quarter", stretch(12, 2, 12, 10), true, GmPoint(10, 2)},
        {"half circle, coincident normals", stretch(10, 4, 0, 4), true, GmPoint(10, 2)},
        {"unequal distances", stretch(13, 2, 13, 10), false, GmPoint()},
        {"parallel normals", stretch(15, 2, 20, 2), false, GmPoint()},
    };
    for (Row const& row : table) {
        SCOPED_TRACE(row.name);
        // Stretch and arc end alike, at (10, 0) in the direction of x.
        for (GmCurve* first : {static_cast<GmCurve*>(&s), static_cast<GmCurve*>(&a)}) {
            std::unique_ptr<GmCurve> const link(first->Concat(row.next, 1));
            ASSERT_TRUE(link && link->CreationOK());
            EXPECT_EQ(link->SP(), first->EP());
            EXPECT_EQ(link->EP(), row.next.SP());
            EXPECT_EQ(link->IsArc(), row.round);
            if (!row.round) continue;
            EXPECT_EQ(static_cast<GmArc&>(*link).M(), row.centre);
            EXPECT_EQ(static_cast<GmArc&>(*link).Dir(), CCW);
        }
    }
    std::unique_ptr<GmCurve> const straight(a.Concat(stretch(12, 2, 12, 10), 0));
    EXPECT_TRUE(straight->IsStretch());
    GmLine const line(GmPoint(0, 9), GmDir(1, 0));
    for (GmCurve* first : {static_cast<GmCurve*>(&s), static_cast<GmCurve*>(&a)}) {
        EXPECT_EQ(first->Concat(stretch(12, 2, 12, 10), 2), nullptr);
        EXPECT_EQ(first->Concat(line, 1), nullptr);
    }
    EXPECT_EQ(GmCircle(GmPoint(0, 0), 1, true).Concat(line, 0), nullptr);
}

TEST(Joining, ConnectingArcsAreTangential) {
    EXPECT_TRUE(rc::check("the arc that was taken out comes back", [] {
        GmArc const link = AnyArc();
        GmStretch before(GmPoint(link.SP() - 2.0 * GmVec(link.TangSP())), link.SP());
        GmStretch const after(link.EP(), link.TangEP(), 2.0);
        GmBase::eRotDir const rot = link.Dir();
        GmArc around(GmArc(link, 0.25));
        around.Invert();
        GmArc const beyond(GmCircle(GmPoint(2.0 * link.EP() - link.M()), link.R(), true), link.EP(),
                           GmPoint(3.0 * link.EP() - 2.0 * link.M()), rot == CW ? CCW : CW);
        for (GmCurve const* next :
             {static_cast<GmCurve const*>(&after), static_cast<GmCurve const*>(&beyond)}) {
            std::unique_ptr<GmCurve> const found(before.Concat(*next, 1));
            RC_ASSERT(found && found->CreationOK() && found->IsArc());
            auto const& back = static_cast<GmArc const&>(*found);
            RC_ASSERT(back.SP() == link.SP() && back.EP() == link.EP());
            RC_ASSERT(back.M().Dist(link.M()) < 1e-6 && back.Dir() == rot);
        }
    }));
}
