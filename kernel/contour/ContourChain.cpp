// SPDX-License-Identifier: MIT
#include <utility>

#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/ContourElements.h"

using gmkernel_detail::chainEnd;
using gmkernel_detail::chainStart;

// Only the pointers move: every record keeps its fields.
void GmContour::Invert() {
    for (int i = 0; i < m_pElements->GetSize(); ++i) {
        GetElement(i)->Invert();
    }
    for (int i = 0, j = m_pElements->GetSize() - 1; i < j; ++i, --j) {
        std::swap((*m_pElements)[i], (*m_pElements)[j]);
    }
}

GmContour GmContour::Inverted() const {
    GmContour inverted(*this);
    inverted.Invert();
    return inverted;
}

void GmContour::Close(bool bValidate) {
    if (ElementCount() == 0) return;
    const GmPoint start = chainStart(*this);
    const GmPoint end = chainEnd(*this);
    if (end == start) return;
    const GmStretch closing(end, start);
    AddElement(&closing, bValidate, 0);
}

bool GmContour::CheckContour() {
    if (ElementCount() == 0) return true;
    GmPoint end = GetElement(0)->EP();
    for (int i = 1; i < ElementCount(); ++i) {
        if (!(GetElement(i)->SP() == end)) return false;
        end = GetElement(i)->EP();
    }
    return !m_bClosed || end == chainStart(*this);
}

void GmContour::Translation(GmVec const& v) {
    for (int i = 0; i < ElementCount(); ++i) {
        GetElement(i)->Translation(v);
    }
}

void GmContour::Transform(GmMatrix const& m) {
    for (int i = 0; i < ElementCount(); ++i) {
        GetElement(i)->Transform(m);
    }
}
