// SPDX-License-Identifier: MIT
/// @file
/// Splitting the elements of a contour.
///
/// An element is split by a copy of it: the copy starts at the point, the element ends there, and
/// the copy follows it in the chain. The point is not projected, so an arc that is split within its
/// tolerance of 0.01 gets an end off its circle. Splitting at quadrants goes through the four axis
/// points in the order of travel, beginning with the first one ahead of the start, so that each one
/// found lies on the rest that is still to be split. The rests are inserted all at once, as moving
/// the chain for each of them would take time with the square of its length.
#include <algorithm>
#include <array>
#include <cstddef>
#include <memory>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "kernel/curves/VerifiedCast.h"
#include "kernel/values/HandedOver.h"

namespace {

using Elements = KxArray<GmContElement*, GmContElement*>;
using Offsets = std::array<GmVec, 4>;

/// The points of a circle on the axes through its centre, in the order of travel, beginning with
/// the first one ahead of the start of the arc.
Offsets quadrantOffsets(GmArc const& arc) {
    const double r = arc.R();
    const bool ccw = arc.Dir() == GmBase::eRotCCW;
    const double side = ccw ? 1.0 : -1.0;
    Offsets offsets = {GmVec(r, 0.0, 0.0), GmVec(0.0, side * r, 0.0), GmVec(-r, 0.0, 0.0),
                       GmVec(0.0, -side * r, 0.0)};
    const int quadrant = GmDir(arc.M(), arc.SP()).Quadrant13();
    const int first = (ccw ? quadrant + 1 : 4 - quadrant) % 4;
    std::rotate(offsets.begin(), offsets.begin() + first, offsets.end());
    return offsets;
}

bool isInside(GmCurve const& element, GmPoint const& p) {
    return !(p == element.SP()) && !(p == element.EP()) && element.Element(p);
}

/// The rest of an element that is to be split, not yet in the chain.
struct Rest {
    int index = 0;  ///< of the element
    std::unique_ptr<GmCurve> curve;
    std::unique_ptr<GmContElement> record;
};

/// The part of a curve from a point on, as the rest of an element.
Rest restFrom(GmPoint const& p, GmArc const& arc, int index, GmContElement const& source) {
    Rest rest;
    rest.index = index;
    rest.curve = std::make_unique<GmArc>(arc);
    rest.curve->SetSP(p);
    rest.record = std::make_unique<GmContElement>(
        GmContElement{rest.curve.get(), source.lId, source.lIndex, true});
    return rest;
}

/// Appends what splitting an element at its quadrants leaves behind each point. The element itself
/// stays as it is.
void splitOffQuadrants(GmContElement const& source, int index, std::vector<Rest>& rests) {
    auto const* arc = gmkernel_detail::curveAs<GmArc>(*source.pCurve);
    if (arc == nullptr) return;
    const GmPoint centre = arc->M();
    for (GmVec const& toCut : quadrantOffsets(*arc)) {
        const GmPoint cut(centre + toCut);
        if (!isInside(*arc, cut)) continue;
        rests.push_back(restFrom(cut, *arc, index, source));
        arc = gmkernel_detail::curveAs<GmArc>(*rests.back().curve);
    }
}

/// The records of a chain, each with those of its rests behind it.
std::vector<GmContElement*> withRests(Elements const& elements, std::vector<Rest> const& rests) {
    std::vector<GmContElement*> records;
    auto rest = rests.begin();
    for (int i = 0; i < elements.GetSize(); ++i) {
        records.push_back(elements[i]);
        for (; rest != rests.end() && rest->index == i; ++rest)
            records.push_back(rest->record.get());
    }
    return records;
}

/// Ends every curve that is split where its rest begins.
void endAtRests(std::vector<Rest> const& rests, std::vector<GmContElement*> const& records) {
    for (std::size_t i = 0; i < rests.size(); ++i) {
        // Every rest before it has moved the place by one.
        const std::size_t place = static_cast<std::size_t>(rests[i].index) + i;
        records[place]->pCurve->SetEP(rests[i].curve->SP());
    }
}

/// Hands the rests over to a chain, behind their elements.
void insertRests(Elements& elements, std::vector<Rest>& rests) {
    const std::vector<GmContElement*> records = withRests(elements, rests);
    // The only step that can fail: the chain is changed as a whole or not at all.
    elements.SetSize(static_cast<int>(records.size()));
    endAtRests(rests, records);
    int place = 0;
    for (GmContElement* const record : records)
        elements.SetAtGrow(place++, record);
    for (Rest& rest : rests) {
        gmkernel_detail::handedOver(rest.record);
        gmkernel_detail::handedOver(rest.curve);
    }
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
    std::vector<Rest> rests;
    for (int i = 0; i < ElementCount(); ++i)
        splitOffQuadrants(*GetContElement(i), i, rests);
    if (!rests.empty()) insertRests(*m_pElements, rests);
    return true;
}

bool GmContour::SplitInside(int index, GmPoint const& p) {
    GmCurve const& element = *GetElement(index);
    return isInside(element, p) && SplitElement(index, p);
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
