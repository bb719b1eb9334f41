// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <cstring>
#include <vector>

#include "gmregion/Outcome.h"
#include "gmregion/Questions.h"
#include "gmregion/Simplify.h"
#include "gmregion/Verify.h"

namespace gmregion {

/// Every bit of results, one after the other.
class ResultBits {
public:
    void add(std::uint64_t value) { m_bits.push_back(value); }
    void add(double value) {
        std::uint64_t bits = 0;
        std::memcpy(&bits, &value, sizeof bits);
        add(bits);
    }
    void add(Point p) {
        add(p.x);
        add(p.y);
    }
    void add(const Element& e) {
        add(e.sp);
        add(e.ep);
        add(e.bulge);
    }
    void add(const RegionSet& set) {
        add(set.tolerance());
        for (const Loop& loop : set.loops())
            add((std::uint64_t{loop.last} << 32U) + 2U * loop.region + (loop.hole ? 1U : 0U));
        for (std::size_t i = 0; i < set.elements().size(); ++i) {
            add(set.elements()[i]);
            for (const Origin& origin : set.origins(i)) {
                add(static_cast<std::uint64_t>(origin.path));
                add(4U * std::uint64_t{origin.element} + static_cast<std::uint64_t>(origin.kind));
            }
        }
    }
    void add(const Outcome& outcome) {
        add(outcome.regions);
        add(static_cast<std::uint64_t>(outcome.refusal.reason));
        for (const Point p : outcome.marginal)
            add(p);
    }
    void add(const Verdict& verdict) {
        add(std::uint64_t{verdict.count});
        for (const Fault& fault : verdict.faults) {
            add(static_cast<std::uint64_t>(fault.kind));
            add(fault.at);
            add(fault.by);
        }
    }
    void add(const Simplified& simplified) {
        for (std::size_t i = 0; i < simplified.paths.size(); ++i) {
            for (const Element& e : simplified.paths[i])
                add(e);
        }
        for (const SourceRange& range : simplified.sources)
            add((std::uint64_t{range.first} << 32U) + range.last);
    }

    const std::vector<std::uint64_t>& bits() const { return m_bits; }
    /// All of it in one number (FNV-1a, by words).
    std::uint64_t hash() const {
        std::uint64_t hash = 14695981039346656037ULL;
        for (const std::uint64_t bits : m_bits)
            hash = (hash ^ bits) * 1099511628211ULL;
        return hash;
    }

private:
    std::vector<std::uint64_t> m_bits;
};

}  // namespace gmregion
