// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <vector>

#include "Dice.h"

namespace net {

/// The kinds of curves that AnyCurve() makes.
enum class Kind { kLine, kBeam, kStretch, kCircle, kArc, kHelix, kRect, kContour };
constexpr int kKinds = 8;

/// A curve of a kind, rarely an undefined one.
std::unique_ptr<GmCurve> AnyCurve(Dice& dice, Kind kind);

GmLine AnyLine(Dice& dice);
GmStretch AnyStretch(Dice& dice);
GmCircle AnyCircle(Dice& dice);
GmArc AnyArc(Dice& dice);
GmRect AnyRect(Dice& dice);

/// A corner of a ring of elements: where the next element starts, and how far that bulges to the
/// right of its chord, as a share of half of it; 0 for a segment.
struct Corner {
    GmPoint p;
    double bulge = 0.0;
};
using Corners = std::vector<Corner>;

/// The chain over the corners, back to the first one where `bClosed`. Elements that are refused
/// leave a gap out, as when a drawing is read.
GmContour Chain(Dice& dice, Corners const& corners, bool bClosed);

/// Corners about the origin at falling or rising angles: a ring that does not cross itself unless
/// its bulges do.
Corners Star(Dice& dice, int count, bool bArcs);
/// Corners anywhere: the ring crosses itself, repeats points and has elements without length.
Corners Tangle(Dice& dice, int count);
/// A walk of corners that mostly goes on in its direction.
Corners Walk(Dice& dice, int count);
/// A rectangle with rounded corners, turned by any angle and rounded to 2 to 12 decimals, so that
/// its joints are nearly tangent.
Corners Plate(Dice& dice);
/// Two plates joined by a narrow neck.
Corners Hourglass(Dice& dice);

/// A closed contour of one of these kinds without faults, of moderate size.
GmContour SoundContour(Dice& dice);
/// Any contour: open or closed, sound or faulty, some with coordinates out of hand.
GmContour AnyContour(Dice& dice);

/// Moves one or two corners to where contours fail: onto a neighbour, nearly onto it, far away.
void Spoil(Dice& dice, Corners& corners);

/// A contour that shows the operations meant for derived classes.
class DerivedContour : public GmContour {
public:
    explicit DerivedContour(GmContour const& contour) : GmContour(contour) {}
    using GmContour::AddRealElem;
    using GmContour::CheckContour;
    using GmContour::GetArc;
    using GmContour::GetHP;
    using GmContour::InsertElem;
    using GmContour::SplitArcs;
    using GmContour::SplitArcsQuadrant;
};

/// A point beside, on or away from a contour.
GmPoint PointNear(Dice& dice, GmContour const& contour);

}  // namespace net
