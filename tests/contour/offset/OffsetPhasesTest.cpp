#include <gtest/gtest.h>

#include <cmath>
#include <random>
#include <vector>

#include "contour/offset/BandPieces.h"
#include "contour/offset/Chaining.h"
#include "contour/offset/Insertion.h"
#include "contour/offset/Removal.h"
#include "contour/offset/ResultContour.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContElement.h"
#include "gmkernel/GmStretch.h"

namespace {

using namespace gmkernel_detail;

GmOffsetElement Segment(double x0, double y0, double x1, double y1, int id = 1,
                        bool auxiliary = false) {
    return {std::make_unique<GmStretch>(GmPoint(x0, y0), GmPoint(x1, y1)), 0, id, true, auxiliary};
}

PieceList ListOf(std::vector<GmOffsetElement> const& elements) {
    PieceList list;
    for (GmOffsetElement const& element : elements)
        list.emplace_back(element);
    return list;
}

/// The start points of pieces along x, as a fingerprint of an order.
std::vector<double> Starts(PieceList const& pieces) {
    std::vector<double> starts;
    for (Piece const& piece : pieces)
        starts.push_back(piece.element.curve().SP().X());
    return starts;
}

/// Is the band's boundary one closed walk? Offsets that vanish leave caps that meet.
void ExpectClosedWalk(std::vector<GmOffsetElement> const& band) {
    for (size_t i = 0; i < band.size(); ++i) {
        const GmPoint next = band[(i + 1) % band.size()].curve().SP();
        EXPECT_EQ(band[i].curve().EP(), next) << "after piece " << i;
    }
}

}  // namespace

TEST(BandPieces, EncloseTheElementWithFourPieces) {
    const GmStretch segment(GmPoint(0, 0), GmPoint(4, 0));
    const GmArc arc(GmPoint(5, 0), GmPoint(0, 5), GmPoint(0, 0), GmBase::eRotCCW);
    for (const double d : {1.0, -1.0}) {
        for (GmCurve const* element :
             {static_cast<GmCurve const*>(&segment), static_cast<GmCurve const*>(&arc)}) {
            const auto band = bandPieces(*element, 7, 42, d);
            ASSERT_EQ(band.size(), 4u);
            ExpectClosedWalk(band);
            const bool kept[] = {false, true, true, false};
            const bool auxiliary[] = {true, false, true, true};
            for (size_t i = 0; i < 4; ++i) {
                EXPECT_EQ(band[i].source(), 7);
                EXPECT_EQ(band[i].id(), 42);
                EXPECT_EQ(band[i].kept(), kept[i]);
                EXPECT_EQ(band[i].auxiliary(), auxiliary[i]);
            }
            for (size_t cap : {0u, 2u}) {
                GmArc const& round = static_cast<GmArc const&>(band[cap].curve());
                EXPECT_NEAR(round.Length(), std::acos(-1.0), 1e-9);
                EXPECT_EQ(round.Dir(), d > 0 ? GmBase::eRotCCW : GmBase::eRotCW);
                EXPECT_NEAR(round.HP().Dist(cap == 0 ? element->SP() : element->EP()), 1, 1e-9);
                EXPECT_FALSE(element->Element(round.HP())) << "outside around the end";
            }
        }
    }
    const auto band = bandPieces(segment, 0, 0, 1.0);
    EXPECT_EQ(band[1].curve().SP(), GmPoint(0, -1)) << "positive is right";
    EXPECT_EQ(static_cast<GmArc const&>(band[0].curve()).HP(), GmPoint(-1, 0));
    EXPECT_EQ(static_cast<GmArc const&>(band[2].curve()).HP(), GmPoint(5, 0));
    EXPECT_TRUE(bandPieces(GmLine(GmPoint(0, 0), GmPoint(1, 0)), 0, 0, 1.0).empty());
}

