// SPDX-License-Identifier: MIT
#include "region/link/SetWriter.h"

#include <algorithm>
#include <numeric>

#include "region/link/PieceJoin.h"
#include "region/plane/ElementHalves.h"
#include "region/plane/Measures.h"

namespace gmregion {

namespace {

bool sameOrigin(const Origin& a, const Origin& b) {
    return a.path == b.path && a.element == b.element && a.kind == b.kind;
}

}  // namespace

void SetWriter::clear(RegionSet& set, double tolerance) {
    set.m_tolerance = tolerance;
    set.m_loops.clear();
    set.m_elements.clear();
    set.m_originEnds.clear();
    set.m_origins.clear();
}

bool SetWriter::write(const Arrangement& arrangement, const Fans& fans, const Loops& loops,
                      const OriginSource& source, RegionSet& set) {
    m_arrangement = &arrangement;
    m_fans = &fans;
    m_source = &source;
    m_elements.clear();
    m_ends.clear();
    m_areas.clear();
    m_origins.clear();
    m_originEnds.clear();
    clear(set, arrangement.tolerance());
    m_items.reserve(arrangement.pieces().size());
    m_elements.reserve(arrangement.pieces().size());
    for (std::size_t loop = 0; loop < loops.size(); ++loop) {
        emitLoop(loops, loop);
    }
    if (m_ends.empty()) return true;
    if (m_ends.size() == 1 && m_areas[0] > 0.0) {
        handOver(set);
        return true;
    }
    if (!nest()) return false;
    arrange(set);
    return true;
}

double SetWriter::area() const {
    return std::accumulate(m_areas.begin(), m_areas.end(), 0.0);
}

/// Lists the pieces of a loop in their order.
void SetWriter::gather(const Loops& loops, std::size_t loop) {
    m_items.clear();
    for (const Half* half = loops.begin(loop); half != loops.end(loop); ++half) {
        const Run& run = m_arrangement->runs()[runOf(*half)];
        const bool backward = leavesEnd(*half);
        for (Index i = 0; i < run.last - run.first; ++i) {
            const StrandElement& e =
                m_arrangement->pieces()[backward ? run.last - 1 - i : run.first + i];
            const Element turned = backward ? Element{e.ep, e.sp, -e.bulge} : Element(e);
            m_items.push_back({turned, e.tag, *half});
        }
    }
}

double SetWriter::gatheredArea() const {
    const Vec2 origin = m_items.front().element.sp;
    double area = 0.0;
    for (const Item& item : m_items)
        area += 0.5 * sweptTwice(item.element, origin);
    return area;
}

/// Whether two pieces that follow each other are parts of one element, with nothing between them.
bool SetWriter::joins(const Item& a, const Item& b) const {
    if (a.tag != b.tag || leavesEnd(a.half) != leavesEnd(b.half) || !sameOrigins(a, b))
        return false;
    return makeOne(a.element, b.element, m_arrangement->tolerance());
}

bool SetWriter::sameOrigins(const Item& a, const Item& b) const {
    Index other = m_fans->nextSame(runOf(b.half));
    for (Index run = m_fans->nextSame(runOf(a.half)); run != kNone; run = m_fans->nextSame(run)) {
        if (other == kNone) return false;
        const auto& pieces = m_arrangement->pieces();
        const auto& runs = m_arrangement->runs();
        if (pieces[runs[run].first].tag != pieces[runs[other].first].tag) return false;
        other = m_fans->nextSame(other);
    }
    return other == kNone;
}

/// Joins pieces that are parts of one element. False when only one would be left, which cannot
/// close a loop; the items are spoilt then.
bool SetWriter::join() {
    const std::size_t count = m_items.size();
    if (count == 0) return true;
    std::size_t start = 0;
    while (start < count && joins(m_items[(start + count - 1) % count], m_items[start]))
        ++start;
    std::rotate(m_items.begin(), m_items.begin() + static_cast<std::ptrdiff_t>(start % count),
                m_items.end());
    std::size_t last = 0;
    for (std::size_t i = 1; i < count; ++i) {
        Element& e = m_items[last].element;
        const Item& next = m_items[i];
        if (joins(m_items[last], next))
            e = {e.sp, next.element.ep, joinedBulge(e.bulge, next.element.bulge)};
        else
            m_items[++last] = next;
    }
    m_items.resize(last + 1);
    return last > 0;
}

/// Whether an element goes back the way that another has come.
bool SetWriter::returns(const Element& there, const Element& back) const {
    if (there.sp != back.ep || there.ep != back.sp) return false;
    const Vec2 chord = there.ep - there.sp;
    const double heights = 0.5 * (there.bulge + back.bulge);
    return heights * heights * dot(chord, chord) <
           m_arrangement->tolerance() * m_arrangement->tolerance();
}

/// Leaves out elements that go there and back: runs of several pieces may have become the same by
/// being joined.
void SetWriter::dropSpikes() {
    std::size_t kept = 0;
    for (const Item& item : m_items) {
        if (kept > 0 && returns(m_items[kept - 1].element, item.element))
            --kept;
        else
            m_items[kept++] = item;
    }
    std::size_t first = 0;
    while (kept > first + 1 && returns(m_items[kept - 1].element, m_items[first].element)) {
        --kept;
        ++first;
    }
    m_items.resize(kept);
    m_items.erase(m_items.begin(), m_items.begin() + static_cast<std::ptrdiff_t>(first));
}

/// Appends what a loop consists of; no loop where nothing is left of it.
void SetWriter::emitLoop(const Loops& loops, std::size_t loop) {
    gather(loops, loop);
    const double area = gatheredArea();
    if (!join()) gather(loops, loop);
    dropSpikes();
    if (m_items.empty()) return;
    for (const Item& item : m_items) {
        m_elements.push_back(item.element);
        appendOrigins(item);
    }
    m_areas.push_back(area);
    m_ends.push_back(static_cast<Index>(m_elements.size()));
}

/// All origins of a piece, each once.
void SetWriter::appendOrigins(const Item& item) {
    const std::size_t first = m_origins.size();
    m_source->append(item.tag, m_origins);
    for (Index run = m_fans->nextSame(runOf(item.half)); run != kNone; run = m_fans->nextSame(run))
        m_source->append(m_arrangement->pieces()[m_arrangement->runs()[run].first].tag, m_origins);
    std::size_t end = first + 1;
    for (std::size_t i = first + 1; i < m_origins.size(); ++i) {
        const auto isSame = [&](const Origin& other) { return sameOrigin(m_origins[i], other); };
        const auto begin = m_origins.begin();
        const bool isKnown = std::any_of(begin + static_cast<std::ptrdiff_t>(first),
                                         begin + static_cast<std::ptrdiff_t>(end), isSame);
        if (!isKnown) m_origins[end++] = m_origins[i];
    }
    m_origins.resize(end);
    m_originEnds.push_back(static_cast<Index>(end));
}

/// Finds which loop lies in which, on elements of half a turn at the most.
bool SetWriter::nest() {
    m_halves.clear();
    m_halfEnds.clear();
    std::size_t i = 0;
    for (const Index end : m_ends) {
        for (; i < end; ++i)
            visitHalves(m_elements[i], [&](const Element& half) { m_halves.push_back(half); });
        m_halfEnds.push_back(static_cast<Index>(m_halves.size()));
    }
    return m_nesting.find(m_halves, m_halfEnds, m_areas, m_arrangement->tolerance());
}

/// Hands one outline over as it is.
void SetWriter::handOver(RegionSet& set) {
    std::swap(set.m_elements, m_elements);
    std::swap(set.m_originEnds, m_originEnds);
    std::swap(set.m_origins, m_origins);
    set.m_loops.push_back({0, m_ends[0], 0, false});
}

/// Puts outlines in their order, each with its holes behind it.
void SetWriter::arrange(RegionSet& set) {
    m_order.resize(m_ends.size());
    std::iota(m_order.begin(), m_order.end(), Index{0});
    std::sort(m_order.begin(), m_order.end(), [&](Index a, Index b) {
        const Index outlineOfA = m_nesting.outlineOf(a);
        const Index outlineOfB = m_nesting.outlineOf(b);
        if (outlineOfA != outlineOfB) return outlineOfA < outlineOfB;
        if ((a == outlineOfA) != (b == outlineOfB)) return a == outlineOfA;
        return a < b;
    });
    set.m_elements.reserve(m_elements.size());
    set.m_originEnds.reserve(m_elements.size());
    set.m_origins.reserve(m_origins.size());
    Index region = kNone;
    for (const Index loop : m_order) {
        const Index first = loop == 0 ? 0 : m_ends[loop - 1];
        const bool hole = m_nesting.outlineOf(loop) != loop;
        if (!hole) ++region;
        const Index begin = static_cast<Index>(set.m_elements.size());
        for (Index i = first; i < m_ends[loop]; ++i) {
            set.m_elements.push_back(m_elements[i]);
            const Index firstOrigin = i == 0 ? 0 : m_originEnds[i - 1];
            for (Index k = firstOrigin; k < m_originEnds[i]; ++k)
                set.m_origins.push_back(m_origins[k]);
            set.m_originEnds.push_back(static_cast<Index>(set.m_origins.size()));
        }
        set.m_loops.push_back({begin, static_cast<Index>(set.m_elements.size()), region, hole});
    }
}

}  // namespace gmregion
