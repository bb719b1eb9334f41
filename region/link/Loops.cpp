// SPDX-License-Identifier: MIT
/// @file
/// From chosen runs to simple loops.
///
/// The way goes from run to run, turning at each node to the next one clockwise: between them lies
/// what is covered. Wherever it comes to a node for the second time, the part since then is cut off
/// as a loop of its own. So what touches itself in a point becomes two outlines, or an outline and
/// a hole.
#include "region/link/Loops.h"

#include <algorithm>

namespace gmregion {

void Loops::begin(const Arrangement& arrangement, Fans& fans) {
    m_arrangement = &arrangement;
    m_fans = &fans;
    m_choice.assign(arrangement.runs().size(), kOut);
}

bool Loops::link() {
    m_steps.clear();
    m_ends.clear();
    m_way.clear();
    m_isUsed.assign(m_choice.size(), 0);
    m_isSorted.assign(m_arrangement->nodes().size(), 0);
    m_placeOnWay.assign(m_arrangement->nodes().size(), kNone);
    if (!checkNodes()) return false;
    for (Index run = 0; run < m_choice.size(); ++run) {
        if (m_choice[run] == kOut || m_isUsed[run] != 0) continue;
        if (m_arrangement->runs()[run].from == kNone) {
            m_steps.push_back(leavingRun(run));
            m_ends.push_back(static_cast<Index>(m_steps.size()));
        } else if (!trace(leavingRun(run))) {
            return false;
        }
    }
    return true;
}

/// As many have to arrive at a node as leave it.
bool Loops::checkNodes() {
    m_passes.assign(m_arrangement->nodes().size(), 0);
    for (Index node = 0; node < m_passes.size(); ++node) {
        int leave = 0;
        int arrive = 0;
        for (const Half half : m_fans->at(node)) {
            if (isLeaving(half)) ++leave;
            if (isArriving(half)) ++arrive;
        }
        m_passes[node] = static_cast<std::uint8_t>(std::min(leave, 2));
        if (leave == arrive) continue;
        m_conflict = m_arrangement->nodes()[node];
        return false;
    }
    return true;
}

/// The step after one: with what it goes on at the node where it arrives.
Half Loops::nextAfter(Half step) {
    const Half arriving = step ^ 1u;
    const Index node = m_fans->fromNode(arriving);
    if (m_passes[node] > 1 && m_isSorted[node] == 0) {
        m_fans->sort(node);
        m_isSorted[node] = 1;
    }
    const Fan fan = m_fans->at(node);
    std::size_t at = 0;
    while (fan.first[at] != arriving)
        ++at;
    for (std::size_t i = 1; i <= fan.size(); ++i) {
        const Half half = fan.first[(at + fan.size() - i) % fan.size()];
        if (isLeaving(half)) return half;
    }
    return kNone;
}

bool Loops::trace(Half start) {
    Half step = start;
    do {
        const Index node = m_fans->fromNode(step);
        if (m_placeOnWay[node] != kNone) cutOff(m_placeOnWay[node]);
        m_placeOnWay[node] = static_cast<Index>(m_way.size());
        m_way.push_back(step);
        m_isUsed[runOf(step)] = 1;
        step = nextAfter(step);
        const bool goesWrong = step == kNone || (step != start && m_isUsed[runOf(step)] != 0);
        if (!goesWrong) continue;
        m_conflict = m_arrangement->nodes()[node];
        return false;
    } while (step != start);
    cutOff(0);
    return true;
}

/// Makes the way from a place on a loop of its own.
void Loops::cutOff(std::size_t from) {
    for (std::size_t i = from; i < m_way.size(); ++i) {
        m_placeOnWay[m_fans->fromNode(m_way[i])] = kNone;
        m_steps.push_back(m_way[i]);
    }
    m_ends.push_back(static_cast<Index>(m_steps.size()));
    m_way.resize(from);
}

}  // namespace gmregion
