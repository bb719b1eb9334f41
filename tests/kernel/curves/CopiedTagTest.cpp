// SPDX-License-Identifier: MIT
#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

#include "gmkernel/GmContour.h"
#include "gmkernel/GmHelix.h"
#include "gmkernel/GmRect.h"
#include "kernel/contour/ContourElements.h"
#include "kernel/curves/CurveBox.h"
#include "kernel/curves/dispatch/Distance.h"
#include "tests/kernel/curves/CurveCases.h"
#include "tests/support/Contours.h"

using namespace cases;

/// Objects that carry the tag of another class, as an assignment through references to the base
/// leaves them. The sanitizer build turns a cast that trusts such a tag into a failure.
namespace {

using Curves = std::vector<std::unique_ptr<GmCurve>>;

/// A stretch of a class that the library does not know.
class NamedStretch : public GmStretch {
public:
    explicit NamedStretch(GmStretch const& stretch) : GmStretch(stretch) {}
    std::string name = "a field behind those of the base";
};

/// One curve of every class.
Curves allClasses() {
    Curves curves;
    curves.push_back(std::make_unique<GmLine>(GmPoint(0, 1), GmPoint(9, 2)));
    curves.push_back(std::make_unique<GmBeam>(GmPoint(2, -5), GmDir(0.1, 1)));
    curves.push_back(std::make_unique<GmStretch>(Stretch(-9, 0, 9, 1)));
    curves.push_back(std::make_unique<NamedStretch>(Stretch(-9, 2, 9, -1)));
    curves.push_back(std::make_unique<GmCircle>(Circle(1, 0, 4)));
    curves.push_back(std::make_unique<GmArc>(Arc(0, 1, 5, -100, 100, CCW)));
    curves.push_back(std::make_unique<GmRect>(-2, -2, 3, 4));
    curves.push_back(std::make_unique<GmHelix>(Arc(0, 0, 3, 0, 90, CCW)));
    curves.push_back(std::make_unique<GmContour>(shapes::Square(3)));
    return curves;
}

bool isOfTaggedClass(GmCurve const& curve) {
    switch (curve.GetType()) {
        case GmBase::eGmLine:
            return dynamic_cast<GmLine const*>(&curve) != nullptr;
        case GmBase::eGmBeam:
            return dynamic_cast<GmBeam const*>(&curve) != nullptr;
        case GmBase::eGmStretch:
            return dynamic_cast<GmStretch const*>(&curve) != nullptr;
        case GmBase::eGmCircle:
            return dynamic_cast<GmCircle const*>(&curve) != nullptr;
        case GmBase::eGmArc:
            return dynamic_cast<GmArc const*>(&curve) != nullptr;
        case GmBase::eGmContour:
            return dynamic_cast<GmContour const*>(&curve) != nullptr;
        default:
            return false;  // nothing intersects rectangles and helices
    }
}

/// Empty where the objects can be intersected, else what was thrown.
std::string refusal(GmBase const& a, GmBase const& b) {
    std::vector<GmPoint> points(1);
    try {
        Intersection(a, b, points);
        return "";
    } catch (std::runtime_error const& e) {
        EXPECT_TRUE(points.empty());
        return e.what();
    }
}

/// What a pair of curves gets for which there is no function.
double generalDistance(GmCurve const& a, GmCurve const& b) {
    double d = std::numeric_limits<double>::max();
    a.MinDist(d, &b, false);
    return d;
}

/// Every object that has got the tag of another one: the tag alone, not the fields.
Curves withCopiedTags() {
    Curves curves;
    for (auto const& source : allClasses()) {
        for (auto& object : allClasses()) {
            GmCurve& curve = *object;
            curve = *source;
            curves.push_back(std::move(object));
        }
    }
    return curves;
}

void expectRefusal(GmBase const& a, GmBase const& b, std::string const& expected) {
    EXPECT_EQ(refusal(a, b), expected);
    EXPECT_EQ(refusal(b, a), expected);
}

void expectGeneralDistance(GmCurve const& a, GmCurve const& b) {
    EXPECT_EQ(Distance(a, b), generalDistance(a, b));
    EXPECT_EQ(Distance(b, a), generalDistance(b, a));
}

/// A contour of three segments and an arc, in which one element has got another tag.
void expectPassedOver(GmContour& contour, int index) {
    GmCurve const& element = *contour.GetElement(index);
    GmContour other = shapes::Moved(shapes::Square(7), 5, -3);
    EXPECT_FALSE(gmkernel_detail::middleOf(&element).CreationOK());
    EXPECT_EQ(contour.GetNewElement(index), nullptr);
    EXPECT_FALSE(contour == GmContour(contour)) << "the clone has its own tag";
    EXPECT_EQ(contour.MeltContours(&other, true), -1);
    EXPECT_EQ(refusal(contour, other), "Function not found");
    EXPECT_FALSE(contour.AddTrans(GmContour::eTransRadius, index, 1, true));
    const std::unique_ptr<GmCurve> link(contour.GetElement(2)->Concat(element, 1));
    EXPECT_TRUE(link == nullptr && !contour.GetElement(2)->Concat(element));
    // Nothing to compare with: what counts is that they read no field that is not there.
    contour.Dir(GmPoint(0, 0));
    contour.Offsetting(-0.5, 1000, false);
    gmkernel_detail::reachOf(element);
}

}  // namespace

