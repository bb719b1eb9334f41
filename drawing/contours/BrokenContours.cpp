// SPDX-License-Identifier: MIT
#include "drawing/contours/BrokenContours.h"

#include <algorithm>
#include <optional>

#include "drawing/Text.h"
#include "part/regions/Nesting.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Box;
using gmregion::Vec2;

namespace {

Vec2 startOf(const Path& path) {
    return path.elements.front().sp;
}
Vec2 endOf(const Path& path) {
    return path.elements.back().ep;
}

/// An open contour beside what was skipped.
std::optional<BrokenContour> torn(std::size_t i, const Path& path,
                                  const std::vector<SkippedPlace>& skipped, double tolerance) {
    for (const SkippedPlace& place : skipped) {
        const std::string what = printable(place.kind) + " on layer " + printable(place.layer);
        if (place.box.isEmpty()) {
            return BrokenContour{i, endOf(path), "is open, and may lack a skipped " + what, {}};
        }
        Box about = boundingBox(path);
        about.include(place.box);
        for (const Vec2 end : {startOf(path), endOf(path)}) {
            if (!place.box.grown(tolerance).holds(end)) continue;
            return BrokenContour{i, end, "ends where a " + what + " was skipped", about};
        }
    }
    return std::nullopt;
}

/// The contours with those closed by a line that are open, but might be rings.
std::vector<Path> withChords(std::vector<Path> contours) {
    constexpr double kLargestGap = 0.5;
    for (Path& path : contours) {
        const double gap = path.closed ? 0.0 : distance(startOf(path), endOf(path));
        if (path.closed || gap > kLargestGap * length(path)) continue;
        path.elements.push_back({endOf(path), startOf(path)});
        path.closed = true;
    }
    return contours;
}

/// For every contour whether it would hold a closed one, were its ends joined.
std::vector<bool> wouldHold(const std::vector<Path>& contours) {
    std::vector<bool> result(contours.size(), false);
    const gmpart::Nesting nesting = gmpart::nestingOf(withChords(contours));
    for (std::size_t i = 0; i < contours.size(); ++i) {
        if (!contours[i].closed) continue;
        for (const std::size_t holder : nesting.holders[i])
            result[holder] = true;
    }
    return result;
}

/// Boxes about broken contours; those that overlap are one.
std::vector<Box> mergedBoxes(const std::vector<BrokenContour>& broken) {
    std::vector<Box> boxes;
    for (const BrokenContour& piece : broken) {
        Box box = piece.about;
        const auto joins = [&](const Box& other) {
            const bool overlaps = box.overlaps(other);
            if (overlaps) box.include(other);
            return overlaps;
        };
        // A box that has grown may reach others that were passed before.
        std::size_t before = boxes.size() + 1;
        while (boxes.size() < before) {
            before = boxes.size();
            boxes.erase(std::remove_if(boxes.begin(), boxes.end(), joins), boxes.end());
        }
        boxes.push_back(box);
    }
    return boxes;
}

std::string openText(const Path& path) {
    constexpr int kGapDigits = 4;
    const double gap = distance(startOf(path), endOf(path));
    return "is open by " + formatReal(gap, kGapDigits) +
           " but runs round others (--join closes gaps)";
}

}  // namespace

std::vector<BrokenContour> brokenContours(const std::vector<Path>& contours,
                                          const std::vector<SkippedPlace>& skipped,
                                          double tolerance) {
    std::vector<BrokenContour> broken;
    const auto isOpen = [](const Path& path) { return !path.closed; };
    if (std::none_of(contours.begin(), contours.end(), isOpen)) return broken;
    const std::vector<bool> holding = wouldHold(contours);
    for (std::size_t i = 0; i < contours.size(); ++i) {
        if (contours[i].closed) continue;
        if (const auto found = torn(i, contours[i], skipped, tolerance)) {
            broken.push_back(*found);
        } else if (holding[i]) {
            broken.push_back(
                {i, endOf(contours[i]), openText(contours[i]), boundingBox(contours[i])});
        }
    }
    return broken;
}

std::vector<std::size_t> doubtfulContours(const std::vector<Path>& contours,
                                          const std::vector<BrokenContour>& broken) {
    std::vector<bool> doubtful(contours.size(), false);
    for (const BrokenContour& piece : broken)
        doubtful[piece.contour] = true;
    const std::vector<Box> boxes = mergedBoxes(broken);
    for (std::size_t i = 0; i < contours.size(); ++i) {
        const Box box = boundingBox(contours[i]);
        const auto isIn = [&](const Box& about) { return about.isEmpty() || about.holds(box); };
        doubtful[i] = doubtful[i] || std::any_of(boxes.begin(), boxes.end(), isIn);
    }
    std::vector<std::size_t> result;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        if (doubtful[i]) result.push_back(i);
    }
    return result;
}

}  // namespace gmdrawing
