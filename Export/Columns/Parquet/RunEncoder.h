// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

namespace velmora {

/// Encodes small numbers as Parquet's hybrid of run lengths and bit-packed groups of eight.
class RunEncoder {
public:
    /// Each number has so many bits, 1 to 32.
    explicit RunEncoder(unsigned width) : _width(width) {}

    void put(std::uint32_t value) {
        if (value == _current && _repeats >= groupSize) {
            ++_repeats; // a long run goes on
            return;
        }
        putNext(value);
    }
    void put(std::uint32_t value, std::size_t count);
    /// As one by one, but faster.
    void put(std::span<const std::uint16_t> values);

    /// Everything that was put; nothing can be put afterwards. The last group may have further zeros.
    [[nodiscard]] const std::vector<std::uint8_t>& finish();

private:
    static constexpr std::size_t groupSize = 8;
    static constexpr std::size_t mostGroups = 63; ///< of a packed run, whose header then has one byte

    void putNext(std::uint32_t value);
    void endGroup();
    void packGroup();
    void endPacked();
    void endRun();

    unsigned _width;
    std::uint32_t _current = 0;
    std::size_t _repeats =
        0; ///< of the current value: while it is below eight, they are in the group as well
    std::array<std::uint32_t, groupSize> _group{};
    std::size_t _grouped = 0;
    std::size_t _packedGroups = 0; ///< of the packed run that is open
    std::size_t _packedHeader = 0; ///< its offset
    std::vector<std::uint8_t> _out;
};

} // namespace velmora
