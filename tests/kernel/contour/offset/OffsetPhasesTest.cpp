// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>
#include <memory>
#include <random>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContElement.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/offset/BandPieces.h"
#include "kernel/contour/offset/Chaining.h"
#include "kernel/contour/offset/ResultContour.h"
#include "tests/support/Contours.h"

namespace {

using namespace gmkernel_detail;

PlainSegment Line(double x0, double y0, double x1, double y1) {
    return plainOf(GmStretch(GmPoint(x0, y0), GmPoint(x1, y1)));
}

Piece Segment(double x0, double y0, double x1, double y1, int id = 1,
              PieceRole role = PieceRole::kChosenSide) {
    return {Line(x0, y0, x1, y1), 0, id, role};
}

GmOffsetElement Element(double x0, double y0, double x1, double y1, int id,
                        PieceRole role = PieceRole::kChosenSide) {
    return {std::make_unique<GmStretch>(GmPoint(x0, y0), GmPoint(x1, y1)), 0, id, role};
}

/// Pieces for chaining, which wants them to stay.
struct Loose {
    std::vector<Piece> pieces;
    Chaining chaining;

    explicit Loose(std::vector<Piece> list) : pieces(std::move(list)), chaining(Places(pieces)) {}

    static std::vector<Piece const*> Places(std::vector<Piece> const& list) {
        std::vector<Piece const*> places;
        for (Piece const& piece : list)
            places.push_back(&piece);
        return places;
    }
    Chaining::Chain Take() { return chaining.takeChain(); }
};

/// The start points of pieces along x, as a fingerprint of an order.
std::vector<double> Starts(Chaining::Chain const& pieces) {
    std::vector<double> starts;
    for (Piece const* piece : pieces)
        starts.push_back(startOf(piece->curve()).x);
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
    for (char const* path : {"0 0  4 0", "5 0  ccw 0 0 0 5"}) {
        const GmContour source = shapes::Path(path);
        GmCurve const& element = *source.GetElement(0);
        for (const double d : {1.0, -1.0}) {
            const auto band = bandPieces(element, 7, 42, d);
            ASSERT_EQ(band.size(), 4u);
            ExpectClosedWalk(band);
            for (size_t i = 0; i < 4; ++i) {
                EXPECT_TRUE(band[i].source() == 7 && band[i].id() == 42);
                EXPECT_EQ(band[i].kept(), i == 1 || i == 2) << i;
                EXPECT_EQ(band[i].auxiliary(), i != 1) << i;
            }
            for (const size_t cap : {0u, 2u}) {
                GmArc const& round = static_cast<GmArc const&>(band[cap].curve());
                EXPECT_NEAR(round.Length(), std::acos(-1.0), 1e-9);
                EXPECT_EQ(round.Dir(), d > 0 ? GmBase::eRotCCW : GmBase::eRotCW);
                EXPECT_NEAR(round.HP().Dist(cap == 0 ? element.SP() : element.EP()), 1, 1e-9);
                EXPECT_FALSE(element.Element(round.HP())) << "outside around the end";
            }
        }
    }
    EXPECT_TRUE(bandPieces(GmLine(GmPoint(0, 0), GmPoint(1, 0)), 0, 0, 1.0).empty());
}

TEST(BandPieces, CapsOfATightArcMeetWhereTheirCirclesCross) {
    for (char const* path : {"2 0  ccw 0 0 0 2", "0 2  cw 0 0 2 0"}) {
        const GmContour source = shapes::Path(path);
        GmArc const& arc = static_cast<GmArc const&>(*source.GetElement(0));
        for (const double d : {3.0, -3.0, 2.0, -2.0}) {
            const auto band = bandPieces(arc, 0, 0, d);
            ASSERT_EQ(band.size(), 3u);
            ExpectClosedWalk(band);
            const bool awayFromCentre = (d > 0) == (arc.Dir() == GmBase::eRotCCW);
            EXPECT_EQ(band[1].auxiliary(), !awayFromCentre);
            const GmPoint x = awayFromCentre ? band[0].curve().SP() : band[0].curve().EP();
            EXPECT_NEAR(x.Dist(arc.SP()), std::fabs(d), 1e-9);
            EXPECT_NEAR(x.Dist(arc.EP()), std::fabs(d), 1e-9);
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
        const CurveBox box = reachOf(arc);
        for (int k = 0; k < 100; ++k) {
            const GmPoint p = on(anyAngle());
            if (!arc.Element(p)) continue;
            ++accepted;
            ASSERT_TRUE(box.overlaps({p.X(), p.X(), p.Y(), p.Y()})) << arc.GetTraceString();
        }
    }
    EXPECT_GT(accepted, 50000);
}

TEST(Chaining, GoesOnOverGapsBelowThreeTolerancesAndLeavesShortPiecesOut) {
    Loose gaps({Segment(0, 0, 1, 0), Segment(1.00029, 0, 2, 0, 9), Segment(2.00031, 0, 3, 0, 9)});
    EXPECT_EQ(Starts(gaps.Take()), (std::vector<double>{0, 1.00029}));
    EXPECT_EQ(Starts(gaps.Take()), (std::vector<double>{2.00031}));
    EXPECT_TRUE(gaps.chaining.done());
    Loose tiny({Segment(0, 0, 0.0009, 0, 1), Segment(0.0009, 0, 0.002, 0, 2)});
    EXPECT_EQ(Starts(tiny.Take()), (std::vector<double>{0.0009}));
}

TEST(Chaining, PrefersCandidatesThatLeadOn) {
    Loose leading({Segment(0, 0, 1, 0, 1), Segment(1, 0, 1, 5, 2), Segment(1, 0, 2, 0, 3),
                   Segment(1, 0, 2, 1, 4), Segment(2, 0, 3, 0, 5), Segment(2, 1, 3, 1, 6)});
    EXPECT_EQ(leading.Take().back()->id(), 5) << "the first that leads on";
    Loose dead({Segment(0, 0, 1, 0, 1), Segment(1, 0, 1, 5, 2), Segment(1, 0, 2, 0, 3)});
    EXPECT_EQ(dead.Take().back()->id(), 2) << "the first where none leads on";
    Loose caps({Segment(0, 0, 1, 0, 1, PieceRole::kEndCap), Segment(1, 0, 2, 0, 2),
                Segment(9, 0, 9, 1, 3, PieceRole::kEndCap)});
    EXPECT_TRUE(hasOffset(caps.Take()));
    EXPECT_FALSE(hasOffset(caps.Take()));
}

TEST(Chaining, FindsEveryStartWithinReachOnEitherSideOfACell) {
    std::mt19937 engine(11);
    const auto unit = [&engine] { return double(engine() % 2001) / 1000.0 - 1.0; };
    for (const double far : {0.0, 3e-4, -6e-4, 1234.5678, -1e6, 1e12}) {
        for (int i = 0; i < 300; ++i) {
            const Vec3 start{far + 2e-3 * unit(), far - 2e-3 * unit(), 0};
            const Vec3 p{start.x + 2.9e-4 * unit(), start.y, 0};
            StartCells cells(3e-4);
            cells.add(start, 5);
            cells.add({far + 1, far, 0}, 4);
            cells.order();
            std::vector<std::size_t> found;
            cells.collectNear(p, found);
            ASSERT_EQ(found, (std::vector<std::size_t>{5})) << start.x << " " << start.y;
        }
    }
}

TEST(ResultContour, BridgesGapsAndTellsWhatIsMade) {
    std::vector<GmOffsetElement> chain;
    chain.push_back(Element(0, 0, 4, 0, 1));
    chain.push_back(Element(4, 0.0002, 4, 3, 2));
    chain.push_back(Element(4, 3.00005, 0, 0, 3, PieceRole::kEndCap));
    const auto contour = resultContour(std::move(chain));
    // One gap is bridged, the other within tolerance.
    ASSERT_EQ(shapes::Identifiers(*contour), (std::vector<long>{1, 2, 2, 3}));
    for (int i = 0; i < 4; ++i) {
        EXPECT_EQ(contour->GetContElement(i)->bInserted, i % 2 == 1);
        EXPECT_EQ(contour->GetContElement(i)->lIndex, i);
    }
    EXPECT_TRUE(contour->IsClosed());
}
