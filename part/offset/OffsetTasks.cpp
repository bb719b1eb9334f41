// SPDX-License-Identifier: MIT
#include "part/offset/OffsetTasks.h"

#include <map>
#include <utility>

#include "part/model/Area.h"

namespace gmpart {

namespace {

bool concernsThePart(Side side) {
    return side == Side::kWaste || side == Side::kMaterial || side == Side::kBoth;
}

std::vector<OffsetTask> tasksOfThePart(const PartRegions& regions, Side side) {
    std::vector<OffsetTask> tasks;
    if (side != Side::kMaterial) tasks.push_back({regions.part(), true});
    if (side == Side::kMaterial) tasks.push_back({regions.part(), false});
    if (side == Side::kBoth) tasks.push_back({tasks.front().source, false});
    return tasks;
}

std::vector<OffsetTask> tasksByDepth(const std::vector<Path>& contours, const PartRegions& regions,
                                     Side side) {
    std::map<std::pair<std::size_t, bool>, std::vector<std::size_t>> groups;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        if (regions.alone()[i].empty()) continue;
        const std::size_t depth = regions.nesting().depths[i];
        groups[{depth, leadsOutward(side, contours[i], depth)}].push_back(i);
    }
    std::vector<OffsetTask> tasks;
    for (const auto& [kind, members] : groups)
        tasks.push_back({regions.filled(members), kind.second});
    return tasks;
}

std::vector<OffsetTask> tasksForEach(const std::vector<Path>& contours, const PartRegions& regions,
                                     Side side) {
    std::vector<OffsetTask> tasks;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        if (regions.alone()[i].empty()) continue;
        const bool outward = leadsOutward(side, contours[i], regions.nesting().depths[i]);
        tasks.push_back({regions.filled({i}), outward, i});
        if (side == Side::kBoth) tasks.push_back({tasks.back().source, !outward, i});
    }
    return tasks;
}

}  // namespace

bool leadsOutward(Side side, const Path& contour, std::size_t depth) {
    const bool isOutline = depth % 2 == 0;
    switch (side) {
        case Side::kMaterial:
            return !isOutline;
        case Side::kRight:
            return sense(contour) == Sense::kCounterClockwise;
        case Side::kLeft:
            return sense(contour) == Sense::kClockwise;
        case Side::kInside:
            return false;
        case Side::kOutside:
            return true;
        case Side::kWaste:
        case Side::kBoth:
            break;
    }
    return isOutline;
}

std::vector<OffsetTask> offsetTasks(const std::vector<Path>& contours, const PartRegions& regions,
                                    Side side, bool each) {
    if (each) return tasksForEach(contours, regions, side);
    if (concernsThePart(side)) return tasksOfThePart(regions, side);
    return tasksByDepth(contours, regions, side);
}

}  // namespace gmpart
