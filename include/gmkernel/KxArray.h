// SPDX-License-Identifier: MIT
/// @file
/// The growable array of the contour's records.
#ifndef GMKERNEL_KXARRAY_H
#define GMKERNEL_KXARRAY_H

#include <algorithm>
#include <limits>

/// Growable array of plain pointers or other small values.
///
/// The array owns its block of entries, never what pointer entries point to: deleting those is
/// the business of the array's owner. Sizes and indices are counted from 0. A negative size,
/// index or count is ignored: the call then changes nothing. Appending costs amortised constant
/// time for short arrays; from 8192 entries on the automatic step stays at 1024.
///
/// TYPE is what is stored, ARG_TYPE how a value is passed in.
template <class TYPE, class ARG_TYPE>
class KxArray {
public:
    /// Empty array without a block and with the automatic step.
    KxArray() = default;

    /// Frees the block; what pointer entries point to lives on.
    ~KxArray() { delete[] m_pData; }

    KxArray(KxArray const&) = delete;
    KxArray& operator=(KxArray const&) = delete;

    /// Number of entries in use.
    int GetSize() const { return m_nSize; }

    /// Entry at an index in 0..GetSize()-1; the index is not tested.
    TYPE GetAt(int index) const { return m_pData[index]; }

    /// Entry at an index in 0..GetSize()-1, for reading and writing; the index is not tested. The
    /// reference is valid until the array grows or is emptied.
    TYPE& operator[](int index) { return m_pData[index]; }
    TYPE const& operator[](int index) const { return m_pData[index]; }

    /// Changes the number of entries; new entries are null.
    ///
    /// Size 0 frees the block. The first block has exactly the new size. Later a size beyond the
    /// capacity enlarges the block by the step, or to the new size when that is more. The step is
    /// the one given last, or, while that is 0, an eighth of the size, at least 4 and at most
    /// 1024. A grow-by of -1 keeps the step given last. A smaller size keeps the block.
    void SetSize(int newSize, int growBy = -1);

    /// Stores the value at the index; an index behind the last entry grows the array up to it,
    /// so that storing at GetSize() appends.
    void SetAtGrow(int index, ARG_TYPE value);

    /// Puts the value into `count` new entries from the index on; the entries from the index on
    /// move up. Behind the last entry the array first grows up to the index with null entries.
    /// Cost: linear in the entries that move.
    void InsertAt(int index, ARG_TYPE value, int count = 1);

    /// Removes `count` entries from the index on; the entries behind move down and the block
    /// keeps its capacity. A range that is not inside the array removes nothing.
    void RemoveAt(int index, int count);

protected:
    TYPE* m_pData = nullptr;  ///< block of m_nMaxSize entries, null while that is 0
    int m_nSize = 0;          ///< entries in use
    int m_nMaxSize = 0;       ///< entries allocated: the capacity
    int m_nGrowBy = 0;        ///< step of the capacity, 0 for the automatic one

private:
    // Wider than int: a capacity near the largest int plus a step must not overflow.
    int CapacityFor(int newSize) const {
        const long long step = m_nGrowBy != 0 ? m_nGrowBy : std::clamp(m_nSize / 8, 4, 1024);
        const long long grown = m_nMaxSize + step;
        return newSize < grown ? ClampToInt(grown) : newSize;
    }

    static int ClampToInt(long long n) {
        return static_cast<int>(std::min<long long>(n, std::numeric_limits<int>::max()));
    }

    void MoveToBlock(int capacity) {
        TYPE* const block = new TYPE[static_cast<unsigned>(capacity)]();
        std::copy(m_pData, m_pData + m_nSize, block);
        delete[] m_pData;
        m_pData = block;
        m_nMaxSize = capacity;
    }
};

template <class TYPE, class ARG_TYPE>
void KxArray<TYPE, ARG_TYPE>::SetSize(int newSize, int growBy) {
    if (newSize < 0) return;
    if (growBy != -1) m_nGrowBy = growBy;
    if (newSize == 0) {
        delete[] m_pData;
        m_pData = nullptr;
        m_nMaxSize = 0;
    } else if (m_pData == nullptr) {
        MoveToBlock(newSize);
    } else if (newSize > m_nMaxSize) {
        MoveToBlock(CapacityFor(newSize));
    } else if (newSize > m_nSize) {
        std::fill(m_pData + m_nSize, m_pData + newSize, TYPE());
    }
    m_nSize = newSize;
}

template <class TYPE, class ARG_TYPE>
void KxArray<TYPE, ARG_TYPE>::SetAtGrow(int index, ARG_TYPE value) {
    if (index < 0 || index == std::numeric_limits<int>::max()) return;
    const TYPE stored = value;  // the value may be an entry of the block that growing frees
    if (index >= m_nSize) SetSize(index + 1);
    m_pData[index] = stored;
}

template <class TYPE, class ARG_TYPE>
void KxArray<TYPE, ARG_TYPE>::InsertAt(int index, ARG_TYPE value, int count) {
    if (index < 0 || count <= 0) return;
    const int oldSize = m_nSize;
    if (std::max(index, oldSize) > std::numeric_limits<int>::max() - count) return;
    const TYPE stored = value;  // the value may be an entry of the block that growing frees
    SetSize(std::max(index, oldSize) + count);
    if (index < oldSize) {
        std::copy_backward(m_pData + index, m_pData + oldSize, m_pData + oldSize + count);
    }
    std::fill(m_pData + index, m_pData + index + count, stored);
}

template <class TYPE, class ARG_TYPE>
void KxArray<TYPE, ARG_TYPE>::RemoveAt(int index, int count) {
    if (index < 0 || count <= 0 || index > m_nSize - count) return;
    std::copy(m_pData + index + count, m_pData + m_nSize, m_pData + index);
    m_nSize -= count;
}

#endif  // GMKERNEL_KXARRAY_H
