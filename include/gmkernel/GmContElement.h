// SPDX-License-Identifier: MIT
/// @file
/// The record of one contour element.
#ifndef GMKERNEL_GMCONTELEMENT_H
#define GMKERNEL_GMCONTELEMENT_H

class GmCurve;

/// Record of one contour element. Plain data on the heap: a contour that holds the record deletes
/// it together with its curve; a record outside a contour belongs to whoever created it, and so
/// does its curve.
struct GmContElement {
    /// The element's curve, a segment or an arc; owned with the record.
    GmCurve* pCurve = nullptr;

    /// Identifier given by the caller with the element, 0 where none is given. It travels with
    /// the element: pieces of it, copies in a sub-contour and its offsets carry the same value.
    long lId = 0;

    /// Index of the element the record stands for: its own position when it was appended or
    /// inserted, that of the element it was split from or is the offset of. It is not renumbered
    /// when elements are inserted or removed before it.
    long lIndex = 0;

    /// True for an element that the contour made itself, false for one that the caller added.
    bool bInserted = false;
};

#endif  // GMKERNEL_GMCONTELEMENT_H