TEST(CopiedTag, IsNotBelievedByIntersectionsAndDistances) {
    const Curves partners = allClasses();
    int believed = 0;
    int refused = 0;
    for (auto const& curve : withCopiedTags()) {
        for (auto const& partner : partners) {
            SCOPED_TRACE(PairName(curve->GetType(), partner->GetType()));
            const bool fits = isOfTaggedClass(*curve) && isOfTaggedClass(*partner);
            expectRefusal(*curve, *partner, fits ? "" : "Function not found");
            if (!fits) expectGeneralDistance(*curve, *partner);
            ++(fits ? believed : refused);
        }
        EXPECT_EQ(Distance(GmPoint(1, 2), *curve), Distance(*curve, GmPoint(1, 2)));
    }
    EXPECT_GT(believed, 60) << "own tags, and those of base classes";
    EXPECT_GT(refused, 100);
}

TEST(CopiedTag, OfAPointIsNotBelievedEither) {
    GmPoint point(3, 4);
    GmStretch const stretch = Stretch(0, 0, 1, 0);
    GmContour const square = shapes::Square(3);
    GmBase& base = point;
    for (GmCurve const* source :
         {static_cast<GmCurve const*>(&stretch), static_cast<GmCurve const*>(&square)}) {
        base = *source;
        expectRefusal(point, stretch, "Function not found");
        expectRefusal(point, square, "Function not found");
        EXPECT_EQ(Distance(point, stretch), std::numeric_limits<double>::max());
        EXPECT_EQ(Distance(stretch, point), std::numeric_limits<double>::max());
    }
}

TEST(CopiedTag, DerivedClassesAnswerAsTheirBase) {
    GmStretch const plain = Stretch(-9, 2, 9, -1);
    NamedStretch const derived(plain);
    for (auto const& partner : allClasses()) {
        if (!isOfTaggedClass(*partner)) continue;
        plain.Intersection(partner.get());
        derived.Intersection(partner.get());
        EXPECT_EQ(TextOf(derived.GetPtSol()), TextOf(plain.GetPtSol()));
        EXPECT_EQ(Distance(*partner, derived), Distance(*partner, plain));
    }
    EXPECT_EQ(derived.name, "a field behind those of the base");
}

TEST(CopiedTag, MakesAnElementOneThatContoursPassOver) {
    int tried = 0;
    for (auto const& source : allClasses()) {
        for (const int index : {0, 1}) {  // a segment, the arc
            GmContour contour = shapes::Path("0 0  10 0  ccw 10 5 10 10  0 10  0 0");
            GmCurve& element = *contour.GetElement(index);
            element = *source;
            if (isOfTaggedClass(element)) continue;
            SCOPED_TRACE(PairName(element.GetType(), source->GetType()));
            expectPassedOver(contour, index);
            ++tried;
        }
    }
    EXPECT_GT(tried, 8);
}
