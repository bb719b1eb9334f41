// SPDX-License-Identifier: MIT
/// @file
/// Two tangent arcs for a run of pieces with given directions at its ends.
///
/// The middle joints of all biarcs between two points along two directions u and w are an arc over
/// the chord, half way between the arc that leaves along u and that which arrives along w (the sums
/// of their angles halved). The first choice is the point where the run crosses it: then the biarc
/// meets the run in its middle, too, and errors are least. The second is the biarc with equal
/// tangents d, whose middle joint halves the way between sp + d u and ep - d w, 2 d apart. With v
/// the chord that is a square equation, whose positive root is
/// d = v v / (v (u + w) + sqrt((v (u + w))^2 + 2 (1 - u w) v v)), parallel directions included.
///
/// Both arcs have the same normal in the middle joint. The run is cut where it first crosses that
/// normal; what is before the cut has to be near the first arc, what is behind it near the second.
/// So both are near each other both ways by the reasons given in Corridor.cpp.
#include "region/simplify/Biarc.h"

#include <cmath>

#include "region/plane/Crossing.h"
#include "region/simplify/Corridor.h"
#include "region/simplify/Directions.h"

namespace gmregion {

namespace {

/// The crossing of a piece with the line through p square to a direction; the nearer end where
/// rounding hides it.
Vec2 crossingOf(const Piece& piece, Vec2 p, Vec2 dir) {
    const Element& e = piece.e;
    const double before = dot(p - e.sp, dir);
    const double behind = dot(e.ep - p, dir);
    const double share = before / (before + behind);
    Vec2 best = before < behind ? e.sp : e.ep;
    if (!isArc(e)) return e.sp + share * (e.ep - e.sp);
    double nearest = 2.0;
    for (const Vec2 q : crossings(carrierOf(e), Carrier{p, dir, 0.0})) {
        const double place = placeOn(e, q);
        if (!(place >= 0.0 && place <= 1.0) || !(std::fabs(place - share) < nearest)) continue;
        nearest = std::fabs(place - share);
        best = q;
    }
    return best;
}

/// Checks a run against both arcs, the cut between them where it first crosses their normal.
bool isNearBoth(const PieceRun& run, const Piece& one, const Piece& two) {
    const Corridor first(one);
    const Corridor second(two);
    const Vec2 joint = one.e.ep;
    const Vec2 dir = one.endDir;
    std::size_t i = run.from;
    for (; i < run.to && dot(run.chain.pieces[i].e.ep - joint, dir) <= 0.0; ++i) {
        if (!first.holds(run.chain.pieces[i], run.toleranceOf(i))) return false;
    }
    if (i == run.to) return false;
    const Piece& crossing = run.chain.pieces[i];
    const double t = run.toleranceOf(i);
    const Vec2 cut = crossingOf(crossing, joint, dir);
    if (cut == crossing.e.sp || cut == crossing.e.ep) {
        if (!(cut == crossing.e.sp ? second : first).holds(crossing, t)) return false;
    } else {
        const Parts parts = cutAt(crossing.e, cut);
        if (!first.holds(pieceOf(parts.first, 0), t) || !second.holds(pieceOf(parts.second, 0), t))
            return false;
    }
    for (++i; i < run.to; ++i) {
        if (!second.holds(run.chain.pieces[i], run.toleranceOf(i))) return false;
    }
    return true;
}

/// Sets which elements of the source each arc stands for.
void shareSources(const PieceRun& run, std::array<Piece, 2>& arcs) {
    const Vec2 joint = arcs[0].e.ep;
    std::size_t i = run.from;
    while (i + 1 < run.to && dot(run.chain.pieces[i].e.ep - joint, arcs[0].endDir) <= 0.0)
        ++i;
    arcs[0].last = run.chain.pieces[i].last;
    arcs[1].first = run.chain.pieces[i].first;
}

/// A biarc by its middle joint.
std::optional<Biarc> biarcThrough(const Ends& ends, Vec2 joint) {
    if (joint == ends.sp || joint == ends.ep) return std::nullopt;
    const Biarc arcs{Element{ends.sp, joint, bulgeLeaving(ends.startDir, joint - ends.sp)},
                     Element{joint, ends.ep, bulgeReaching(ends.ep - joint, ends.endDir)}};
    for (const Element& arc : arcs) {
        if (!(std::fabs(arc.bulge) <= 1.0)) return std::nullopt;
    }
    return arcs;
}

/// The arc of all middle joints.
Element jointArc(const Ends& ends) {
    const Vec2 chord = ends.ep - ends.sp;
    const double leaving = bulgeLeaving(ends.startDir, chord);
    const double reaching = bulgeReaching(chord, ends.endDir);
    const double both = (leaving + reaching) / (1.0 - leaving * reaching);
    return {ends.sp, ends.ep, both / (1.0 + std::sqrt(1.0 + both * both))};
}

/// Where the run crosses the arc of middle joints, as near to its middle as it does.
std::optional<Vec2> jointOnRun(const PieceRun& run, const Ends& ends) {
    const Carrier c = carrierOf(jointArc(ends));
    const double halfWay = 0.5 * double(run.from + run.to);
    std::optional<Vec2> joint;
    double nearest = HUGE_VAL;
    double before = 0.0;
    for (std::size_t i = run.from; i + 1 < run.to; ++i) {
        const Element& e = run.chain.pieces[i].e;
        const double behind = sideOf(c, e.ep).value;
        const bool crosses = i > run.from && (before > 0.0) != (behind > 0.0);
        const double off = std::fabs(double(i) + 0.5 - halfWay);
        if (crosses && off < nearest) {
            nearest = off;
            joint = footOn(c, e.sp + (before / (before - behind)) * (e.ep - e.sp));
        }
        before = behind;
    }
    return joint;
}

/// A biarc for a run by its middle joint, if it will do.
std::optional<std::array<Piece, 2>> proposed(const PieceRun& run,
                                             const std::optional<Biarc>& arcs) {
    if (!arcs) return std::nullopt;
    std::array<Piece, 2> pieces{standIn(run, (*arcs)[0]), standIn(run, (*arcs)[1])};
    if (!isNearBoth(run, pieces[0], pieces[1])) return std::nullopt;
    shareSources(run, pieces);
    return pieces;
}

}  // namespace

std::optional<Biarc> biarcBetween(const Ends& ends) {
    const Vec2 chord = ends.ep - ends.sp;
    const double squared = dot(chord, chord);
    const double along = dot(chord, ends.startDir + ends.endDir);
    const double bend = 1.0 - dot(ends.startDir, ends.endDir);
    const double d = squared / (along + std::sqrt(along * along + 2.0 * bend * squared));
    return biarcThrough(ends, middle(ends.sp + d * ends.startDir, ends.ep - d * ends.endDir));
}

std::optional<std::array<Piece, 2>> fitBiarc(const PieceRun& run) {
    const auto dirOf = [](const Joint& joint, Vec2 otherwise) {
        return joint.kind == JointKind::kTangent ? joint.dirBefore : otherwise;
    };
    const Ends ends{run.first().e.sp, dirOf(run.before(), run.first().startDir), run.last().e.ep,
                    dirOf(run.behind(), run.last().endDir)};
    if (ends.sp == ends.ep) return std::nullopt;
    if (const auto joint = jointOnRun(run, ends)) {
        if (const auto arcs = proposed(run, biarcThrough(ends, *joint))) return arcs;
    }
    return proposed(run, biarcBetween(ends));
}

}  // namespace gmregion
