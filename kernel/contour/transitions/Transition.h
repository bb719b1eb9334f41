// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "gmkernel/GmContour.h"

namespace gmkernel_detail {

/// Where a construction circle meets the two elements at a corner.
struct CornerContacts {
    GmPoint onFirst;
    GmPoint onSecond;

    /// Are both points defined and different?
    bool AreUsable() const;
};

/// What comes into a corner, and where the neighbours are cut back. Without an element there is no
/// transition.
struct Transition {
    std::unique_ptr<GmCurve> element;
    CornerContacts contacts;
};

/// Do the elements continue each other, so that the kind of transition has nothing to do?
bool isContinued(GmContour::eTransType type, GmCurve const& first, GmCurve const& second);

/// The transition at the corner where `first` ends and `second` starts. `value` is the radius, the
/// distance from the corner or the length of the chamfer, by type.
Transition transitionAt(GmContour::eTransType type, GmCurve const& first, GmCurve const& second,
                        double value);

/// The point in which a construction circle meets an arc: of two points the one reached first when
/// turning in the arc's sense from the direction towards the circle's centre. Undefined where they
/// do not meet.
GmPoint contactWithArc(GmCircle const& circle, GmArc const& arc);

}  // namespace gmkernel_detail
