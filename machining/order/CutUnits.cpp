// SPDX-License-Identifier: MIT
#include "machining/order/CutUnits.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace gmmachining {

namespace {

/// Groups of numbers that grow together; the lowest number stands for its group.
class Groups {
public:
    explicit Groups(std::size_t count) : m_parents(count) {
        std::iota(m_parents.begin(), m_parents.end(), std::size_t{0});
    }
    std::size_t of(std::size_t i) {
        while (m_parents[i] != i) {
            m_parents[i] = m_parents[m_parents[i]];
            i = m_parents[i];
        }
        return i;
    }
    void join(std::size_t a, std::size_t b) {
        const std::size_t first = of(a);
        const std::size_t second = of(b);
        m_parents[std::max(first, second)] = std::min(first, second);
    }

private:
    std::vector<std::size_t> m_parents;
};

std::vector<std::size_t> unitNumbers(std::size_t count,
                                     const std::vector<std::vector<ToolRun>>& passes) {
    Groups groups(count);
    for (const std::vector<ToolRun>& pass : passes) {
        for (const ToolRun& run : pass) {
            for (const std::size_t contour : run.contours)
                groups.join(run.contours.front(), contour);
        }
    }
    std::vector<std::size_t> numbers(count);
    std::size_t units = 0;
    for (std::size_t i = 0; i < count; ++i)
        numbers[i] = groups.of(i) == i ? units++ : numbers[groups.of(i)];
    return numbers;
}

}  // namespace

std::vector<CutUnit> cutUnits(std::size_t count, std::vector<std::vector<ToolRun>>&& passes) {
    const std::vector<std::size_t> numbers = unitNumbers(count, passes);
    std::vector<CutUnit> units;
    for (std::size_t i = 0; i < count; ++i) {
        if (numbers[i] == units.size()) units.push_back({{}, {}});
        units[numbers[i]].contours.push_back(i);
    }
    for (CutUnit& unit : units)
        unit.passes.resize(passes.size());
    for (std::size_t pass = 0; pass < passes.size(); ++pass) {
        for (ToolRun& run : passes[pass])
            units[numbers[run.contours.front()]].passes[pass].push_back(std::move(run));
    }
    return units;
}

std::vector<std::vector<std::size_t>> holdersOfUnits(
    const std::vector<CutUnit>& units, const std::vector<std::vector<std::size_t>>& holders) {
    std::vector<std::size_t> unitOf(holders.size());
    for (std::size_t unit = 0; unit < units.size(); ++unit) {
        for (const std::size_t contour : units[unit].contours)
            unitOf[contour] = unit;
    }
    std::vector<std::vector<std::size_t>> found(units.size());
    for (std::size_t unit = 0; unit < units.size(); ++unit) {
        std::vector<std::size_t>& round = found[unit];
        for (const std::size_t contour : units[unit].contours) {
            for (const std::size_t holder : holders[contour]) {
                if (unitOf[holder] != unit) round.push_back(unitOf[holder]);
            }
        }
        std::sort(round.begin(), round.end());
        round.erase(std::unique(round.begin(), round.end()), round.end());
    }
    return found;
}

}  // namespace gmmachining
