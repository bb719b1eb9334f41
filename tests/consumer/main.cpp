// SPDX-License-Identifier: MIT
// Uses each exported class or function once from outside, and fails when an answer is wrong.

#include <cmath>
#include <cstdio>
#include <stdexcept>
#include <vector>

#include "gmkernel/gmkernel.h"

namespace {

int failures = 0;

void Expect(bool ok, const char* what) {
    if (!ok) {
        std::printf("consumer: wrong: %s\n", what);
        ++failures;
    }
}

void UseValues() {
    GmPoint p(3, 4);
    SetCoordByIndex(p, 2, 12);
    Expect(std::fabs(GmVec(p).Length() - 13) < 1e-12, "length of a vector");
    Expect(GmPoint(p + GmVec(1, 0, 0)) == GmPoint(4, 4, 12), "sum of point and vector");
    Expect(GmParallelDir(GmDir(1, 0, 0), GmDir(1, 0, 0)), "parallel directions");
    Expect(GmAngle(180, false) + GmAngle(90, false) == GmAngle(-90, false), "sum of angles");
    Expect(GmMatrix() * GmMatrix::matrixScale(1) == GmMatrix() && GmMatrix().isIdentity(),
           "identity matrix");
}

void UseCurves() {
    const GmLine line(GmPoint(-10, 0), GmPoint(10, 0));
    const GmBeam beam(GmPoint(0, -1), GmPoint(0, 1));
    const GmCircle circle(GmPoint(0, 0), 5, true);
    const GmArc arc(GmPoint(5, 0), GmPoint(-5, 0), GmPoint(0, 0), GmBase::eRotCCW);
    Expect(line.Intersection(&beam) == 1, "line and beam");
    Expect(line.Intersection(&circle) == 2, "line and circle");
    Expect(arc.Intersection(&beam) == 1 && arc.GetSolution(0) == GmPoint(0, 5), "arc and beam");

    std::vector<GmPoint> points;
    Intersection(circle, line, points);
    Expect(points.size() == 2, "free intersection");
    const GmRect box = circle.BoundingRect();
    bool refused = false;
    try {
        line.Intersection(&box);
    } catch (std::runtime_error const&) {
        refused = true;
    }
    Expect(refused, "a rectangle is not intersected");
    Expect(less_than_curve(&arc)(GmPoint(0, 5), GmPoint(-5, 0)), "order along an arc");
    Expect(point_is_element(&arc)(GmPoint(0, 5)), "point on an arc");
}

void UseContours() {
    GmContour square;
    square.AddElement(GmStretch(GmPoint(0, 0), GmPoint(10, 0)), false, 1);
    square.AddElement(GmStretch(GmPoint(10, 0), GmPoint(10, 10)), false, 2);
    square.AddElement(GmStretch(GmPoint(10, 10), GmPoint(0, 10)), false, 3);
    square.Close(false);
    GmTraceContourElements(&square, "square", "");
    Expect(square.IsClosed() && square.In(GmPoint(5, 4)), "closed square");
    Expect(square.Offsetting(-1, 1000000, false) == 1, "inward offset");
    GmContour const* inner = square.GetSubContour(0);
    Expect(inner != nullptr && inner->BoundingRect() == GmRect(GmPoint(1, 9), GmPoint(9, 1)),
           "box of the inward offset");
}

}  // namespace

int main() {
    UseValues();
    UseCurves();
    UseContours();
    std::printf("consumer: %d failures\n", failures);
    return failures == 0 ? 0 : 1;
}
