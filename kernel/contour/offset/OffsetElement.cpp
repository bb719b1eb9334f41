// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/OffsetElement.h"

#include <utility>

#include "kernel/values/TraceText.h"

using gmkernel_detail::isAuxiliary;
using gmkernel_detail::isKept;
using gmkernel_detail::PieceRole;

GmOffsetElement::GmOffsetElement(std::unique_ptr<GmCurve> curve, int source, int id, PieceRole role)
    : m_curve(std::move(curve)), m_source(source), m_id(id), m_role(role) {}

GmOffsetElement::GmOffsetElement(GmOffsetElement const& other)
    : m_curve(other.m_curve->Clone()),
      m_source(other.m_source),
      m_id(other.m_id),
      m_role(other.m_role) {}

GmOffsetElement& GmOffsetElement::operator=(GmOffsetElement const& other) {
    if (this != &other) *this = GmOffsetElement(other);
    return *this;
}

bool GmOffsetElement::kept() const {
    return isKept(m_role);
}

bool GmOffsetElement::auxiliary() const {
    return isAuxiliary(m_role);
}

void GmOffsetElement::Trace() const {
    static_cast<void>(gmkernel_detail::offsetPieceText(m_id, m_curve->GetTraceString()));
}
