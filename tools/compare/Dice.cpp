// SPDX-License-Identifier: MIT
#include "Dice.h"

#include <cmath>
#include <limits>

namespace net {

namespace {

/// Mixes the bits of a number so that neighbours give unlike seeds (finaliser of SplitMix64).
std::uint64_t Mixed(std::uint64_t x) {
    x += 0x9E3779B97F4A7C15U;
    x = (x ^ (x >> 30U)) * 0xBF58476D1CE4E5B9U;
    x = (x ^ (x >> 27U)) * 0x94D049BB133111EBU;
    return x ^ (x >> 31U);
}

}  // namespace

Dice::Dice(std::uint64_t family, std::uint64_t index)
    : m_engine(Mixed(Mixed(family) + index)), m_eManner(Manner::kGrid) {
    constexpr int kWays = 16;
    const int way = Below(kWays);
    if (way >= 5) m_eManner = Manner::kAnywhere;
    if (way >= 9) m_eManner = Manner::kRounded;
    if (way >= 12) m_eManner = Manner::kBeside;
    if (way == kWays - 1) m_eManner = Manner::kOdd;
}

int Dice::Below(int n) {
    return static_cast<int>(m_engine() % static_cast<std::uint64_t>(n));
}

double Dice::In(double low, double high) {
    constexpr double kSteps = 9007199254740992.0;  // 2^53: every step is a double of its own
    return low + (high - low) * (static_cast<double>(m_engine() >> 11U) / kSteps);
}

double Dice::Length() {
    return m_eManner == Manner::kOdd && Once(6) ? OddLength() : SoundLength();
}

double Dice::SoundLength() {
    constexpr int kGrid = 6;
    constexpr double kReach = 10.0;
    switch (m_eManner) {
        case Manner::kGrid:
            return Below(2 * kGrid + 1) - kGrid;
        case Manner::kRounded:
            return Rounded(In(-kReach, kReach), 1 + Below(6));
        case Manner::kBeside:
            return Below(2 * kGrid + 1) - kGrid + In(-2.0, 2.0) / std::pow(10.0, 3 + Below(8));
        default:
            return In(-kReach, kReach);
    }
}

double Dice::OddLength() {
    const double values[] = {0.0,
                             -0.0,
                             1e-5,
                             -1e-9,
                             1e-300,
                             1e7,
                             -1e12,
                             1e200,
                             std::numeric_limits<double>::infinity(),
                             -std::numeric_limits<double>::infinity(),
                             std::numeric_limits<double>::quiet_NaN()};
    return values[Below(static_cast<int>(sizeof values / sizeof *values))];
}

double Dice::Degrees() {
    return Once(2) ? 45.0 * (Below(17) - 8) : In(-400.0, 400.0);
}

GmPoint Dice::Point() {
    const double x = Length();
    const double y = Length();
    return GmPoint(x, y);
}

GmPoint Dice::AnyPoint() {
    if (Once(60)) return GmPoint();
    GmPoint p = Point();
    if (Once(4)) p.Z(SoundLength());
    return p;
}

GmVec Dice::Vector() {
    const GmPoint p = AnyPoint();
    return GmVec(p);
}

GmDir Dice::Direction() {
    switch (Below(4)) {
        case 0:
            return GmDir(GmAngle(Degrees(), false));
        case 1:
            return GmDir(AnyPoint(), AnyPoint());
        default:
            return GmDir(Vector());
    }
}

GmBase::eRotDir Dice::Sense() {
    if (Once(40)) return GmBase::eRotNone;
    return Once(2) ? GmBase::eRotCW : GmBase::eRotCCW;
}

double Rounded(double value, int decimals) {
    const double unit = std::pow(10.0, decimals);
    return std::round(value * unit) / unit;
}

}  // namespace net
