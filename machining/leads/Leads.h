// SPDX-License-Identifier: MIT
#pragma once

#include "machining/obstacles/Obstacles.h"
#include "machining/runs/ToolRuns.h"

namespace gmmachining {

enum class LeadKind {
    kNone,
    kLine,           ///< straight, along the tangent of the cut
    kPerpendicular,  ///< straight, square to the cut
    kArc             ///< an arc tangential to the cut
};

/// The lead that is asked for; it lies on the waste side of the cut.
struct LeadShape {
    LeadKind kind = LeadKind::kNone;
    double length = 0.0;  ///< of straight leads
    double radius = 0.0;  ///< of arcs
    double angle = 90.0;  ///< sweep of arcs in degrees, up to 270
};

enum class LeadEnd { kApproach, kDeparture };

/// A lead that keeps clear of the part.
struct Lead {
    gmpart::Path path;  ///< ends, or starts, exactly at the end of the cut; empty without a lead
    double size = 0.0;  ///< length or radius that is left
    bool shortened = false;
    bool tooSmall = false;  ///< there is none because one of the size asked for cannot be built
};

/// The lead to the start of a cut or off its end. When it comes nearer to an obstacle than the
/// clearance it is halved in size, up to six times; then it is left out.
Lead clearLead(const gmpart::Path& cut, LeadEnd end, const LeadShape& shape, PartSide part,
               const Obstacles& obstacles, double clearance);

}  // namespace gmmachining
