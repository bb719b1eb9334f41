// SPDX-License-Identifier: MIT
#include <stdexcept>

#include "gmkernel/GmRect.h"
#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

namespace {

using Curve = std::shared_ptr<GmCurve>;

template <class C>
Curve hold(C const& curve) {
    return Curve(curve.Clone());
}

/// Two curves and the point where they are expected to be joined, empty when they are not.
struct Case {
    char const* name;
    Curve first, next;
    std::string joint;
};

template <class Join>
void expectJoint(Case const& c, Join const& join) {
    bool const joined = !c.joint.empty();
    std::string const end = joined ? c.joint : Text(c.first->EP());
    std::string const start = joined ? c.joint : Text(c.next->SP());
    EXPECT_EQ(join(*c.first, *c.next), joined) << c.name;
    EXPECT_EQ(Text(c.first->EP()), end) << c.name;
    EXPECT_EQ(Text(c.next->SP()), start) << c.name;
}

Curve flat() {
    return hold(Stretch(0, 0, 10, 0));
}

Curve above() {
    return hold(Stretch(-10, 3, 10, 3));
}

}  // namespace

TEST(Joining, TrimCutsBothCurvesToTheirCrossing) {
    Case const table[] = {
        {"stretches", flat(), hold(Stretch(5, -5, 5, 5)), "5,0"},
        {"apart", flat(), hold(Stretch(20, -5, 20, 5)), ""},
        {"the farther of two", flat(), hold(Arc(5, 0, 2, -10, 190, CCW)), "7,0"},
        {"from the right", hold(Arc(0, 0, 5, -80, 170, CCW)), above(), "-4,3"},
        {"from the left", hold(Arc(0, 0, 5, -100, 170, CCW)), above(), "4,3"},
        {"a tie takes the first", hold(Arc(0, 0, 5, -90, 170, CCW)), above(), "-4,3"},
        {"arcs", hold(Arc(0, 0, 5, -90, 90, CCW)), hold(Arc(8, 0, 5, 200, 90, CW)), "4,3"},
        {"circles alone", hold(Arc(0, 0, 5, 90, 180, CCW)), hold(Arc(8, 0, 5, 200, 90, CW)), ""},
        {"no end", hold(GmLine(Stretch(0, 0, 10, 0))), hold(Stretch(5, -5, 5, 5)), ""},
    };
    for (Case const& c : table) {
        expectJoint(c, [](GmCurve& a, GmCurve& b) { return a.Trim(&b); });
    }
    GmStretch s = Stretch(0, 0, 10, 0), meeting = Stretch(10, 0.00005, 5, 5);
    EXPECT_TRUE(s.Trim(&meeting));
    EXPECT_EQ(Text(meeting.SP()), "10,5e-05") << "curves that meet already are left alone";
    EXPECT_FALSE(s.Trim(nullptr));
    GmRect rect(0, 0, 1, 1);
    EXPECT_THROW(s.Trim(&rect), std::runtime_error);
}

TEST(Joining, ConcatMeetsOnTheSupportingCurves) {
    Curve const other = hold(Circle(5, 0, 2));
    auto const left = [] { return hold(Arc(0, 0, 5, 180, 80, CW)); };
    Case const table[] = {
        {"extended", flat(), hold(Stretch(20, -5, 20, 5)), "20,0"},
        {"shortened", flat(), hold(Stretch(4, 1, 4, 5)), "4,0"},
        {"parallel", flat(), hold(Stretch(20, 1, 30, 1)), ""},
        {"onto an arc's circle", flat(), hold(Arc(15, 0, 3, 90, 0, CW)), "12,0"},
        {"at the smaller angle", hold(Stretch(0, 4, 13, 4)), hold(Arc(12, 0, 5, 0, 9, CCW)),
         "15,4"},
        {"past an arc", flat(), hold(Arc(15, 9, 3, 90, 0, CW)), ""},
        {"other kinds", flat(), other, ""},
        {"arc to stretch", left(), hold(Stretch(4, 9, 4, 5)), "4,3"},
        {"arc past stretch", left(), hold(Stretch(6, 9, 6, 5)), ""},
        {"arc to arc", left(), hold(Arc(8, 0, 5, 170, 90, CW)), "4,3"},
        {"arc to arc below", hold(Arc(0, 0, 5, 180, 260, CCW)), hold(Arc(8, 0, 5, 9, 90, CW)),
         "4,-3"},
        {"arcs apart", left(), hold(Arc(20, 0, 5, 170, 90, CW)), ""},
        {"arc to other kinds", left(), other, ""},
    };
    for (Case const& c : table) {
        expectJoint(c, [](GmCurve& a, GmCurve const& b) { return a.Concat(b); });
    }
    EXPECT_TRUE(Arc(0, 0, 5, 180, 90, CW).Concat(Arc(0, 0, 5, 90, 0, CW))) << "meeting, concentric";
}

