// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

namespace {

using shapes::Path;

constexpr long kFirstId = 31;
constexpr long kSecondId = 32;

/// An element of length about 20 that leaves the origin in the direction of travel (degrees):
/// 's' a segment, 'l' and 'r' arcs of radius 20 that turn left or right.
std::unique_ptr<GmCurve> Leaving(char kind, double degrees) {
    const double a = degrees * M_PI / 180.0;
    const GmPoint origin(0, 0);
    const GmDir along(std::cos(a), std::sin(a));
    if (kind == 's') return std::make_unique<GmStretch>(origin, along, 20.0);
    const GmBase::eRotDir rot = kind == 'l' ? GmBase::eRotCCW : GmBase::eRotCW;
    const GmVec toOrigin = -20.0 * GmVec(along.Normalized(rot));
    const double start = std::atan2(toOrigin.Y(), toOrigin.X());
    return std::make_unique<GmArc>(GmPoint(-toOrigin), 20.0, start, start + int(rot), rot);
}

/// One that arrives at the origin.
std::unique_ptr<GmCurve> Arriving(char kind, double degrees) {
    // Run the other way it leaves, turning to the other side.
    const char reversed = kind == 'l' ? 'r' : kind == 'r' ? 'l' : 's';
    std::unique_ptr<GmCurve> curve = Leaving(reversed, degrees + 180.0);
    curve->Invert();
    return curve;
}

GmContour Corner(char first, char second, double turn) {
    GmContour corner;
    EXPECT_TRUE(corner.AddElement(*Arriving(first, 10.0), false, kFirstId));
    EXPECT_TRUE(corner.AddElement(*Leaving(second, 10.0 + turn), false, kSecondId));
    return corner;
}

void ExpectFitsIn(GmCurve const& transition, GmContour const& before, double prec) {
    EXPECT_TRUE(before.GetElement(0)->Element(transition.SP(), prec));
    EXPECT_TRUE(before.GetElement(1)->Element(transition.EP(), prec));
}

void ExpectJoints(GmContour const& contour) {
    for (int i = 1; i < contour.ElementCount(); ++i)
        EXPECT_EQ(contour.GetElement(i)->SP(), contour.GetElement(i - 1)->EP()) << i;
}

using Type = GmContour::eTransType;

void ExpectShape(GmContour const& contour, Type type, double value, bool bExact) {
    GmCurve const& trans = *contour.GetElement(1);
    if (type == GmContour::eTransRadius) {
        ASSERT_TRUE(trans.IsArc());
        EXPECT_EQ(static_cast<GmArc const&>(trans).R(), value);
        EXPECT_EQ(trans.TangSP(), contour.GetElement(0)->TangEP());
        EXPECT_EQ(trans.TangEP(), contour.GetElement(2)->TangSP());
        return;
    }
    EXPECT_NEAR(trans.SP().Length(), trans.EP().Length(), 1e-9);
    if (type == GmContour::eTransChamferDist)
        EXPECT_NEAR(trans.SP().Length(), value, 1e-9);
    else
        EXPECT_NEAR(trans.Length(), value, bExact ? 1e-9 : 0.005);
}

void ExpectTransition(char first, char second, double turn, Type type) {
    const double value = 2.0;
    const std::string kinds = {first, second};
    SCOPED_TRACE(kinds + " " + std::to_string(turn) + " " + std::to_string(type));
    const GmContour before = Corner(first, second, turn);
    GmContour contour(before);
    contour.GetContElement(0)->lId = kFirstId;
    contour.GetContElement(1)->lId = kSecondId;
    ASSERT_TRUE(contour.AddTrans(type, 0, value, turn > 0));
    ASSERT_EQ(contour.ElementCount(), 3);
    ExpectJoints(contour);
    ExpectFitsIn(*contour.GetElement(1), before, 1e-6);
    EXPECT_EQ(contour.GetElement(0)->SP(), before.GetElement(0)->SP());
    EXPECT_EQ(contour.GetElement(2)->EP(), before.GetElement(1)->EP());
    GmContElement const& record = *contour.GetContElement(1);
    EXPECT_EQ(record.lId, turn > 0 ? kFirstId : kSecondId);
    EXPECT_TRUE(record.bInserted && record.lIndex == 1);
    ExpectShape(contour, type, value, kinds == "ss");
}

}  // namespace

TEST(Transitions, FitBetweenEveryPairOfElementsInBothSenses) {
    for (const char first : {'s', 'l', 'r'}) {
        for (const char second : {'s', 'l', 'r'}) {
            for (const auto type : {GmContour::eTransRadius, GmContour::eTransChamferDist,
                                    GmContour::eTransChamferLength}) {
                ExpectTransition(first, second, 70.0, type);
                ExpectTransition(first, second, -70.0, type);
            }
        }
    }
}

