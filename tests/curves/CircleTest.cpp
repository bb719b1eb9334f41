#include <cmath>

#include "curves/CurveCases.h"
#include "gmkernel/GmRect.h"

using namespace cases;

namespace {

GmCircle circleAt(double x, double y, double r) {
    return GmCircle(GmPoint(x, y), r, true);
}

struct HitsCase {
    char const* name;
    GmLine line;
    std::vector<GmPoint> hits;
};

void expectHits(std::vector<GmPoint> const& found, std::vector<GmPoint> const& hits) {
    ASSERT_EQ(found.size(), hits.size());
    for (std::size_t i = 0; i < hits.size(); ++i) {
        EXPECT_TRUE(IsAt(found[i], hits[i].X(), hits[i].Y(), hits[i].Z()));
    }
}

}  // namespace

TEST(GmCircle, IntersectsLinesInFixedOrder) {
    GmCircle const circle(GmPoint(0, 0, 2), 5.0, true);
    double const tilt = 5 * std::sqrt(2);
    HitsCase const table[] = {
        {"secant", {GmPoint(9, 3), GmDir(1, 0)}, {GmPoint(-4, 3, 2), GmPoint(4, 3, 2)}},
        {"its sense does not matter",
         {GmPoint(9, 3), GmDir(-1, 0)},
         {GmPoint(-4, 3, 2), GmPoint(4, 3, 2)}},
        {"falling, the larger root first",
         {GmPoint(5, 0), GmPoint(0, 5)},
         {GmPoint(5, 0, 2), GmPoint(0, 5, 2)}},
        {"rising, the smaller root first",
         {GmPoint(-5, 0), GmPoint(0, 5)},
         {GmPoint(-5, 0, 2), GmPoint(0, 5, 2)}},
        {"touching", {GmPoint(9, 5), GmDir(1, 0)}, {GmPoint(0, 5, 2)}},
        {"touching below", {GmPoint(9, -5), GmDir(1, 0)}, {GmPoint(0, -5, 2)}},
        {"touching at 45 degrees",
         {GmPoint(tilt, 0), GmPoint(0, tilt)},
         {GmPoint(tilt / 2, tilt / 2, 2)}},
        {"passing just outside", {GmPoint(9, 5.00005), GmDir(1, 0)}, {GmPoint(0, 5, 2)}},
        {"passing outside", {GmPoint(9, 5.00011), GmDir(1, 0)}, {}},
        {"vertical, upper first",
         {GmPoint(3, 9), GmDir(0, -1)},
         {GmPoint(3, 4, 2), GmPoint(3, -4, 2)}},
        {"vertical, touching", {GmPoint(5, 9), GmDir(0, 1)}, {GmPoint(5, 0, 2)}},
        {"vertical, just outside", {GmPoint(5.00005, 9), GmDir(0, 1)}, {}},
    };
    for (HitsCase const& c : table) {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(circle.IntersectionWithLine(c.line), static_cast<int>(c.hits.size()));
        expectHits(circle.GetPtSol(), c.hits);
    }
    GmStretch const beside(GmPoint(7, 5), GmPoint(9, 5));
    EXPECT_EQ(circle.IntersectionWithLine(beside), 0) << "a stretch is touched only where it is";
    EXPECT_EQ(circle.IntersectionWithLine(GmLine(beside)), 1);
}

TEST(GmCircle, IntersectsCirclesInFixedOrder) {
    GmCircle const circle(GmPoint(0, 0, 2), 5.0, true);
    struct Case {
        char const* name;
        GmCircle other;
        std::vector<GmPoint> hits;
    };
    Case const table[] = {
        {"right of the centre line first",
         circleAt(8, 0, 5),
         {GmPoint(4, -3, 2), GmPoint(4, 3, 2)}},
        {"from the other side", circleAt(-8, 0, 5), {GmPoint(-4, 3, 2), GmPoint(-4, -3, 2)}},
        {"touching outside", circleAt(10, 0, 5), {GmPoint(5, 0, 2)}},
        {"touching inside", circleAt(0, 3, 2), {GmPoint(0, 5, 2)}},
        {"touched by an enclosing one", circleAt(0, -3, 8), {GmPoint(0, 5, 2)}},
        {"apart", circleAt(10.00001, 0, 5), {}},
        {"nested", circleAt(1, 0, 2), {}},
        {"enclosing", circleAt(1, 0, 9), {}},
        {"concentric", circleAt(0, 0, 2), {}},
        {"identical", circleAt(0, 0, 5), {}},
    };
    for (Case const& c : table) {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(circle.IntersectionWithCircle(c.other), static_cast<int>(c.hits.size()));
        expectHits(circle.GetPtSol(), c.hits);
    }
}

TEST(GmCircle, IsBuiltFromCentreAndRadius) {
    EXPECT_EQ(circleAt(0, 0, -3).R(), 3);
    EXPECT_EQ(GmCircle(circleAt(1, 2, 5), -4.5), circleAt(1, 2, 0.5));
    EXPECT_EQ(GmCircle(circleAt(1, 2, 5), 2), circleAt(1, 2, 7));
    GmCircle const vanished(circleAt(1, 2, 5), -4.99991);
    EXPECT_TRUE(!vanished.CreationOK() && vanished.R() == 0 && vanished.IsCircle());
    EXPECT_TRUE(GmCircle(circleAt(1, 2, 5), -4.9998).CreationOK());
    EXPECT_FALSE(GmCircle(GmPoint(), 3, true).CreationOK());
    EXPECT_FALSE(GmCircle(GmCircle(), 3).CreationOK());
    EXPECT_TRUE(GmCircle().M().CreationOK()) << "the centre of an undefined circle is the origin";

    GmCircle const tilted(GmPoint(1, 2), GmDir(1, 0, 0), 3);
    EXPECT_TRUE(Points(tilted.Axis(), 1, 0));
    EXPECT_EQ(tilted, circleAt(1, 2, 3)) << "the axis does not count";
    EXPECT_NE(circleAt(1, 2, 3), circleAt(1, 2, 3 + 1e-12)) << "radii compare exactly";
    EXPECT_EQ(tilted.GetTraceString(), "circ (1.00000, 2.00000) R = 3.00000");
    EXPECT_EQ(tilted.BoundingRect(), GmRect(-2, -1, 4, 5));
    GmCircle target;
    target = GmArc(GmPoint(1, 2), 3, 0, 1, GmBase::eRotCCW);
    EXPECT_TRUE(target.IsCircle() && target == tilted);
}

