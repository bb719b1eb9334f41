// SPDX-License-Identifier: MIT
/// @file
/// Offsets as unions of strips.
///
/// Every point nearer to the source than the distance, on the side looked at, has its nearest point
/// either within an element, and lies in the strip between the element and its parallel, or in a
/// corner that opens to that side, and lies in the sector about it. The strip of an arc that bends
/// to that side with a radius below the distance ends in its centre. So the union of all strips and
/// sectors is what the source sweeps, and other shapes in place of the sectors make other joins.
#include "region/offset/Strips.h"

#include <algorithm>
#include <cmath>

#include "region/offset/Corners.h"
#include "region/overlay/Intake.h"

namespace gmregion {

void Strips::make(const OffsetSource& source, double distance, const OffsetOptions& options,
                  Weight weight, Strands& strands) {
    m_distance = distance;
    m_options = options;
    m_weight = weight;
    m_strands = &strands;
    m_source = source.elements().data();
    m_madeOf.clear();
    strands.clear();
    Index first = 0;
    for (std::size_t loop = 0; loop < source.loopEnds().size(); ++loop) {
        const Index last = source.loopEnds()[loop];
        const Index count = last - first;
        const Index half = std::max<Index>(1, count / 2);
        for (Index i = 0; i < count; ++i) {
            const SourceElement& e = source.elements()[first + i];
            const SourceElement& next = source.elements()[i + 1 < count ? first + i + 1 : first];
            const bool turnsBack = source.isThereAndBack(loop) && (i + 1) % half == 0;
            addStrip(e);
            addCorner(e, next, turnsBack);
        }
        first = last;
    }
}

void Strips::addSource(const OffsetSource& source, Weight weight, Strands& strands) {
    m_strands = &strands;
    m_weight = weight;
    Index i = 0;
    for (const Index last : source.loopEnds()) {
        for (; i < last; ++i) {
            const SourceElement& e = source.elements()[i];
            begin(e);
            edge(e.sp, e.ep, e.bulge, OriginKind::kElement);
        }
        endLoop();
    }
}

void Strips::addStrip(const SourceElement& e) {
    begin(e);
    const Vec2 sp = e.sp - m_distance * e.startNormal;
    const Vec2 ep = e.ep - m_distance * e.endNormal;
    const bool reachesCentre = !(1.0 + e.curvature * m_distance > 0.0);
    const Vec2 centre = reachesCentre ? e.sp + (1.0 / e.curvature) * e.startNormal : Vec2{};
    const Vec2 from = reachesCentre ? centre : sp;
    const Vec2 to = reachesCentre ? centre : ep;
    if (m_distance > 0.0) {
        edge(from, to, e.bulge, OriginKind::kParallel);
        edge(to, e.ep, 0.0, OriginKind::kCorner);
        edge(e.ep, e.sp, -e.bulge, OriginKind::kElement);
        edge(e.sp, from, 0.0, OriginKind::kCorner);
    } else {
        edge(e.sp, e.ep, e.bulge, OriginKind::kElement);
        edge(e.ep, to, 0.0, OriginKind::kCorner);
        edge(to, from, -e.bulge, OriginKind::kParallel);
        edge(from, e.sp, 0.0, OriginKind::kCorner);
    }
    endLoop();
}

void Strips::addCorner(const SourceElement& before, const SourceElement& after, bool isEnd) {
    if (isEnd && m_options.end == End::kButt) return;
    if (!isEnd && !opensTo(before, after, m_distance)) return;
    begin(before);
    const Vec2 v = before.ep;
    const Vec2 a = v - m_distance * before.endNormal;
    const Vec2 b = v - m_distance * after.startNormal;
    // Counter-clockwise from the one end to the other: on the right of the elements forward.
    const Vec2 from = m_distance > 0.0 ? a : b;
    const Vec2 to = m_distance > 0.0 ? b : a;
    edge(v, from, 0.0, OriginKind::kCorner);
    if (isEnd && m_options.end == End::kSquare) {
        const Vec2 on = m_distance * Vec2{before.endNormal.y, -before.endNormal.x};
        edge(from, from + on, 0.0, OriginKind::kCorner);
        edge(from + on, to + on, 0.0, OriginKind::kCorner);
        edge(to + on, to, 0.0, OriginKind::kCorner);
    } else if (isEnd || m_options.join == Join::kRound) {
        edge(from, to, bulgeOfTurn(from - v, to - v, true), OriginKind::kCorner);
    } else {
        const double spread = 1.0 + dot(before.endNormal, after.startNormal);
        const double limit = m_options.miterLimit;
        const bool isMiter = m_options.join == Join::kMiter && spread * limit * limit >= 2.0;
        if (isMiter) {
            const Vec2 tip = v - (m_distance / spread) * (before.endNormal + after.startNormal);
            edge(from, tip, 0.0, OriginKind::kCorner);
            edge(tip, to, 0.0, OriginKind::kCorner);
        } else {
            edge(from, to, 0.0, OriginKind::kCorner);
        }
    }
    edge(to, v, 0.0, OriginKind::kCorner);
    endLoop();
}

void Strips::edge(Vec2 from, Vec2 to, double bulge, OriginKind kind) {
    const std::size_t before = m_strands->elements.size();
    const Index tag = static_cast<Index>(m_madeOf.owners.size());
    appendElement(m_strands->elements, {from, to, bulge}, tag);
    if (m_strands->elements.size() == before) return;
    m_madeOf.add(static_cast<Index>(m_of - m_source), m_of->owner, kind);
}

void Strips::endLoop() {
    m_strands->endStrand(true, m_weight);
}

}  // namespace gmregion
