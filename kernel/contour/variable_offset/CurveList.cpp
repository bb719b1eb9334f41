#include "kernel/contour/variable_offset/CurveList.h"

#include "kernel/values/HandedOver.h"

namespace gmkernel_detail {

CurveList::~CurveList() {
    while (Count() > 0)
        RemoveAt(Count() - 1);
}

int CurveList::Count() const {
    return static_cast<int>(m_entries.GetCount());
}

GmCurve& CurveList::operator[](int index) const {
    // The base array stores pointers to const; what was added is not.
    void* const entry = const_cast<void*>(m_entries[static_cast<size_t>(index)]);
    return *static_cast<GmCurve*>(entry);
}

void CurveList::Add(std::unique_ptr<GmCurve> curve) {
    Insert(std::move(curve), Count());
}

void CurveList::Insert(std::unique_ptr<GmCurve> curve, int index) {
    m_entries.Insert(curve.get(), static_cast<size_t>(index));
    handedOver(curve);
}

void CurveList::RemoveAt(int index) {
    const std::unique_ptr<GmCurve> curve(&(*this)[index]);
    m_entries.RemoveAt(static_cast<size_t>(index));
}

}  // namespace gmkernel_detail
