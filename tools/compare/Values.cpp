// SPDX-License-Identifier: MIT

#include "Families.h"

namespace net {

namespace {

void AskVector(Dice& dice, Answer& answer, GmVec v, GmVec const& w) {
    const double f = dice.Length();
    answer.Ask("vector sums", [&] {
        GmVec sum = v;
        sum += w;
        sum -= v * 2.0;
        sum *= f;
        sum /= 3.0;
        answer.Add("sum", sum);
        answer.Add("v + w", v + w);
        answer.Add("v - w", v - w);
        answer.Add("v / f", v / f);
        answer.Add("-v", -v);
        answer.Add("f v", v.SkalarMult(f));
        answer.Add("dot", v * w);
        answer.Add("cross", v % w);
    });
    answer.Ask("vector measures", [&] {
        answer.Add("length", v.Length());
        answer.Add("norm", v.Norm());
        answer.Add("slope", v.k());
        answer.Add("y", v[1]);
        answer.Add("quadrant", v.Quadrant());
        answer.Add("quadrant 13", v.Quadrant13());
        answer.Add("quadrant 24", v.Quadrant24());
        answer.Add("equal", v == w);
        answer.Add("nearly", v.equals(w, f));
        answer.Add("shorter", v < w);
        answer.Add("box", static_cast<GmCurve const&>(v.BoundingRect()));
        answer.Add("trace", v.GetTraceString() + v.GetRawTraceString());
    });
    answer.Ask("vector angles", [&] {
        answer.Add("angle", v.Angle());
        answer.Add("angle to", v.Angle(w));
        answer.Add("degrees", v.DAngle());
        answer.Add("degrees to", v.DAngle(w));
        answer.Add("degrees cw", v.DAngle(w, GmBase::eRotCW));
        answer.Add("degrees ccw", v.DAngle(w, GmBase::eRotCCW));
        answer.Add("radians", v.RAngle());
        answer.Add("radians to", v.RAngle(w));
        answer.Add("radians cw", v.RAngle(w, GmBase::eRotCW));
    });
}

void AskTurns(Dice& dice, Answer& answer, GmVec v) {
    const GmAngle turn(dice.Degrees(), false);
    const GmBase::eRotDir rot = dice.Sense();
    answer.Ask("vector turns", [&] {
        answer.Add("standardized", static_cast<GmVec const&>(v).Standardized());
        answer.Add("normalized", v.Normalized(rot));
        answer.Add("inverted", v.Inverted());
        answer.Add("rotated", v.Rotated(turn));
        v.Rotate(turn);
        v.Normalize(rot);
        v.Invert();
        v.Standardize();
        SetCoordByIndex(v, dice.Below(4), 0.5);
        answer.Add("turned", v);
    });
}

void AskPoint(Answer& answer, GmPoint const& p, GmPoint const& q, GmPoint const& c) {
    answer.Ask("points", [&] {
        answer.Add("box", static_cast<GmCurve const&>(p.BoundingRect()));
        answer.Add("distance", p.Dist(q));
        answer.Add("squared distance", p.Dist2(q));
        answer.Add("direction", p.Dir(q));
        answer.Add("signed distance", p.DirDist(q, c.Dir(q)));
        answer.Add("angle", p.AngDist(q, c));
        answer.Add("angle cw", p.AngDist(q, c, GmBase::eRotCW));
        answer.Add("angle ccw", p.AngDist(q, c, GmBase::eRotCCW));
        answer.Add("mean", p.Mean(q));
        answer.Add("mean of three", p.Mean(q, c));
        answer.Add("midpoint", GmPoint(p, q));
        answer.Add("centroid", GmPoint(p, q, c));
        answer.Add("equal", p == q);
        answer.Add("trace", p.GetTraceString());
    });
}

void AskDirection(Dice& dice, Answer& answer, GmDir d, GmDir const& e) {
    const GmAngle turn(dice.Degrees(), false);
    const double x = dice.SoundLength();
    answer.Ask("directions", [&] {
        answer.Add("slope", d.k());
        answer.Add("angle", d.Angle());
        answer.Add("angle to", d.Angle(e));
        answer.Add("degrees", d.DAngle());
        answer.Add("degrees to", d.DAngle(e));
        answer.Add("degrees cw", d.DAngle(e, GmBase::eRotCW));
        answer.Add("radians", d.RAngle());
        answer.Add("radians to", d.RAngle(e));
        answer.Add("radians ccw", d.RAngle(e, GmBase::eRotCCW));
        answer.Add("cross", d % e);
        answer.Add("sum", d + e);
        answer.Add("bisector", d.Sym(e));
        answer.Add("opposite", -d);
        answer.Add("inverted", d.Inverted());
        answer.Add("normalized", d.Normalized(GmBase::eRotCCW));
        answer.Add("rotated", d.Rotated(turn));
        answer.Add("quadrant", d.Quadrant());
        answer.Add("quadrant 13", d.Quadrant13());
        answer.Add("quadrant 24", d.Quadrant24());
        answer.Add("parallel", GmParallelDir(d, e));
        answer.Add("equal", d == e);
        answer.Add("trace", d.GetTraceString());
        d.X(x);
        d.Rotate(turn);
        d.Normalize(GmBase::eRotCW);
        d.Y(x);
        d.Invert();
        answer.Add("changed", d);
    });
}

void AskAngles(Dice& dice, Answer& answer) {
    const GmAngle a(dice.Degrees(), false);
    const GmAngle b(dice.Length(), dice.Once(2));
    answer.Ask("angles", [&] {
        GmAngle c = a;
        c += b;
        c *= dice.SoundLength();
        c -= a;
        c /= 3.0;
        answer.Add("a", a);
        answer.Add("b", b);
        answer.Add("changed", c);
        answer.Add("radians", c.Radiant());
        answer.Add("a + b", a + b);
        answer.Add("a - b", a - b);
        answer.Add("multiple", a.SkalarMult(7.0));
        answer.Add("-a", -a);
        answer.Add("less", a < b);
        answer.Add("equal", a == b);
        answer.Add("sense", static_cast<int>(a.Rotation(b)));
        answer.Add("quadrant", b.QuadrantInt());
        answer.Add("quadrant of c", static_cast<int>(c.Quadrant()));
        answer.Add("direction", GmDir(c));
    });
}

GmMatrix AnyMatrix(Dice& dice, GmVec const& v, GmVec const& w) {
    switch (dice.Below(6)) {
        case 0:
            return GmMatrix::matrixRotate(v, dice.Degrees());
        case 1:
            return GmMatrix::matrixRotate(dice.Degrees(), dice.Degrees());
        case 2:
            return GmMatrix::matrixOrient(v, w);
        case 3:
            return GmMatrix::matrixOrient(v, w, v % w);
        case 4:
            return GmMatrix::matrixScale(w);
        default:
            return GmMatrix::matrixTranslate(v);
    }
}

void AskMatrix(Dice& dice, Answer& answer, GmVec const& v, GmVec const& w) {
    GmMatrix m = AnyMatrix(dice, v, w);
    const GmMatrix n = AnyMatrix(dice, w, v);
    answer.Ask("matrices", [&] {
        answer.Add("matrix", m);
        answer.Add("product", m * n);
        answer.Add("inverse", m.inverse());
        answer.Add("transpose", n.transpose());
        answer.Add("image", m * v);
        answer.Add("identity", m.isIdentity());
        answer.Add("equal", m == n);
        m *= n;
        m.Scale(1.5).Translate(w).Rotate(GmVec(0, 0, -1), dice.Degrees());
        m.Orient(v, w).Scale(v).Translate(1, 2, 3).Rotate(dice.Degrees(), 30.0).Orient(w, v, w % v);
        answer.Add("chain", m);
        answer.Add("inverse of the chain", m.inverse());
        GmPoint p(v);
        p.Transform(n);
        p.Translation(w);
        answer.Add("point", p);
        GmVec u = w;
        u.Transform(m);
        answer.Add("vector", u);
    });
}

void AskRotary(Dice& dice, Answer& answer) {
    const double x = dice.Length();
    const double y = dice.Length();
    const double c = dice.Length();
    answer.Ask("rotary coordinates", [&] {
        double angle = 0.0;
        double length = 0.0;
        double radius = 0.0;
        Tracyl(x, y, angle);
        ITracyl(angle, y, length);
        answer.Add("rotation", angle);
        answer.Add("circumference", length);
        Transmit(x, y, c, radius, angle);
        answer.Add("radius", radius);
        answer.Add("angle", angle);
        double xBack = 0.0;
        double yBack = 0.0;
        ITransmit(radius, angle, c, xBack, yBack);
        answer.Add("x", xBack);
        answer.Add("y", yBack);
    });
}

}  // namespace

void AskValues(Dice& dice, Answer& answer) {
    const GmVec v = dice.Vector();
    const GmVec w = dice.Once(8) ? v * dice.SoundLength() : dice.Vector();
    answer.Add("v", v);
    answer.Add("w", w);
    AskVector(dice, answer, v, w);
    AskTurns(dice, answer, v);
    AskPoint(answer, GmPoint(v), GmPoint(w), dice.AnyPoint());
    AskDirection(dice, answer, GmDir(v), dice.Direction());
    AskAngles(dice, answer);
    AskMatrix(dice, answer, v, w);
    AskRotary(dice, answer);
}

}  // namespace net
