#include "kernel/contour/offset/OffsetElement.h"

#include <wx/string.h>

#include <utility>

GmOffsetElement::GmOffsetElement(std::unique_ptr<GmCurve> curve, int source, int id, bool kept,
                                 bool auxiliary)
    : m_curve(std::move(curve)), m_source(source), m_id(id), m_kept(kept), m_auxiliary(auxiliary) {}

GmOffsetElement::GmOffsetElement(GmOffsetElement const& other)
    : m_curve(other.m_curve->Clone()),
      m_source(other.m_source),
      m_id(other.m_id),
      m_kept(other.m_kept),
      m_auxiliary(other.m_auxiliary) {}

GmOffsetElement& GmOffsetElement::operator=(GmOffsetElement const& other) {
    if (this != &other) *this = GmOffsetElement(other);
    return *this;
}

void GmOffsetElement::Trace() const {
    const wxString text =
        wxString::Format("p-path %i %s", m_id, wxString(m_curve->GetTraceString()));
    static_cast<void>(text);
}
