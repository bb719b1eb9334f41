// SPDX-License-Identifier: MIT
/// @file
/// Offsets, checked over their whole length.
///
/// Asked is whether every point of the result has the distance r from the source, within a margin
/// m. Two steps answer. The quick one takes a piece e of the result and a piece s of the source
/// near it and proves by a few products that nothing is wrong; what it cannot prove it leaves to
/// the slow one, which cuts e wherever the distance from any s passes r - m or r + m (Cuts.cpp) and
/// asks one point of each part.
///
/// Too near: the points nearer to s than r - m are two discs about its ends and what lies between
/// the parallels at r - m and the normals at the ends. If the discs stay clear of e, then e avoids
/// the rest when it lies beyond one of the normals, or on the outer side of one of the parallels,
/// over its whole length. Both are forms whose least value over an element is known
/// (Alongside.cpp). Every pair whose boxes come within r is asked, so no stretch is forgiven.
///
/// Too far: e is within r + m of s when it lies between the normals at the ends of s, and the form
/// of the parallel of s at r is nowhere above m on it; or when it lies in the cone of a corner and
/// the form of the circle about it is not. That the distance is on the right side, and that e runs
/// the right way, comes with the parallel. One such s is enough.
///
/// Missing: going outward across the parallel of s, or the arc about a corner, the distance grows
/// up to r. Where it goes on growing behind, the true boundary is there, and the result must be.
/// Parts of the parallel between cuts at r from other pieces are boundary as a whole or not at all.
/// What a piece of the result runs along from end to end is not asked again.
#include "region/verify/OffsetVerifier.h"

#include <algorithm>
#include <cmath>

#include "region/plane/ElementBox.h"
#include "region/plane/ElementWinding.h"
#include "region/plane/Nearest.h"
#include "region/verify/LoopCheck.h"

