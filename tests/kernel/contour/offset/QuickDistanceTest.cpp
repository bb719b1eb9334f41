// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/QuickDistance.h"

#include <gtest/gtest.h>

#include <cmath>
#include <memory>
#include <random>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/dispatch/Distance.h"

namespace {

using namespace gmkernel_detail;

class Draw {
public:
    explicit Draw(unsigned seed) : m_engine(seed) {}

    double between(double low, double high) {
        return low + (high - low) * (double(m_engine()) / double(std::mt19937::max()));
    }
    int below(int n) { return static_cast<int>(m_engine() % unsigned(n)); }
    GmPoint point(double size) { return GmPoint(between(-size, size), between(-size, size)); }

    /// Any angle, or one beside an axis, where stored angles snap.
    double angle() {
        if (below(2) == 0) return between(-4.0, 4.0);
        return below(4) * std::acos(0.0) + between(-1.0, 1.0) * std::pow(10.0, -below(8));
    }

    std::unique_ptr<GmCurve> element() {
        const GmPoint m = point(100.0);
        const double r = std::pow(10.0, between(-3.0, 4.0));
        const auto on = [&](double a) {
            return GmPoint(m.X() + r * std::cos(a), m.Y() + r * std::sin(a));
        };
        if (below(3) == 0) return std::make_unique<GmStretch>(m, on(angle()));
        auto arc = std::make_unique<GmArc>(on(angle()), on(angle()), m,
                                           below(2) == 0 ? GmBase::eRotCW : GmBase::eRotCCW);
        if (below(3) == 0) arc->SetEP(on(angle()));
        if (below(3) == 0) arc = std::make_unique<GmArc>(*arc, between(-0.9, 2.0) * r);
        return arc;
    }

private:
    std::mt19937 m_engine;
};

/// A point anywhere about the element, or just beside one of its ends or its circle.
GmPoint pointBeside(Draw& draw, GmCurve const& element) {
    const double size = 1.0 + element.Length();
    const double near = std::pow(10.0, -draw.below(7));
    if (draw.below(3) == 0) return GmPoint(element.SP() + GmVec(draw.point(2.0 * size)));
    if (draw.below(2) == 0) return GmPoint(element.EP() + GmVec(draw.point(near)));
    auto const* arc = dynamic_cast<GmArc const*>(&element);
    const GmPoint on =
        arc != nullptr ? arc->SectionPoint(draw.below(8), 7) : GmPoint(element.SP(), element.EP());
    return GmPoint(on + GmVec(draw.point(near)));
}

}  // namespace

TEST(QuickDistance, DecidesAsTheExactDistanceDoes) {
    Draw draw(5);
    int decided = 0;
    int asked = 0;
    for (int i = 0; i < 20000; ++i) {
        const std::unique_ptr<GmCurve> element = draw.element();
        if (!element->CreationOK()) continue;
        const QuickDistance quick(*element);
        for (int k = 0; k < 10; ++k) {
            const GmPoint p = pointBeside(draw, *element);
            const double exact = Distance(p, *element);
            const double steps[] = {0.0, 1e-12, -1e-8, 1e-7, -1e-6, 1e-4, -1e-3, 0.1, -1.0};
            const double threshold = exact + steps[draw.below(9)];
            const auto nearer = quick.isNearer({{p.X(), p.Y()}, 0.0}, threshold);
            ++asked;
            if (!nearer) continue;
            ++decided;
            ASSERT_EQ(*nearer, exact < threshold)
                << element->GetTraceString() << " " << p.GetTraceString() << " " << threshold;
        }
    }
    EXPECT_GT(asked, 100000);
    EXPECT_GT(decided, asked / 3);
}

TEST(QuickDistance, HalvingPointsOfArcsAreRightUpToRounding) {
    Draw draw(6);
    int compared = 0;
    for (int i = 0; i < 20000; ++i) {
        const std::unique_ptr<GmCurve> element = draw.element();
        if (!element->CreationOK() || !element->IsArc()) continue;
        auto const& arc = static_cast<GmArc const&>(*element);
        const auto quick = QuickSweep(plainOf(arc)).halvingPoint(plainOf(arc));
        if (!quick) continue;
        ++compared;
        const double error = arc.HP().Dist(GmPoint(quick->p.x, quick->p.y));
        ASSERT_LE(error, quick->error + 1e-13 * (100.0 + arc.R())) << arc.GetTraceString();
    }
    EXPECT_GT(compared, 5000);
}

TEST(QuickDistance, KnowsTheHeightOnlyWhereItIsOne) {
    EXPECT_EQ(heightOf(plainOf(GmStretch(GmPoint(0, 0, 2), GmPoint(1, 0, 2)))), 2.0);
    EXPECT_TRUE(std::isnan(heightOf(plainOf(GmStretch(GmPoint(0, 0, 2), GmPoint(1, 0, 3))))));
    const GmArc arc(GmPoint(1, 0, 1), GmPoint(0, 1, 1), GmPoint(0, 0, 0), GmBase::eRotCCW);
    EXPECT_TRUE(std::isnan(heightOf(plainOf(arc))));
}