TEST(Transitions, KeepTheContourClosedAtItsLastJunction) {
    // The half circle's end meets the lower side with a bend, the upper side starts smoothly.
    const GmContour source = Path("0 0  10 0  10 6  ccw 4 6 4 12  0 8  0 0");
    for (int first = 0; first < source.ElementCount(); ++first) {
        GmContour contour = shapes::StartedAt(source, first);
        const int last = static_cast<int>(contour.ElementCount()) - 1;
        GmContour inner = shapes::StartedAt(source, (first + 1) % static_cast<int>(last + 1));
        const bool made = contour.AddTrans(GmContour::eTransRadius, last, 0.5, true);
        EXPECT_EQ(made, inner.AddTrans(GmContour::eTransRadius, last - 1, 0.5, true));
        EXPECT_TRUE(contour.IsClosed());
        EXPECT_EQ(contour.ElementCount(), inner.ElementCount());
        EXPECT_NEAR(shapes::ChainLength(contour), shapes::ChainLength(inner), 1e-9);
        EXPECT_EQ(contour.GetElement(static_cast<int>(contour.ElementCount()) - 1)->EP(),
                  contour.GetElement(0)->SP());
    }
}

TEST(Transitions, ThatAreNotNeededOrDoNotFitLeaveTheElements) {
    struct {
        char const* chain;
        GmContour::eTransType type;
        int index;
        double value;
        bool bResult;
    } const table[] = {
        {"0 0  10 0  20 0", GmContour::eTransChamferDist, 0, 2, true},
        {"0 0  10 0  ccw 10 5 15 5", GmContour::eTransRadius, 0, 2, true},
        {"0 0  10 0  10 10", GmContour::eTransRadius, 0, 10.1, false},
        {"0 0  10 0  10 10", GmContour::eTransRadius, 0, 0, false},
        {"0 0  10 0  10 10", GmContour::eTransRadius, 1, 1, false},
        {"0 0  10 0  10 10", GmContour::eTransRadius, -1, 1, false},
        {"0 0  10 0  10 10", static_cast<GmContour::eTransType>(4), 0, 1, false},
        {"0 0  10 0  10 10", GmContour::eTransChamferLength, 0, std::nan(""), false},
        {"0 0  10 0  cw 15 0 15 5", GmContour::eTransChamferLength, 0, 0.005, false},
        {"0 0  10 0  cw 15 0 15 5", GmContour::eTransChamferLength, 0, -1, false},
        {"0 0  10 0  cw 15 0 15 5", GmContour::eTransChamferLength, 0, 1e9, false},
        {"0 0  10 0  cw 15 0 15 5", GmContour::eTransChamferLength, 0,
         std::numeric_limits<double>::infinity(), false},
    };
    for (auto const& c : table) {
        GmContour contour = Path(c.chain);
        EXPECT_EQ(contour.AddTrans(c.type, c.index, c.value, true), c.bResult) << c.chain;
        EXPECT_EQ(contour, Path(c.chain)) << c.type << " " << c.value;
    }
}

TEST(Transitions, TakeAwayElementsThatShrinkToNothing) {
    GmContour contour = Path("0 0  10 0  10 3");
    EXPECT_TRUE(contour.AddTrans(GmContour::eTransRadius, 0, 3, true));
    EXPECT_EQ(contour, Path("0 0  7 0  ccw 7 3 10 3"));
    GmContour shortened = Path("0 0  10 0  10 0.00005  20 0.00005");
    EXPECT_FALSE(shortened.AddTrans(GmContour::eTransRadius, -1, 3, true));
    EXPECT_EQ(shortened.ElementCount(), 2);
}

TEST(Transitions, ComeWithTheElementThatIsAppended) {
    GmContour contour;
    const GmStretch a(GmPoint(0, 0), GmPoint(10, 0));
    const GmStretch b(GmPoint(10, 0), GmPoint(10, 10));
    EXPECT_FALSE(contour.AddElementAndTrans(a, true, 5, GmContour::eTransRadius, 2, true));
    EXPECT_FALSE(contour.AddElementAndTrans(nullptr, true, 5, GmContour::eTransRadius, 2, true));
    EXPECT_TRUE(contour.AddElementAndTrans(&b, true, 6, GmContour::eTransChamferDist, 2, false));
    EXPECT_EQ(contour, Path("0 0  8 0  10 2  10 10"));
    EXPECT_EQ(shapes::Identifiers(contour), (std::vector<long>{5, 6, 6}));
}

TEST(Transitions, AnArcOfItsOwnJoinsTwoCurves) {
    struct OpenContour : GmContour {
        using GmContour::GetArc;
    } contour;
    GmStretch a(GmPoint(0, 0), GmPoint(10, 0));
    GmStretch b(GmPoint(9, 1), GmPoint(9, 10));
    const std::unique_ptr<GmCurve> arc(contour.GetArc(&a, &b, 3, GmBase::eRotCCW));
    ASSERT_TRUE(arc && arc->IsArc());
    EXPECT_TRUE(arc->SP() == a.EP() && arc->EP() == b.SP());
    EXPECT_NEAR(static_cast<GmArc const&>(*arc).M().Dist(GmPoint(10, 3)), 0, 1e-12);
    GmStretch apart(GmPoint(50, 50), GmPoint(60, 50));
    EXPECT_EQ(contour.GetArc(&a, &apart, 3, GmBase::eRotCCW), nullptr);
    EXPECT_EQ(contour.GetArc(nullptr, &apart, 3, GmBase::eRotCCW), nullptr);
}