namespace gmregion {

namespace {

/// The margin in tolerances: nodes move ends by one, and bend what is between as much again.
constexpr double kMargin = 2.0;
/// Slack for rounding where lengths are compared with a half-plane, in margins.
constexpr double kRounding = 1.0 / 64.0;
/// In margins: how far behind a boundary the distance must have grown, and how near to it the
/// result must be found.
constexpr double kBehind = 4.0;
constexpr double kFound = 4.0;
/// How often what is not proven as a whole is halved before it is cut.
constexpr int kHalvings = 3;
/// Corners that turn by less than this sine have no arc worth asking for.
constexpr double kTurns = 1e-9;

double squared(Vec2 v) {
    return dot(v, v);
}

double apart(Vec2 a, Vec2 b) {
    return std::sqrt(squared(a - b));
}

/// The left normal turned to the direction of travel.
Vec2 along(Vec2 leftNormal) {
    return rightNormal(leftNormal);
}

}  // namespace

void OffsetVerifier::verify(const LoopsView& source, double distance, const LoopsView& result,
                            const OffsetOptions& options, double tolerance, FaultList& faults) {
    m_distance = distance;
    m_radius = std::fabs(distance);
    m_tolerance = tolerance;
    m_margin = kMargin * tolerance;
    m_options = options;
    m_faults = &faults;
    m_guess = kNone;
    m_source.take(source);
    m_result.take(result);
    checkLoops(result, m_result, tolerance, faults);
    makeFeatures();
    probeAll();
    for (std::size_t piece = 0; piece < m_states.size(); ++piece) {
        if (!m_states[piece].covered || m_states[piece].doubtful) judge(piece);
    }
    findMissing();
}

void OffsetVerifier::makeFeatures() {
    m_features.clear();
    for (const BoundaryPiece& s : m_source.pieces()) {
        Feature f;
        f.wanted = parallel(s.carrier, m_distance);
        f.startNormal = s.carrier.normal;
        f.endNormal = s.carrier.normal - s.carrier.curvature * (s.ep - s.sp);
        m_features.push_back(f);
    }
    linkFeatures();
}

/// Finds the piece before each, and whether the corner between them opens.
void OffsetVerifier::linkFeatures() {
    const auto& pieces = m_source.pieces();
    Index first = 0;
    for (Index i = 0; i < pieces.size(); ++i) {
        if (i > 0 && m_source.loopOf(i) != m_source.loopOf(i - 1)) first = i;
        if (i > first) m_features[i].before = i - 1;
        const bool isLast = i + 1 == pieces.size() || m_source.loopOf(i + 1) != m_source.loopOf(i);
        if (isLast) m_features[first].before = i;
        m_features[i].after = isLast ? first : i + 1;
    }
    for (Feature& f : m_features) {
        const Vec2 before = m_features[f.before].endNormal;
        const double turn = cross(before, f.startNormal);
        f.opens = turn * m_distance > 0.0 || dot(before, f.startNormal) < kTurns - 1.0;
    }
}

/// Proves what it can of every two pieces that come near each other.
void OffsetVerifier::probeAll() {
    const auto& pieces = m_result.pieces();
    m_states.assign(pieces.size(), {});
    for (std::size_t i = 0; i < pieces.size(); ++i) {
        const Probe p(pieces[i]);
        const Box box = m_result.boxes()[i].grown(m_radius);
        m_source.boxes().visitOverlapping(box, [&](std::size_t s) { probe(i, s, p); });
    }
}

void OffsetVerifier::probe(std::size_t piece, std::size_t feature, const Probe& p) {
    const BoundaryPiece& s = m_source.pieces()[feature];
    Feature& f = m_features[feature];
    State& state = m_states[piece];
    if (!state.doubtful) state.doubtful = !staysAway(m_result.pieces()[piece], s, f, p);
    if (!state.covered) state.covered = runsAlong(s, f, p) || runsAbout(s, f, p);
}

/// Whether a piece of the result certainly comes no nearer to one of the source than allowed.
bool OffsetVerifier::staysAway(const BoundaryPiece& piece, const BoundaryPiece& s, const Feature& f,
                               const Probe& p) const {
    const double least = m_radius - m_margin;
    if (!(least > 0.0)) return true;
    // The disc about the start; that about the end is the next piece's.
    if (std::fabs(signedDistance(piece.carrier, s.sp)) < least &&
        squared(nearestOn(piece, piece.carrier, s.sp) - s.sp) < least * least)
        return false;
    return isClear(piece, piece.carrier, s, f, p, kHalvings);
}

/// Whether a part of a piece of the result avoids what lies between the parallels and the normals
/// of one of the source: as a whole, or by halves.
bool OffsetVerifier::isClear(const Element& part, const Carrier& carrier, const BoundaryPiece& s,
                             const Feature& f, const Probe& p, int halvings) const {
    if (isBeside(s, f, p) || isBeyond(s, p)) return true;
    if (halvings == 0) return false;
    const Vec2 m = p.mid;
    const double half = part.bulge / (1.0 + std::sqrt(1.0 + part.bulge * part.bulge));
    const auto isHalfClear = [&](const Element& e) {
        return isClear(e, carrier, s, f, Probe(e, carrier), halvings - 1);
    };
    return isHalfClear({part.sp, m, half}) && isHalfClear({m, part.ep, half});
}

/// Whether a probe lies on the outer side of one of the parallels of a piece.
bool OffsetVerifier::isBeyond(const BoundaryPiece& s, const Probe& p) const {
    const double least = m_radius - m_margin;
    const bool isOnRight = sideOf(s.carrier, p.sp).value < 0.0;
    const std::optional<Carrier> limit = parallel(s.carrier, isOnRight ? least : -least);
    if (!limit) return false;
    const FormRange form = formOver(*limit, p);
    return isOnRight ? form.high <= 0.0 : form.low >= 0.0;
}

/// Whether a probe lies beyond one of the normals at the ends of a piece.
bool OffsetVerifier::isBeside(const BoundaryPiece& s, const Feature& f, const Probe& p) const {
    const double slack = kRounding * m_margin;
    return heightOver(s.sp, along(f.startNormal), p).high <= slack ||
           heightOver(s.ep, along(f.endNormal), p).low >= -slack;
}

/// Whether a probe runs along the parallel of a piece over its whole length, the same way.
bool OffsetVerifier::runsAlong(const BoundaryPiece& s, Feature& f, const Probe& p) const {
    if (!f.wanted || m_radius < 8.0 * m_margin) return false;
    const Side atStart = sideOf(*f.wanted, p.sp);
    if (!(std::fabs(atStart.value) <= m_margin)) return false;
    if (!(dot(atStart.gradient, p.startNormal) > 0.0)) return false;
    const FormRange form = formOver(*f.wanted, p);
    if (!(form.low >= -m_margin && form.high <= m_margin)) return false;
    if (!(heightOver(s.sp, along(f.startNormal), p).low >= -m_margin)) return false;
    if (!(heightOver(s.ep, along(f.endNormal), p).high <= m_margin)) return false;
    ++f.found;
    f.foundFrom = p.sp;
    f.foundTo = p.ep;
    return true;
}

/// Whether a probe runs along the arc about the start of a piece.
bool OffsetVerifier::runsAbout(const BoundaryPiece& s, Feature& f, const Probe& p) const {
    if (!f.opens || m_options.join != Join::kRound || m_radius < 8.0 * m_margin) return false;
    const Vec2 in = along(m_features[f.before].endNormal);
    const Carrier wanted{s.sp - m_distance * f.startNormal, f.startNormal, 1.0 / m_distance};
    const Side atStart = sideOf(wanted, p.sp);
    if (!(std::fabs(atStart.value) <= m_margin)) return false;
    if (!(dot(atStart.gradient, p.startNormal) > 0.0)) return false;
    const FormRange form = formOver(wanted, p);
    if (!(form.low >= -m_margin && form.high <= m_margin)) return false;
    if (!(heightOver(s.sp, in, p).low >= -m_margin)) return false;
    if (!(heightOver(s.sp, along(f.startNormal), p).high <= m_margin)) return false;
    const double near = 2.0 * m_margin;
    if (apart(p.sp, s.sp - m_distance * m_features[f.before].endNormal) <= near &&
        apart(p.ep, s.sp - m_distance * f.startNormal) <= near)
        f.arcFound = true;
    return true;
}

/// The slow step: cuts a piece of the result and asks every part.
void OffsetVerifier::judge(std::size_t number) {
    const BoundaryPiece& piece = m_result.pieces()[number];
    m_cuts.begin(piece);
    const Box box = m_result.boxes()[number].grown(m_radius + 2.0 * m_margin);
    m_source.boxes().visitOverlapping(box, [&](std::size_t s) {
        m_cuts.cut(m_source.pieces()[s], m_radius - m_margin);
        m_cuts.cut(m_source.pieces()[s], m_radius + m_margin);
    });
    m_cuts.visitParts(m_tolerance,
                      [&](Vec2 from, Vec2 q, Vec2 to) { judgePart(piece, from, q, to); });
}

void OffsetVerifier::judgePart(const BoundaryPiece& piece, Vec2 from, Vec2 q, Vec2 to) {
    const BoundaryIndex::Near near = m_source.nearest(q, 1e100);
    const double away = near.piece == kNone ? HUGE_VAL : near.distance;
    const double slack = m_margin * (1.0 + kRounding);
    const bool isInside = m_source.windingAbout(q) > 0;
    if (m_radius > slack && isInside != (m_distance < 0.0)) {
        m_faults->add(FaultKind::kWrongSide, q, away + m_radius, piece.element);
    } else if (away < m_radius - slack) {
        if (m_options.join == Join::kBevel || isCutOff(near)) return;
        m_faults->add(FaultKind::kTooNear, q, m_radius - away, piece.element);
    } else if (away > m_radius + slack) {
        const bool mayReachOut = m_options.join == Join::kMiter;
        if (mayReachOut && away <= m_options.miterLimit * m_radius + m_margin) return;
        m_faults->add(FaultKind::kTooFar, q, away - m_radius, piece.element);
    } else if (m_options.join != Join::kMiter && m_radius > 8.0 * m_margin &&
               apart(from, to) > 8.0 * m_margin) {
        // The tip of a miter may come to the distance of what is on its other side.
        const Vec2 normal = sideOf(piece.carrier, q).gradient;
        // In a neck twice the distance wide either wall is as near, and no sense is wrong.
        const double behind = kBehind * m_margin;
        const Vec2 onward = q + (behind / away) * (q - near.at);
        const bool isNeck = m_source.isAnyNear(onward, m_radius + 0.5 * behind);
        if (dot(normal, near.at - q) * m_distance < 0.0 && !isNeck)
            m_faults->add(FaultKind::kWrongSense, q, 0.0, piece.element);
    }
}

/// Whether a point of the source is a corner that the result may cut off, nearer than the distance.
bool OffsetVerifier::isCutOff(const BoundaryIndex::Near& near) const {
    const BoundaryPiece& s = m_source.pieces()[near.piece];
    return (apart(near.at, s.sp) <= m_tolerance && isCutOff(near.piece)) ||
           (apart(near.at, s.ep) <= m_tolerance && isCutOff(m_features[near.piece].after));
}

/// The same for the start of a piece: corners that open, with miters those beyond the limit.
bool OffsetVerifier::isCutOff(Index feature) const {
    const Feature& f = m_features[feature];
    if (m_options.join != Join::kMiter) return m_options.join == Join::kBevel && f.opens;
    const double spread = 1.0 + dot(m_features[f.before].endNormal, f.startNormal);
    const double limit = m_options.miterLimit;
    return f.opens && spread * limit * limit <= 2.0 * (1.0 + kTurns);
}

/// Looks for boundary of the true offset that the result does not have.
void OffsetVerifier::findMissing() {
    for (Index i = 0; i < m_features.size(); ++i) {
        if (m_radius > 0.0)
            findMissing(i);
        else
            cutMissing(m_source.pieces()[i], i);
    }
}

void OffsetVerifier::findMissing(Index feature) {
    const BoundaryPiece& s = m_source.pieces()[feature];
    const Feature& f = m_features[feature];
    if (f.wanted) findMissingOnParallel(feature);
    if (!f.opens || f.arcFound || m_options.join != Join::kRound) return;
    const Vec2 before = m_features[f.before].endNormal;
    const Vec2 from = s.sp - m_distance * before;
    const Vec2 to = s.sp - m_distance * f.startNormal;
    const double bulge = bulgeOfTurn(before, f.startNormal, m_distance > 0.0);
    findMissing({from, to, bulge}, feature, kHalvings);
}

/// Looks at what of a parallel no piece of the result runs along.
void OffsetVerifier::findMissingOnParallel(Index feature) {
    const BoundaryPiece& s = m_source.pieces()[feature];
    const Feature& f = m_features[feature];
    const Carrier& c = *f.wanted;
    const Vec2 from = s.sp - m_distance * f.startNormal;
    const Vec2 to = s.ep - m_distance * f.endNormal;
    if (f.found != 1) {
        findMissing({from, to, s.bulge}, feature, kHalvings);
        return;
    }
    const double near = 2.0 * m_margin;
    if (apart(from, f.foundFrom) > near) {
        const Element gap{from, f.foundFrom, bulgeBetween(c, from, f.foundFrom)};
        if (!isHidden(gap, c, f.before)) findMissing(gap, feature, kHalvings);
    }
    if (apart(f.foundTo, to) > near) {
        const Element gap{f.foundTo, to, bulgeBetween(c, f.foundTo, to)};
        if (!isHidden(gap, c, f.after)) findMissing(gap, feature, kHalvings);
    }
}

/// Whether a part of a parallel lies within the distance of a piece over its whole length: between
/// its normals, its parallel at the distance, and that on the other side.
bool OffsetVerifier::isHidden(const Element& e, const Carrier& c, Index by) const {
    const BoundaryPiece& s = m_source.pieces()[by];
    const Feature& f = m_features[by];
    const Probe p(e, c);
    const std::optional<Carrier> farther = parallel(s.carrier, -m_distance);
    if (!f.wanted || !farther) return false;
    const FormRange form = formOver(*f.wanted, p);
    const FormRange beyond = formOver(*farther, p);
    const bool isWithin = m_distance > 0.0 ? form.low >= -m_margin && beyond.high <= 0.0
                                           : form.high <= m_margin && beyond.low >= 0.0;
    return isWithin && heightOver(s.sp, along(f.startNormal), p).low >= -m_margin &&
           heightOver(s.ep, along(f.endNormal), p).high <= m_margin;
}

/// Passes over what is near to other pieces as a whole, by halves; cuts what is left. No point is
/// farther from the middle of an element than its ends.
void OffsetVerifier::findMissing(const Element& wanted, Index feature, int halvings) {
    if (wanted.sp == wanted.ep) return;
    const Vec2 q = middleOf(wanted);
    const double reach = apart(q, wanted.sp);
    if (reach < m_radius && m_source.isAnyNear(q, m_radius - reach, m_guess)) return;
    if (halvings == 0 || !m_source.isAnyNear(q, m_radius - m_margin, m_guess)) {
        cutMissing(wanted, feature);
        return;
    }
    const double half = wanted.bulge / (1.0 + std::sqrt(1.0 + wanted.bulge * wanted.bulge));
    findMissing({wanted.sp, q, half}, feature, halvings - 1);
    findMissing({q, wanted.ep, half}, feature, halvings - 1);
}

void OffsetVerifier::cutMissing(const Element& wanted, Index feature) {
    m_cuts.begin(wanted);
    const Carrier carrier = carrierOf(wanted);
    const Box box = boxAbout(wanted).grown(m_radius + m_margin);
    m_source.boxes().visitOverlapping(
        box, [&](std::size_t s) { m_cuts.cut(m_source.pieces()[s], m_radius); });
    m_cuts.visitParts(m_tolerance, [&](Vec2, Vec2 q, Vec2) {
        const Vec2 left = sideOf(carrier, q).gradient;
        const double size = std::sqrt(squared(left));
        const Vec2 outward = ((m_distance < 0.0 ? 1.0 : -1.0) / size) * left;
        if (!isMissing(q, outward, feature)) return;
        const BoundaryIndex::Near near = m_result.nearest(q, 1e100);
        m_faults->add(FaultKind::kMissing, q, near.piece == kNone ? m_radius : near.distance,
                      m_source.pieces()[feature].element);
    });
}

bool OffsetVerifier::isMissing(Vec2 q, Vec2 outward, Index feature) {
    const double behind = kBehind * m_margin;
    const Vec2 p = q + behind * outward;
    const double limit = m_radius + 0.5 * behind;
    // Mostly what cuts a parallel off is the next element or the one before.
    const Feature& f = m_features[feature];
    if (m_source.isNear(f.before, p, limit) || m_source.isNear(f.after, p, limit)) return false;
    if (m_source.isAnyNear(p, limit, m_guess)) return false;
    if (m_result.isAnyNear(q, kFound * m_margin)) return false;
    if ((m_source.windingAbout(p) > 0) != (m_distance < 0.0)) return false;
    if (m_options.join != Join::kMiter) return true;
    // Behind the miter of another corner.
    return (m_result.windingAbout(q) > 0) != (m_distance > 0.0);
}

}  // namespace gmregion
