// SPDX-License-Identifier: MIT
/// @file
/// Booleans and offsets beside those of GEOS, a library of segments, on parts whose arcs are
/// flattened first, so that both get the same input. Built where GEOS is installed.
#include <geos_c.h>
#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <memory>
#include <random>

#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "tests/support/DrawnParts.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

/// What belongs to the other engine.
class Engine {
public:
    Engine() : m_handle(GEOS_init_r()) {}
    ~Engine() { GEOS_finish_r(m_handle); }
    Engine(const Engine&) = delete;
    Engine& operator=(const Engine&) = delete;

    using Geometry = std::shared_ptr<GEOSGeometry>;
    Geometry own(GEOSGeometry* geometry) const {
        return {geometry, [handle = m_handle](GEOSGeometry* g) { GEOSGeom_destroy_r(handle, g); }};
    }

    /// A set of segments alone as a union of polygons.
    Geometry geometryOf(const RegionSet& set) const {
        std::vector<GEOSGeometry*> polygons;
        for (std::size_t i = 0; i < set.loops().size();) {
            GEOSGeometry* outline = ringOf(set, set.loops()[i++]);
            std::vector<GEOSGeometry*> holes;
            while (i < set.loops().size() && set.loops()[i].hole)
                holes.push_back(ringOf(set, set.loops()[i++]));
            polygons.push_back(GEOSGeom_createPolygon_r(m_handle, outline, holes.data(),
                                                        static_cast<unsigned>(holes.size())));
        }
        return own(GEOSGeom_createCollection_r(m_handle, GEOS_MULTIPOLYGON, polygons.data(),
                                               static_cast<unsigned>(polygons.size())));
    }

    double areaOf(const Geometry& geometry) const {
        double area = NAN;
        if (geometry) GEOSArea_r(m_handle, geometry.get(), &area);
        return area;
    }

    GEOSContextHandle_t handle() const { return m_handle; }

private:
    GEOSGeometry* ringOf(const RegionSet& set, const Loop& loop) const {
        const unsigned count = loop.last - loop.first;
        GEOSCoordSequence* points = GEOSCoordSeq_create_r(m_handle, count + 1, 2);
        for (unsigned i = 0; i <= count; ++i) {
            const Vec2 p = set.elements()[loop.first + i % count].sp;
            GEOSCoordSeq_setXY_r(m_handle, points, i, p.x, p.y);
        }
        return GEOSGeom_createLinearRing_r(m_handle, points);
    }

    GEOSContextHandle_t m_handle;
};

Elements flattened(const Elements& loop) {
    constexpr int kHalvings = 4;
    Elements segments = loop;
    for (int i = 0; i < kHalvings; ++i) {
        Elements halves;
        for (const Element& e : segments) {
            const double half = e.bulge / (1.0 + std::sqrt(1.0 + e.bulge * e.bulge));
            const Vec2 m = middleOf(e);
            if (e.bulge == 0.0) {
                halves.push_back(e);
            } else {
                halves.push_back({e.sp, m, half});
                halves.push_back({m, e.ep, half});
            }
        }
        segments = halves;
    }
    for (Element& e : segments)
        e.bulge = 0.0;
    return segments;
}

RegionSet setOf(const std::vector<Elements>& loops) {
    Paths paths;
    for (const Elements& loop : loops)
        paths.add(flattened(loop), true);
    const Outcome outcome = cleanUp(paths, {FillRule::kEvenOdd, 0.0});
    EXPECT_FALSE(outcome.refusal);
    return outcome.regions;
}

std::vector<RegionSet> someSets() {
    std::vector<RegionSet> sets;
    double degrees = 0.0;
    for (const DrawnPart& part : drawnParts())
        sets.push_back(setOf(drawn(part, {degrees += 11.0, 3, 0})));
    std::mt19937 engine(31);
    for (int i = 0; i < 20; ++i)
        sets.push_back(setOf({star(engine, 20, {5, 5}, 30), tangle(engine, 9, 40)}));
    return sets;
}

TEST(OtherEngine, HasTheSameBooleans) {
    const Engine engine;
    const std::array operations{GEOSUnion_r, GEOSIntersection_r, GEOSDifference_r,
                                GEOSSymDifference_r};
    const std::vector<RegionSet> sets = someSets();
    for (std::size_t i = 1; i < sets.size(); ++i) {
        const auto a = engine.geometryOf(sets[i - 1]);
        const auto b = engine.geometryOf(sets[i]);
        for (std::size_t k = 0; k < operations.size(); ++k) {
            const Outcome outcome = combine(sets[i - 1], sets[i], static_cast<Combination>(k));
            ASSERT_FALSE(outcome.refusal);
            const auto other = engine.own(operations[k](engine.handle(), a.get(), b.get()));
            const double slack =
                4.0 * outcome.regions.tolerance() * (perimeter(sets[i - 1]) + perimeter(sets[i]));
            EXPECT_NEAR(area(outcome.regions), engine.areaOf(other), slack) << i << " " << k;
        }
    }
}

/// Its discs are polygons within the true ones: less by up to one part in ten thousand.
TEST(OtherEngine, HasAboutTheSameOffsets) {
    constexpr int kQuarter = 64;
    const Engine engine;
    for (const RegionSet& set : someSets()) {
        const auto source = engine.geometryOf(set);
        for (const double d : {0.5, 4.0, -0.5, -4.0}) {
            const Outcome outcome = offset(set, d);
            ASSERT_FALSE(outcome.refusal);
            const auto other = engine.own(GEOSBuffer_r(engine.handle(), source.get(), d, kQuarter));
            const double sagitta = std::fabs(d) * 8e-5 + 1e-6;
            EXPECT_NEAR(area(outcome.regions), engine.areaOf(other),
                        sagitta * (perimeter(outcome.regions) + perimeter(set)))
                << d;
        }
    }
}

}  // namespace