TEST(GmCircle, TellsInsideOutsideAndRim) {
    GmCircle circle = circleAt(0, 0, 5);
    GmPoint const rim(3, 4), inside(3, 3.9999), outside(3, 4.00001);
    EXPECT_TRUE(!circle.In(rim) && !circle.Out(rim));
    EXPECT_TRUE(circle.In(inside) && !circle.Out(inside));
    EXPECT_TRUE(circle.Out(outside) && !circle.In(outside));
    EXPECT_TRUE(circle.Element(outside) && !circle.Element(GmPoint(3, 4, 1)));

    EXPECT_TRUE(Points(circle.Tangent(GmPoint(5, 0)).Dir(), 0, -1));
    EXPECT_TRUE(Points(circle.TangDir(GmPoint(0, 5)), 1, 0));
    EXPECT_FALSE(circle.Tangent(GmPoint(5.1, 0)).CreationOK());
    EXPECT_FALSE(circle.TangDir(GmPoint(5.1, 0)).CreationOK());
    EXPECT_FALSE(circle.SP().CreationOK() || circle.TangEP().CreationOK());
}

TEST(GmCircle, MeasuresGapsAndTouchingPoints) {
    GmCircle circle = circleAt(0, 0, 5);
    struct Case {
        GmCircle other;
        double gap;
        GmPoint touching;
    };
    Case const table[] = {
        {circleAt(1, 0, 1), 3, GmPoint()},      {circleAt(10, 0, 1), 4, GmPoint()},
        {circleAt(10, 0, 6), 0, GmPoint()},     {circleAt(1, 0, 9), 3, GmPoint()},
        {circleAt(8, 0, 3), 0, GmPoint(5, 0)},  {circleAt(3, 0, 2), 0, GmPoint(5, 0)},
        {circleAt(3, 0, 8), 0, GmPoint(-5, 0)}, {circleAt(0, 0, 5), 0, GmPoint()},
    };
    for (Case const& c : table) {
        EXPECT_DOUBLE_EQ(circle.Dist(c.other), c.gap) << c.other.GetTraceString();
        EXPECT_EQ(circle.GetTangPoint(c.other).CreationOK(), c.touching.CreationOK());
        EXPECT_EQ(circle.GetTangPoint(c.other), c.touching) << c.other.GetTraceString();
    }
    GmStretch const off(GmPoint(3, 9), GmPoint(9, 9));
    EXPECT_DOUBLE_EQ(circle.Dist(off), std::sqrt(90) - 5);
    EXPECT_EQ(circle.Dist(GmLine(off)), 4);
    EXPECT_EQ(circle.Dist(GmLine(GmPoint(0, 1), GmDir(1, 0))), 0);
    EXPECT_TRUE(IsAt(circle.GetTangPoint(GmLine(GmPoint(9, -5.00005), GmDir(1, 0))), 0, -5.00005));
    EXPECT_FALSE(circle.GetTangPoint(GmLine(GmPoint(9, 5.0002), GmDir(1, 0))).CreationOK());
}

TEST(GmCircle, FacesOtherCurves) {
    GmCircle const circle = circleAt(0, 0, 5);
    GmArc const rightHalf(circle, -M_PI / 2, M_PI / 2, GmBase::eRotCCW);
    GmArc const leftHalf(circle, M_PI / 2, -M_PI / 2, GmBase::eRotCCW);
    GmCircle const right = circleAt(12, 0, 2);
    GmLine const wall(GmPoint(9, 3), GmDir(0, 1));

    EXPECT_TRUE(IsAt(circle.NP(GmPoint(10, 0)), 5, 0));
    EXPECT_TRUE(IsAt(circle.NP(GmPoint(-1, 0)), -5, 0));
    EXPECT_FALSE(circle.NP(GmPoint(0, 0)).CreationOK());
    EXPECT_TRUE(IsAt(rightHalf.NP(GmPoint(0, 0)), 0, -5)) << "the centre answers the start";
    EXPECT_TRUE(IsAt(leftHalf.NP(GmPoint(10, 0)), -5, 0))
        << "the only point on the line of centres";

    EXPECT_TRUE(IsAt(circle.NP(&wall), 5, 0));
    EXPECT_TRUE(IsAt(leftHalf.NP(&wall), -5, 0));
    EXPECT_TRUE(IsAt(circle.NP(&right), -5, 0)) << "of two points the farther one";
    EXPECT_TRUE(IsAt(rightHalf.NP(&right), 5, 0));
    EXPECT_FALSE(circle.NP(&circle).CreationOK());
    EXPECT_TRUE(IsAt(rightHalf.NP(&circle), 0, -5)) << "concentric with a full circle";
    GmArc const inner(GmPoint(0, 0), 2, 0, 1, GmBase::eRotCCW);
    EXPECT_TRUE(IsAt(rightHalf.NP(&inner), 5, 0)) << "concentric with an arc that starts at 0";
    GmRect const rect(0, 0, 1, 1);
    EXPECT_FALSE(circle.NP(&rect).CreationOK());
}
