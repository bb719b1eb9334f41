// SPDX-License-Identifier: MIT
/// @file
/// Splitting the elements of a contour.
///
/// An element is split by a copy of it: the copy starts at the point, the element ends there, and
/// the copy follows it in the chain. The point is not projected, so an arc that is split within its
/// tolerance of 0.01 gets an end off its circle. Splitting at quadrants goes through the four axis
/// points in the order of travel, beginning with the first one ahead of the start, so that each one
/// found lies on the rest that is still to be split.
#include <memory>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "kernel/curves/VerifiedCast.h"
#include "kernel/values/HandedOver.h"

namespace {

using Offsets = std::vector<GmVec>;

/// The points of a circle on the axes through its centre, in the order of travel, beginning with
/// the first one ahead of the direction `from`.
Offsets quadrantOffsets(GmArc const& arc) {
    const double r = arc.R();
    const bool ccw = arc.Dir() == GmBase::eRotCCW;
    const double side = ccw ? 1.0 : -1.0;
    const Offsets inTravel = {GmVec(r, 0.0, 0.0), GmVec(0.0, side * r, 0.0), GmVec(-r, 0.0, 0.0),
                              GmVec(0.0, -side * r, 0.0)};
    const int quadrant = GmDir(arc.M(), arc.SP()).Quadrant13();
    const int first = (ccw ? quadrant + 1 : 4 - quadrant) % 4;
    Offsets offsets;
    for (int i = 0; i < 4; ++i)
        offsets.push_back(inTravel[static_cast<std::size_t>((first + i) % 4)]);
    return offsets;
}

}  // namespace

bool GmContour::SplitAt(GmPoint const& p) {
    int index = 0;
    while (index < ElementCount() && !GetElement(index)->Element(p))
        ++index;
    GmCurve const* const element = GetElement(index);
    if (!element) return false;
    if (!(p == element->SP()) && !(p == element->EP()) && !SplitElement(index, p)) return false;
    m_LastInsertPoint = p;
    return true;
}

bool GmContour::SplitAt(GmCurve* curve) {
    if (Intersection(curve) == 0) return false;
    const std::vector<GmPoint> points = GetPtSol();
    bool split = false;
    for (GmPoint const& p : points)
        split = SplitAt(p) || split;
    return split;
}

bool GmContour::SplitAtMinDist(GmPoint const& p) {
    double dist = 0.0;
    const GmPoint nearest = MinDist(dist, p, false);
    return nearest.CreationOK() && SplitAt(nearest);
}

bool GmContour::SplitAtMinDist(GmPoint const& p, GmPoint const& q) {
    double dist = 0.0;
    const GmPoint nearest = MinDist(dist, p, q, false);
    return nearest.CreationOK() && SplitAt(nearest);
}

bool GmContour::SplitAtMinDist(GmContour* other) {
    double dist = 0.0;
    const GmPoint nearest = MinDist(dist, static_cast<GmCurve const*>(other), false);
    return nearest.CreationOK() && SplitAt(nearest);
}

bool GmContour::SplitBothAtMinDist(GmContour* other) {
    double dist = 0.0;
    const GmPoint nearest = MinDist(dist, static_cast<GmCurve const*>(other), false);
    return nearest.CreationOK() && SplitAt(nearest) && other->SplitAtMinDist(nearest);
}

bool GmContour::SplitArcs(GmDir const& dir, bool bBoth) {
    for (int i = 0; i < ElementCount(); ++i) {
        auto const* const arc = gmkernel_detail::curveAs<GmArc>(*GetElement(i));
        if (arc == nullptr) continue;
        const GmVec toCut = arc->R() * GmVec(dir);
        int pieces = SplitInside(i, GmPoint(arc->M() + toCut)) ? 1 : 0;
        if (bBoth && SplitInside(i, GmPoint(arc->M() - toCut))) ++pieces;
        i += pieces;
    }
    return true;
}

bool GmContour::SplitArcsQuadrant() {
    for (int i = 0; i < ElementCount(); ++i) {
        auto const* const arc = gmkernel_detail::curveAs<GmArc>(*GetElement(i));
        if (arc == nullptr) continue;
        const GmPoint centre = arc->M();
        for (GmVec const& toCut : quadrantOffsets(*arc)) {
            if (SplitInside(i, GmPoint(centre + toCut))) ++i;
        }
    }
    return true;
}

bool GmContour::SplitInside(int index, GmPoint const& p) {
    GmCurve const& element = *GetElement(index);
    if (p == element.SP() || p == element.EP() || !element.Element(p)) return false;
    return SplitElement(index, p);
}

bool GmContour::SplitElement(int index, GmPoint const& p) {
    std::unique_ptr<GmCurve> rest(GetNewElement(index));
    if (!rest) return false;
    GmContElement const source = *GetContElement(index);
    rest->SetSP(p);
    std::unique_ptr<GmContElement> record(
        CreateContElement(rest.get(), source.lId, source.lIndex, true));
    m_pElements->InsertAt(index + 1, record.get());
    gmkernel_detail::handedOver(record);
    gmkernel_detail::handedOver(rest);
    source.pCurve->SetEP(p);
    return true;
}
