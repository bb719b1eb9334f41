// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <random>

#include "gmkernel/gmkernel.h"

namespace net {

/// The random choices of one operation: two objects made from the same family and index draw the
/// same values. The standard's distributions differ between libraries, so none is used.
class Dice {
public:
    Dice(std::uint64_t family, std::uint64_t index);

    /// A whole number from 0 to n - 1.
    int Below(int n);
    /// True in one of n cases.
    bool Once(int n) { return Below(n) == 0; }
    /// Uniform from `low` to `high`.
    double In(double low, double high);

    /// A coordinate or length in the manner drawn for this operation: on a grid, anywhere, rounded
    /// as in drawings, beside a grid by less than a tolerance, or out of hand.
    double Length();
    /// The same without values that are out of hand.
    double SoundLength();
    /// An angle in degrees, often a multiple of 45.
    double Degrees();

    GmPoint Point();
    /// Points with a height, and now and then an undefined one.
    GmPoint AnyPoint();
    GmVec Vector();
    GmDir Direction();
    GmBase::eRotDir Sense();

private:
    enum class Manner { kGrid, kAnywhere, kRounded, kBeside, kOdd };

    double OddLength();

    std::mt19937_64 m_engine;
    Manner m_eManner;
};

/// The value rounded to a number of decimals, as a drawing program writes it.
double Rounded(double value, int decimals);

}  // namespace net
