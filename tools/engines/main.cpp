// SPDX-License-Identifier: MIT
/// @file
/// Lists the contours whose offset by the kernel does not hold, and compares the others with those
/// of the regions: gm_engines [DRAWING...], without drawings for parts as they are drawn and random
/// contours.
#include <cmath>
#include <cstddef>
#include <exception>
#include <iostream>
#include <map>
#include <string>
#include <vector>

#include "drawing/files/PartReader.h"
#include "tests/support/DrawnParts.h"
#include "tests/support/TwoEngines.h"

namespace {

using engines::Comparison;
using engines::Tally;
using gmpart::Box;
using gmpart::Path;

/// Distances as fractions of the longer side of a contour's box, both ways.
constexpr double kFractions[] = {0.002, 0.01, 0.03, 0.12};

constexpr unsigned kRandomContours = 20'000;

class FailureList {
public:
    void ask(const Path& contour, const std::string& name) {
        const Box box = boundingBox(contour);
        const double size = std::max(box.size().x, box.size().y);
        for (const double fraction : kFractions) {
            for (const double distance : {fraction * size, -fraction * size})
                ask(contour, name, distance);
        }
    }

    /// Prints the sums; whether the engines agree.
    bool finish() const {
        for (const auto& [fault, count] : m_faults)
            std::cout << "the kernel fails, " << fault << ": " << count << "\n";
        std::cout << m_tally.asked << " offsets, " << m_tally.compared << " compared, "
                  << m_tally.differ << " differ\n";
        return m_tally.differ == 0;
    }

private:
    void ask(const Path& contour, const std::string& name, double distance) {
        const Comparison found = engines::compare(contour, distance);
        m_tally.add(found);
        if (!found.suits || (found.kernelHolds && found.agree)) return;
        const std::string what =
            found.kernelHolds ? "differs: " + found.difference : found.kernelFault;
        std::cout << name << " by " << distance << ": " << what << "\n";
        if (!found.kernelHolds) ++m_faults[found.kernelFault];
    }

    Tally m_tally;
    std::map<std::string, std::size_t> m_faults;
};

void askDrawing(const std::string& file, FailureList& list) {
    std::size_t number = 0;
    for (const Path& contour : gmdrawing::readPart(file, {}).contours) {
        ++number;
        if (contour.closed) list.ask(contour, file + ", contour " + std::to_string(number));
    }
}

void askOurs(FailureList& list) {
    for (const gmregion::shapes::DrawnPart& part : gmregion::shapes::drawnParts()) {
        for (int degrees = 0; degrees < 360; degrees += 7) {
            std::size_t number = 0;
            for (const gmregion::shapes::Elements& loop : drawn(part, {degrees * 1.0, 4, 0})) {
                list.ask({loop, true, {}}, part.name + ", loop " + std::to_string(++number) +
                                               ", turned by " + std::to_string(degrees));
            }
        }
    }
    for (unsigned seed = 1; seed <= kRandomContours; ++seed) {
        constexpr std::size_t kMostElements = 60;
        list.ask(engines::randomContour(seed, 3 + seed % kMostElements),
                 "random contour " + std::to_string(seed));
    }
}

}  // namespace

int main(int argc, char** argv) {
    try {
        FailureList list;
        for (int i = 1; i < argc; ++i)
            askDrawing(argv[i], list);
        if (argc == 1) askOurs(list);
        return list.finish() ? 0 : 1;
    } catch (const std::exception& error) {
        std::cerr << "gm_engines: " << error.what() << "\n";
        return 2;
    }
}