TEST(BandPieces, CapsOfATightArcMeetWhereTheirCirclesCross) {
    const GmPoint start(2, 0);
    const GmPoint end(0, 2);
    for (const GmBase::eRotDir rot : {GmBase::eRotCCW, GmBase::eRotCW}) {
        const GmPoint sp = rot == GmBase::eRotCCW ? start : end;
        const GmPoint ep = rot == GmBase::eRotCCW ? end : start;
        const GmArc arc(sp, ep, GmPoint(0, 0), rot);
        for (const double d : {3.0, -3.0, 2.0, -2.0}) {
            const auto band = bandPieces(arc, 0, 0, d);
            ASSERT_EQ(band.size(), 3u);
            ExpectClosedWalk(band);
            const bool awayFromCentre = d > 0 ? rot == GmBase::eRotCCW : rot == GmBase::eRotCW;
            EXPECT_EQ(band[1].auxiliary(), !awayFromCentre);
            const GmPoint x = awayFromCentre ? band[0].curve().SP() : band[0].curve().EP();
            EXPECT_NEAR(x.Dist(sp), std::fabs(d), 1e-9);
            EXPECT_NEAR(x.Dist(ep), std::fabs(d), 1e-9);
            EXPECT_LT(x.X() + x.Y(), 1e-9) << "beyond the centre, or on it";
        }
        EXPECT_EQ(bandPieces(arc, 0, 0, 1.99995).size(), 3u)
            << "an offset below the length tolerance vanishes";
        EXPECT_EQ(bandPieces(arc, 0, 0, 1.9).size(), 4u);
    }
}

TEST(Insertion, BoxesCoverEveryPointThatAMembershipTestAccepts) {
    int accepted = 0;
    std::mt19937 engine(7);
    const auto below = [&engine](int n) { return static_cast<int>(engine() % unsigned(n)); };
    // Next to the axes, where directions snap, and anywhere.
    const auto anyAngle = [&] {
        return below(4) * std::acos(0.0) + std::pow(10.0, -below(7)) * (below(21) - 10);
    };
    for (int i = 0; i < 3000; ++i) {
        const double r = std::pow(10.0, below(7) - 2);
        const auto on = [r](double angle) {
            return GmPoint(3 + r * std::cos(angle), 4 + r * std::sin(angle));
        };
        GmArc arc(on(anyAngle()), on(anyAngle()), GmPoint(3, 4),
                  below(2) == 0 ? GmBase::eRotCW : GmBase::eRotCCW);
        if (below(2) == 0) arc.SetSP(on(anyAngle()));
        if (below(2) == 0) arc.SetEP(on(anyAngle()));
        const PieceBox box = reachOf(arc);
        for (int k = 0; k < 100; ++k) {
            const GmPoint p = on(anyAngle());
            if (!arc.Element(p)) continue;
            ++accepted;
            ASSERT_TRUE(box.overlaps({p.X(), p.X(), p.Y(), p.Y()})) << arc.GetTraceString();
        }
    }
    EXPECT_GT(accepted, 50000);
}

TEST(Chaining, PrefersCandidatesThatLeadOn) {
    PieceList pieces =
        ListOf({Segment(0, 0, 1, 0, 1), Segment(1, 0, 1, 5, 2), Segment(1, 0, 2, 0, 3),
                Segment(1, 0, 2, 1, 4), Segment(2, 0, 3, 0, 5), Segment(2, 1, 3, 1, 6)});
    PieceList chain = takeChain(pieces);
    EXPECT_EQ(Starts(chain), (std::vector<double>{0, 1, 2}));
    EXPECT_EQ(chain.back().element.id(), 5) << "the first that leads on";

    pieces = ListOf({Segment(0, 0, 1, 0, 1), Segment(1, 0, 1, 5, 2), Segment(1, 0, 2, 0, 3)});
    chain = takeChain(pieces);
    EXPECT_EQ(chain.back().element.id(), 2) << "the first where none leads on";
}

TEST(ResultContour, BridgesGapsAndTellsWhatIsMade) {
    const auto contour = resultContour(ListOf(
        {Segment(0, 0, 4, 0, 1), Segment(4, 0.0002, 4, 3, 2), Segment(4, 3.00005, 0, 0, 3, true)}));
    ASSERT_EQ(contour->ElementCount(), 4) << "one gap is bridged, the other within tolerance";
    const bool made[] = {false, true, false, true};
    const long ids[] = {1, 2, 2, 3};
    for (int i = 0; i < 4; ++i) {
        EXPECT_EQ(contour->GetContElement(i)->bInserted, made[i]);
        EXPECT_EQ(contour->GetContElement(i)->lId, ids[i]);
        EXPECT_EQ(contour->GetContElement(i)->lIndex, i);
    }
    EXPECT_TRUE(contour->IsClosed());
    EXPECT_TRUE(hasOffset(ListOf({Segment(0, 0, 1, 0, 1, true), Segment(1, 0, 2, 0)})));
    EXPECT_FALSE(hasOffset(ListOf({Segment(0, 0, 1, 0, 1, true)})));
}
