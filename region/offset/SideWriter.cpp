// SPDX-License-Identifier: MIT
/// @file
/// One side of a thickened path.
///
/// The boundary of a thickened path consists of what lies on its right, in the direction of travel,
/// of what lies on its left, against it, and of the half circles about its ends. Each of its runs
/// knows the element that it is made of, there or on the way back; so one side is what is left when
/// the other one and the half circles are taken out.
#include "region/offset/SideWriter.h"

#include <algorithm>

namespace gmregion {

void SideWriter::write(const OverlayScratch& scratch, const OffsetSource& source,
                       const MadeOf& madeOf, bool onLeft, Parallels& parallels) {
    m_scratch = &scratch;
    m_source = &source;
    m_madeOf = &madeOf;
    m_turn = static_cast<Index>(source.elements().size() / 2);
    m_onLeft = onLeft;
    m_steps.clear();
    m_chains.clear();
    for (std::size_t loop = 0; loop < scratch.loops.size(); ++loop)
        gather(loop);
    std::sort(m_chains.begin(), m_chains.end(), [](const Chain& a, const Chain& b) {
        if (a.start != b.start) return a.start < b.start;
        return a.squared != b.squared ? a.squared < b.squared : a.first < b.first;
    });
    PieceWriter writer(parallels.elements, scratch.arrangement.tolerance());
    for (const Chain& chain : m_chains)
        writeChain(chain, writer, parallels);
}

/// Whether a piece lies on the side wanted, and not about an end.
bool SideWriter::isWanted(Index tag) const {
    const Index source = m_madeOf->sources[tag];
    const bool isLast = source + 1 == m_turn || source + 1 == 2 * m_turn;
    const bool isEnd =
        m_source->isThereAndBack(0) && isLast && m_madeOf->kinds[tag] == OriginKind::kCorner;
    return !isEnd && (source >= m_turn) == m_onLeft;
}

/// Lists the pieces of a loop in their order.
void SideWriter::listSteps(std::size_t loop) {
    m_loop.clear();
    const Arrangement& arrangement = m_scratch->arrangement;
    const Loops& loops = m_scratch->loops;
    for (const Half* half = loops.begin(loop); half != loops.end(loop); ++half) {
        const Run& run = arrangement.runs()[runOf(*half)];
        const bool back = leavesEnd(*half);
        for (Index i = 0; i < run.last - run.first; ++i) {
            const StrandElement& e = arrangement.pieces()[back ? run.last - 1 - i : run.first + i];
            m_loop.push_back({back ? Element{e.ep, e.sp, -e.bulge} : Element(e), e.tag});
        }
    }
}

/// Lists the chains of a loop's steps that are wanted.
void SideWriter::gather(std::size_t loop) {
    listSteps(loop);
    const auto unwanted = std::find_if(m_loop.begin(), m_loop.end(),
                                       [this](const Step& s) { return !isWanted(s.tag); });
    const bool isWhole = unwanted == m_loop.end();
    if (!isWhole) std::rotate(m_loop.begin(), unwanted, m_loop.end());
    bool goesOn = false;
    for (const Step& step : m_loop) {
        const bool wanted = isWanted(step.tag);
        if (wanted && !goesOn)
            m_chains.push_back({m_steps.size(), m_steps.size(), isWhole, 0, 0.0});
        if (wanted) addStep(step);
        goesOn = wanted;
    }
}

void SideWriter::addStep(const Step& step) {
    m_steps.push_back(step);
    Chain& chain = m_chains.back();
    chain.last = m_steps.size();
    // On the way back the last step of the chain is where it begins along the path.
    if (!m_onLeft && chain.last != chain.first + 1) return;
    const Index number = m_madeOf->sources[step.tag];
    const SourceElement& beside = m_source->elements()[number];
    const Vec2 away = m_onLeft ? step.element.ep - beside.ep : step.element.sp - beside.sp;
    chain.start = m_onLeft ? 2 * m_turn - 1 - number : number;
    chain.squared = dot(away, away);
}

void SideWriter::writeChain(const Chain& chain, PieceWriter& writer, Parallels& parallels) const {
    const auto begin = static_cast<std::uint32_t>(parallels.elements.size());
    writer.begin();
    for (std::size_t i = chain.first; i < chain.last; ++i) {
        const Step& step = m_steps[m_onLeft ? chain.first + chain.last - 1 - i : i];
        const Element& e = step.element;
        if (!writer.append(m_onLeft ? Element{e.ep, e.sp, -e.bulge} : e, step.tag)) continue;
        Origin origin = m_scratch->origins[m_madeOf->owners[step.tag]];
        origin.kind = m_madeOf->kinds[step.tag];
        parallels.origins.push_back(origin);
    }
    const auto end = static_cast<std::uint32_t>(parallels.elements.size());
    parallels.parts.push_back({begin, end, chain.closed});
}

}  // namespace gmregion
