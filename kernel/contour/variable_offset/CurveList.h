// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "gmkernel/GmCurve.h"
#include "kernel/values/PointerList.h"

namespace gmkernel_detail {

/// A list of curves that owns them.
class CurveList {
public:
    CurveList() = default;
    ~CurveList();
    CurveList(CurveList const&) = delete;
    CurveList& operator=(CurveList const&) = delete;

    int Count() const;
    /// Curve at an index in 0..Count()-1; the index is not tested.
    GmCurve& operator[](int index) const;
    void Add(std::unique_ptr<GmCurve> curve);
    /// Inserts before the curve at the index.
    void Insert(std::unique_ptr<GmCurve> curve, int index);
    /// Deletes the curve at the index.
    void RemoveAt(int index);

private:
    PointerList<GmCurve> m_entries;
};

}  // namespace gmkernel_detail
