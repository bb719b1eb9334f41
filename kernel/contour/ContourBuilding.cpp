// SPDX-License-Identifier: MIT
/// @file
/// Appending, inserting and removing elements.
///
/// A chain stays one whose elements follow each other because an appended curve has to start where
/// the chain ends. Validation asks more: the curve may meet the chain only there and, when it
/// closes the contour, at its own end. So it is intersected with the whole chain and the points are
/// counted: two of them are one too many unless the second is the closing end. Curves that lie on
/// each other have no intersection, so a piece that runs back along the chain is not noticed.
/// Constant cost, with validation linear in the elements.
#include <memory>

#include "gmkernel/GmContour.h"
#include "kernel/contour/ContourElements.h"
#include "kernel/values/HandedOver.h"

using gmkernel_detail::chainEnd;
using gmkernel_detail::chainStart;

namespace {

/// A validated curve may touch the chain at the joint and at the closing end.
constexpr int kMaxTouches = 2;

/// The curve while its record does not own it yet; whoever takes the record over releases both.
struct ElementHolder {
    std::unique_ptr<GmCurve> curve;
    std::unique_ptr<GmContElement> record;

    ElementHolder(GmCurve const& c, long id, long index, bool inserted)
        : curve(c.Clone()), record(new GmContElement{curve.get(), id, index, inserted}) {}

    void release() {
        gmkernel_detail::handedOver(curve);
        gmkernel_detail::handedOver(record);
    }
};

/// Do the points in the contour's solution list lie at the ends of the curve? The end of the curve
/// counts only when it closes the contour.
bool meetsOnlyAtOwnEnds(GmContour const& contour, int count, GmCurve const& c, bool closes) {
    for (int i = 0; i < count; ++i) {
        const GmPoint hit = contour.GetSolution(static_cast<unsigned>(i));
        if (!(hit == c.SP()) && !(closes && hit == c.EP())) return false;
    }
    return true;
}

}  // namespace

bool GmContour::AppendElementValid(GmCurve const* c, bool bValidate) {
    if (!c) return false;
    if (bValidate && m_bClosed) return false;
    if (ElementCount() == 0) return true;
    const int hits = bValidate ? Intersection(c) : 0;
    if (hits > kMaxTouches) return false;
    if (!(c->SP() == chainEnd(*this))) return false;
    const bool closes = c->EP() == chainStart(*this);
    if (!closes && hits == kMaxTouches) return false;
    if (!meetsOnlyAtOwnEnds(*this, hits, *c, closes)) return false;
    if (closes) m_bClosed = true;
    return true;
}

bool GmContour::AddElement(GmCurve const* c, bool bValidate, long id) {
    if (!AppendElementValid(c, bValidate)) return false;
    ElementHolder holder(*c, id, ElementCount(), false);
    m_pElements->SetAtGrow(m_pElements->GetSize(), holder.record.get());
    holder.release();
    return true;
}

bool GmContour::AddElement(GmCurve const& c, bool bValidate, long id) {
    return AddElement(&c, bValidate, id);
}

bool GmContour::AddElement(GmContElement* element, bool bValidate) {
    if (!element || !AppendElementValid(element->pCurve, bValidate)) return false;
    m_pElements->SetAtGrow(m_pElements->GetSize(), element);
    return true;
}

GmContElement* GmContour::CreateContElement(GmCurve* c, long id, long index, bool bInserted) {
    return new GmContElement{c, id, index, bInserted};
}

bool GmContour::InsertElem(int index, GmCurve const* c, bool bValidate, long id) {
    if (!c || index < 0 || index > ElementCount()) return false;
    if (bValidate && !AppendElementValid(c, bValidate)) return false;
    ElementHolder holder(*c, id, index, true);
    m_pElements->InsertAt(index, holder.record.get());
    holder.release();
    m_bClosed = chainEnd(*this) == chainStart(*this);
    return true;
}

bool GmContour::AddRealElem(GmCurve* c) {
    return AddRealElem(c, 0);
}

bool GmContour::AddRealElem(GmCurve* c, long id) {
    if (!c || c->EP() == c->SP()) return false;
    return AddElement(c, false, id);
}

void GmContour::RemoveElement(int index) {
    GmContElement* const element = GetContElement(index);
    if (!element) return;
    delete element->pCurve;
    delete element;
    m_pElements->RemoveAt(index, 1);
}

void GmContour::RemoveInsertedElementsAtBack() {
    for (int last = m_pElements->GetSize() - 1; last > 0; --last) {
        if (!GetContElement(last)->bInserted) return;
        RemoveElement(last);
    }
}
