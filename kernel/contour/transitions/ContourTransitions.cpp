// SPDX-License-Identifier: MIT
/// @file
/// Roundings and chamfers at the junctions of a contour.
///
/// What comes into a corner is decided from its two elements alone; here it is put between them and
/// the elements are cut back to its ends. Elements that have become too short are then removed from
/// the whole contour, which shifts the indices behind them. Nothing is tested against other
/// elements.

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/ContourElements.h"
#include "kernel/contour/transitions/Transition.h"
#include "kernel/curves/VerifiedCast.h"

using gmkernel_detail::Transition;

namespace {

/// Of a circle's solutions, of which there is at least one, the one nearest to a point.
GmPoint nearerSolution(GmCircle const& circle, int count, GmPoint const& p) {
    const GmPoint first = circle.GetSolution(0);
    if (count < 2) return first;
    const GmPoint second = circle.GetSolution(1);
    return second.Dist(p) < first.Dist(p) ? second : first;
}

/// The circle that touches the element whose neighbour lies on the outer side.
GmCircle circleBeside(GmCurve const& c1, GmCurve const& c2, double r) {
    const int sign = r >= 0.0 ? 1 : -1;
    const bool atSecond = GmLine(c1.EP(), c1.TangEP()).PointPos(c2.SP()) == sign;
    const GmDir normal = (atSecond ? c2.TangSP() : c1.TangEP()).Normalized(GmBase::eRotCW);
    const GmPoint touch = atSecond ? c2.SP() : c1.EP();
    return GmCircle(GmPoint(touch - r * GmVec(normal)), r, false);
}

}  // namespace

bool GmContour::AddTrans(eTransType type, int index, double value, bool bIdOfFirst) {
    const bool done = AddTransAt(type, index, value, bIdOfFirst);
    for (int i = static_cast<int>(ElementCount()) - 1; i >= 0; --i) {
        if (GetElement(i)->Length() < m_scdPrec) RemoveElement(i);
    }
    return done;
}

bool GmContour::AddTransAt(eTransType type, int index, double value, bool bIdOfFirst) {
    const int count = static_cast<int>(ElementCount());
    if (index < 0 || index > count - 1) return false;
    if (index == count - 1 && !m_bClosed) return false;
    const int next = index == count - 1 ? 0 : index + 1;
    const long id = GetContElement(bIdOfFirst ? index : next)->lId;
    GmCurve* const first = GetElement(index);
    GmCurve* const second = GetElement(next);
    if (!gmkernel_detail::isSegmentOrArc(*first) || !gmkernel_detail::isSegmentOrArc(*second))
        return false;
    return AddTransBetween(type, first, second, index, value, id);
}

bool GmContour::AddTrans(eTransType type, GmStretch* first, GmStretch* second, int index,
                         double value, long id) {
    return AddTransBetween(type, first, second, index, value, id);
}

bool GmContour::AddTrans(eTransType type, GmStretch* segment, GmArc* arc, int index, double value,
                         long id, bool bArcFirst) {
    if (bArcFirst) return AddTransBetween(type, arc, segment, index, value, id);
    return AddTransBetween(type, segment, arc, index, value, id);
}

bool GmContour::AddTrans(eTransType type, GmArc* first, GmArc* second, int index, double value,
                         long id) {
    return AddTransBetween(type, first, second, index, value, id);
}

bool GmContour::AddTransBetween(eTransType type, GmCurve* first, GmCurve* second, int index,
                                double value, long id) {
    if (!first || !second) return false;
    if (gmkernel_detail::isContinued(type, *first, *second)) return true;
    const Transition transition = gmkernel_detail::transitionAt(type, *first, *second, value);
    if (!transition.element) return false;
    if (!InsertElem(index + 1, transition.element.get(), false, id)) return false;
    first->SetEP(transition.contacts.onFirst);
    second->SetSP(transition.contacts.onSecond);
    // Between the last and the first element the chain was open until now.
    m_bClosed = gmkernel_detail::chainEnd(*this) == gmkernel_detail::chainStart(*this);
    return true;
}

bool GmContour::AddElementAndTrans(GmCurve const* c, bool bValidate, long id, eTransType type,
                                   double value, bool bIdOfFirst) {
    if (!AddElement(c, bValidate, id)) return false;
    return AddTrans(type, static_cast<int>(ElementCount()) - 2, value, bIdOfFirst);
}

bool GmContour::AddElementAndTrans(GmCurve const& c, bool bValidate, long id, eTransType type,
                                   double value, bool bIdOfFirst) {
    return AddElementAndTrans(&c, bValidate, id, type, value, bIdOfFirst);
}

GmPoint GmContour::GetIntersectionPoint(GmCircle const& circle, GmArc const* arc) const {
    return arc ? gmkernel_detail::contactWithArc(circle, *arc) : GmPoint();
}

GmCurve* GmContour::GetArc(GmCurve* c1, GmCurve* c2, double r, eRotDir dir) {
    if (!c1 || !c2) return nullptr;
    const GmCircle circle = circleBeside(*c1, *c2, r);
    const int hitsFirst = circle.Intersection(c1);
    if (hitsFirst == 0) return nullptr;
    const GmPoint sp = nearerSolution(circle, hitsFirst, c1->EP());
    c1->SetEP(sp);
    const int hitsSecond = circle.Intersection(c2);
    if (hitsSecond == 0) return nullptr;
    const GmPoint ep = nearerSolution(circle, hitsSecond, c2->SP());
    c2->SetSP(ep);
    return new GmArc(circle, sp, ep, dir);
}
