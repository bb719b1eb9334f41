// SPDX-License-Identifier: MIT
/// @file
/// Fillets between arcs, and between an arc and a segment.
///
/// A path that turns at a corner is rounded on the inner side of the turn. The fillet touches an
/// arc from inside when the path turns the way the arc does, else from outside; with sides and
/// kinds of contact known, the touching circles of the full figures give it. Where the path
/// reverses there is no turn, and the side follows from the shape. Contacts may lie beyond the ends
/// of the arcs: that is for the caller to test. Constant cost.
#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/values/Constants.h"

namespace {

/// Does the path reverse between the two directions of travel?
bool areOpposite(GmAngle const& a, GmAngle const& b) {
    const double turn = std::fabs(a.Degree() - b.Degree());
    return std::fabs(turn - 180.0) < GmBase::m_scdPrec;
}

GmBase::eRotDir opposite(GmBase::eRotDir rot) {
    return static_cast<GmBase::eRotDir>(-rot);
}

/// The sense in which a path turns from the end of `a1` into `a2`.
GmBase::eRotDir turnBetween(GmArc const& a1, GmArc const& a2) {
    const GmAngle leaving = a1.TangEP().Angle();
    const GmAngle entering = a2.TangSP().Angle();
    if (!areOpposite(leaving, entering)) return leaving.Rotation(entering);
    const bool staysInside = GmCircle(a1.M(), a1.R(), false).In(a2.EP());
    return staysInside ? a1.Dir() : opposite(a1.Dir());
}

/// An arc as a path from the segment enters it. A path that leaves the arc for the segment is
/// looked at backwards.
struct ArcEntry {
    GmDir alongSegment;
    GmDir alongArc;
    double angle;  // polar angle of the common end, radians
    GmBase::eRotDir sense;
    GmLine supportingLine;
};

ArcEntry entryOf(GmArc const& a, GmStretch const& s, bool bArcFirst) {
    if (bArcFirst)
        return {-s.Dir(), -a.TangEP(), a.EAng(), opposite(a.Dir()), GmLine(s.Inverted())};
    return {s.Dir(), a.TangSP(), a.SAng(), a.Dir(), GmLine(s)};
}

/// The sense in which the path turns from the segment into the arc; where it reverses, towards the
/// centre of the arc.
GmBase::eRotDir turnInto(ArcEntry const& entry) {
    const GmAngle leaving = entry.alongSegment.Angle();
    const GmAngle entering = entry.alongArc.Angle();
    if (!areOpposite(leaving, entering)) return leaving.Rotation(entering);
    return leaving.Rotation(GmAngle(entry.angle - gmkernel_detail::kPi, true));
}

}  // namespace

GmCircle::GmCircle(GmArc const& a1, GmArc const& a2, double r, bool bOther) : GmCircle() {
    if (!a1.CreationOK() || !a2.CreationOK() || !(r > 0.0)) return;
    const eRotDir turn = turnBetween(a1, a2);
    CreateTangCircle(a1, a2, r, turn == eRotCW, turn != a1.Dir(), turn != a2.Dir(), bOther);
}

GmCircle::GmCircle(GmArc const& a, GmStretch const& s, double r, bool bArcFirst, bool bOther)
    : GmCircle() {
    if (!a.CreationOK() || !s.CreationOK() || !(r > 0.0)) return;
    const ArcEntry entry = entryOf(a, s, bArcFirst);
    const eRotDir turn = turnInto(entry);
    CreateTangCircle(a, entry.supportingLine, r, turn == eRotCW, turn != entry.sense, bOther);
}
