// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "gmkernel/GmCurve.h"
#include "kernel/contour/offset/QuickDistance.h"
#include "kernel/curves/BoxLevels.h"

namespace gmkernel_detail {

/// The most recent elements of the source, which must outlive it, each with the box of the points
/// that may be nearer to it than the offset distance. Elements are numbered in the order in which
/// they came.
class SourceSpan {
public:
    /// @param d the offset distance, of either sign
    explicit SourceSpan(double d) : m_d(d) {}

    bool isEmpty() const { return m_oldest == m_elements.size(); }
    /// The number of the first element; those before have left.
    std::size_t oldest() const { return m_oldest; }
    /// The number behind that of the last element.
    std::size_t end() const { return m_elements.size(); }
    GmCurve const& element(std::size_t number) const { return *m_elements[number]; }
    QuickDistance const& quick(std::size_t number) const { return m_quick[number]; }
    BoxLevels const& nearby() const { return m_nearby; }

    /// Takes an element that starts where the last one ends, or into an empty span any; else
    /// answers false.
    bool append(GmCurve const& element);
    /// Lets the oldest element leave; there must be one.
    void dropOldest() { ++m_oldest; }

private:
    double m_d;
    std::vector<GmCurve const*> m_elements;
    std::vector<QuickDistance> m_quick;
    BoxLevels m_nearby;
    std::size_t m_oldest = 0;
};

}  // namespace gmkernel_detail