TEST(Joining, ConnectsWithAStretchOrAnArc) {
    struct Row {
        char const* name;
        GmStretch next;
        std::string centre;
    };
    Row const table[] = {
        {"quarter", Stretch(12, 2, 12, 10), "10,2"},
        {"half circle, coincident normals", Stretch(10, 4, 0, 4), "10,2"},
        {"unequal distances", Stretch(13, 2, 13, 10), "none"},
        {"slightly unequal distances", Stretch(12.0002, 2, 12.0002, 10), "none"},
        {"parallel normals", Stretch(15, 2, 20, 2), "none"},
    };
    // Both end at (10, 0) in the direction of x.
    for (Curve const& first : {flat(), hold(Arc(10, -3, 3, 180, 90, CW))}) {
        for (Row const& row : table) {
            SCOPED_TRACE(row.name);
            std::unique_ptr<GmCurve> const link(first->Concat(row.next, 1));
            EXPECT_EQ(TextOf({link->SP(), link->EP()}), TextOf({first->EP(), row.next.SP()}));
            auto const* arc = dynamic_cast<GmArc const*>(link.get());
            EXPECT_EQ(arc ? Text(arc->M()) : "none", row.centre);
            EXPECT_TRUE(arc == nullptr || (arc->CreationOK() && arc->Dir() == CCW));
        }
        std::unique_ptr<GmCurve> const straight(first->Concat(table[0].next, 0));
        EXPECT_TRUE(straight->IsStretch());
        EXPECT_EQ(first->Concat(table[0].next, 2), nullptr);
        EXPECT_EQ(first->Concat(GmLine(table[0].next), 1), nullptr);
    }
}

TEST(Joining, ConnectingArcsAreTangential) {
    EXPECT_TRUE(rc::check("an arc taken out between tangential neighbours comes back", [] {
        GmArc const link = AnyArc();
        GmBase::eRotDir const turned = link.Dir() == CW ? CCW : CW;
        auto const beside = [&](GmPoint const& end, double sAng, double eAng) {
            GmPoint const m(2.0 * end - link.M());
            return GmArc(m, link.R(), sAng + M_PI, eAng + M_PI, turned);
        };
        double const s = link.SAng(), e = link.EAng(), bend = link.Dir() == CW ? -2.0 : 2.0;
        Curve const before[] = {
            hold(GmStretch(GmPoint(link.SP() - GmVec(link.TangSP())), link.SP())),
            hold(beside(link.SP(), s + bend, s))};
        Curve const after[] = {hold(GmStretch(link.EP(), link.TangEP(), 2.0)),
                               hold(beside(link.EP(), e, e - bend))};
        for (Curve const& from : before) {
            for (Curve const& to : after) {
                std::unique_ptr<GmCurve> const found(from->Concat(*to, 1));
                auto const* back = dynamic_cast<GmArc const*>(found.get());
                RC_ASSERT(back != nullptr);
                RC_ASSERT(back->CreationOK());
                RC_ASSERT(back->SP() == link.SP() && back->EP() == link.EP());
                RC_ASSERT(back->M().Dist(link.M()) < 1e-6 && back->Dir() == link.Dir());
            }
        }
    }));
}
