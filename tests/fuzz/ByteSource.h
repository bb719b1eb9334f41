// SPDX-License-Identifier: MIT
#pragma once

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <cstring>

namespace gmregion::fuzz {

/// Numbers out of a row of bytes; zeros when it has come to its end.
class ByteSource {
public:
    ByteSource(const std::uint8_t* data, std::size_t size) : m_at(data), m_end(data + size) {}

    bool isEmpty() const { return m_at == m_end; }
    std::uint8_t byte() { return isEmpty() ? std::uint8_t{0} : *m_at++; }
    /// One of the numbers from 0 up to a count; 0 when the count is 0.
    std::size_t below(std::size_t count) { return count == 0 ? 0 : byte() % count; }

    /// Any double at all, bit by bit.
    double real() {
        unsigned char bytes[sizeof(double)];
        for (unsigned char& b : bytes)
            b = byte();
        double value = 0.0;
        std::memcpy(&value, bytes, sizeof value);
        return value;
    }

    /// A place on a grid of 32 lines, or a few eighths behind one.
    double onGrid() {
        const int b = byte();
        return (b & 31) + (b >> 5) / 8.0;
    }

    /// 0 for one byte in four, else a power of two from 2^-47 to 1, of either sign.
    double nearZero() {
        const int b = byte();
        if (b % 4 == 0) return 0.0;
        const double size = std::ldexp(1.0, -3 * (b / 8 % 16) - b % 4 + 1);
        return b / 4 % 2 == 0 ? size : -size;
    }

private:
    const std::uint8_t* m_at;
    const std::uint8_t* m_end;
};

}  // namespace gmregion::fuzz
