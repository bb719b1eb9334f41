#include "kernel/contour/GmContourArray.h"

#include "kernel/values/HandedOver.h"

void GmContourArray::Add(GmContour* contour) {
    m_entries.Add(contour);
}

void GmContourArray::Take(std::unique_ptr<GmContour> contour) {
    Add(contour.get());
    gmkernel_detail::handedOver(contour);
}

int GmContourArray::GetCount() const {
    return static_cast<int>(m_entries.GetCount());
}

GmContour* GmContourArray::operator[](int index) const {
    // The base array stores pointers to const; what Add() was given is not.
    void* const entry = const_cast<void*>(m_entries[static_cast<size_t>(index)]);
    return static_cast<GmContour*>(entry);
}

void GmContourArray::Clear() {
    m_entries.Clear();
}
