// SPDX-License-Identifier: MIT
#include "kernel/contour/variable_offset/CurveList.h"

#include "kernel/values/HandedOver.h"

namespace gmkernel_detail {

CurveList::~CurveList() {
    while (Count() > 0)
        RemoveAt(Count() - 1);
}

int CurveList::Count() const {
    return m_entries.GetCount();
}

GmCurve& CurveList::operator[](int index) const {
    return *m_entries[index];
}

void CurveList::Add(std::unique_ptr<GmCurve> curve) {
    Insert(std::move(curve), Count());
}

void CurveList::Insert(std::unique_ptr<GmCurve> curve, int index) {
    m_entries.Insert(curve.get(), index);
    handedOver(curve);
}

void CurveList::RemoveAt(int index) {
    const std::unique_ptr<GmCurve> curve(m_entries[index]);
    m_entries.RemoveAt(index);
}

}  // namespace gmkernel_detail
