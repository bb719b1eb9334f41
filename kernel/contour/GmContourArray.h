#pragma once

#include <wx/dynarray.h>

#include <memory>

#include "gmkernel/GmContour.h"

/// The sub-contour list: pointers to contours in the order of their indices. The list forgets and
/// never deletes; the contour that holds it owns the entries.
class GmContourArray {
public:
    /// Appends one pointer.
    void Add(GmContour* contour);
    /// Appends a contour whose owner is from now on that of the list.
    void Take(std::unique_ptr<GmContour> contour);
    int GetCount() const;
    /// Entry at an index in 0..GetCount()-1; the index is not tested.
    GmContour* operator[](int index) const;
    /// Forgets all entries without deleting them.
    void Clear();

private:
    wxBaseArrayPtrVoid m_entries;
};
