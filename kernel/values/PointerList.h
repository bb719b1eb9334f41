// SPDX-License-Identifier: MIT
#pragma once

#include <wx/dynarray.h>

#include <cstddef>

namespace gmkernel_detail {

/// A growable list of pointers, which it never deletes: ownership is the business of its user.
/// Indices are not tested.
template <class T>
class PointerList {
public:
    void Add(T* entry) { m_entries.Add(entry); }
    /// Inserts before the entry at an index in 0..GetCount().
    void Insert(T* entry, int index) { m_entries.Insert(entry, position(index)); }
    /// Forgets the entry at an index in 0..GetCount()-1.
    void RemoveAt(int index) { m_entries.RemoveAt(position(index)); }
    int GetCount() const { return static_cast<int>(m_entries.GetCount()); }
    /// The entry at an index in 0..GetCount()-1.
    T* operator[](int index) const {
        // The array below stores pointers to const; what was added is not.
        return static_cast<T*>(const_cast<void*>(m_entries[position(index)]));
    }
    /// Forgets all entries.
    void Clear() { m_entries.Clear(); }

private:
    static std::size_t position(int index) { return static_cast<std::size_t>(index); }

    wxBaseArrayPtrVoid m_entries;
};

}  // namespace gmkernel_detail
