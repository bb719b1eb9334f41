// SPDX-License-Identifier: MIT
#include "gmkernel/GmContour.h"

#include <memory>
#include <utility>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/GmContourArray.h"
#include "kernel/curves/VerifiedCast.h"

namespace {

/// What does not join is left out, as the result of AddElement() says.
void appendClones(GmContour& target, GmContour const& source) {
    for (int i = 0; i < source.ElementCount(); ++i) {
        target.AddElement(source.GetElement(i), false, 0);
    }
}

}  // namespace

GmContour::GmContour() : m_pElements(nullptr), m_bClosed(false), m_pSubConts(nullptr) {
    auto elements = std::make_unique<KxArray<GmContElement*, GmContElement*>>();
    m_pSubConts = new GmContourArray;
    m_pElements = elements.release();
    m_eType = eGmContour;
    m_bCreationOK = true;
}

// Delegates, so that the destructor cleans up when cloning an element throws.
GmContour::GmContour(GmContour const& source) : GmContour() {
    GmCurve::operator=(source);
    appendClones(*this, source);
}

GmContour::~GmContour() {
    InitAll();
    delete m_pSubConts;
    delete m_pElements;
}

// Copies before it releases: the source may be a sub-contour that dies with the release, and a
// failed copy leaves the target as it was.
GmContour& GmContour::operator=(GmContour const& source) {
    if (this == &source) return *this;
    GmContour copy(source);
    const bool sourceClosed = source.m_bClosed;
    const GmPoint sourceInsertPoint = source.m_LastInsertPoint;
    const eGmTypes ownType = m_eType;
    GmCurve::operator=(source);
    m_eType = ownType;
    InitAll();
    std::swap(m_pElements, copy.m_pElements);
    m_bClosed = sourceClosed;
    m_LastInsertPoint = sourceInsertPoint;
    return *this;
}

GmContour* GmContour::Clone() const {
    return new GmContour(*this);
}

void GmContour::InitAll() {
    RemoveAllElements();
    RemoveAllSubConts();
    m_LastInsertPoint = GmPoint();
    m_bClosed = false;
}

void GmContour::RemoveAllElements() {
    for (int i = 0; i < m_pElements->GetSize(); ++i) {
        delete m_pElements->GetAt(i)->pCurve;
        delete m_pElements->GetAt(i);
    }
    m_pElements->SetSize(0);
}

long GmContour::ElementCount() const {
    return m_pElements->GetSize();
}

GmContElement const* GmContour::GetContElement(int index) const {
    return index >= 0 && index < m_pElements->GetSize() ? m_pElements->GetAt(index) : nullptr;
}

GmContElement* GmContour::GetContElement(int index) {
    return const_cast<GmContElement*>(std::as_const(*this).GetContElement(index));
}

GmCurve const* GmContour::GetElement(int index) const {
    GmContElement const* const element = GetContElement(index);
    return element ? element->pCurve : nullptr;
}

GmCurve* GmContour::GetElement(int index) {
    return const_cast<GmCurve*>(std::as_const(*this).GetElement(index));
}

GmCurve* GmContour::GetNewElement(int index) const {
    GmCurve const* const element = GetElement(index);
    if (!element) return nullptr;
    if (auto const* stretch = gmkernel_detail::curveAs<GmStretch>(*element))
        return new GmStretch(*stretch);
    auto const* const arc = gmkernel_detail::curveAs<GmArc>(*element);
    return arc ? new GmArc(*arc) : nullptr;
}

bool GmContour::IsClosed() const {
    return m_bClosed;
}

bool GmContour::Convex() const {
    return false;
}

bool GmContour::Concave() const {
    return false;
}

GmPoint GmContour::GetLastInsertPoint() {
    return m_LastInsertPoint;
}

std::string GmContour::GetTraceString() const {
    return std::string();
}

void GmTraceContourElements(GmContour const*, std::string const&, std::string const&) {}
