// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/TelephonyService.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <limits>
#include <optional>
#include <string_view>

namespace velmora {

/// The index of a text in a list of texts; the length of the list where it is not in it.
template <std::size_t N>
constexpr std::uint8_t indexOf(std::string_view text, const std::string_view (&texts)[N]) {
    std::uint8_t index = 0;
    while (index < N && texts[index] != text)
        ++index;
    return index;
}

/// The telephony service's keys for the numbers of a cell that a section may show.
inline constexpr std::string_view cellNumberKeys[] = {
    kVoxCellMonitorMCC,      kVoxCellMonitorMNC,   kVoxCellMonitorLAC,    kVoxCellMonitorTAC,
    kVoxCellMonitorCellId,   kVoxCellMonitorARFCN, kVoxCellMonitorUARFCN, kVoxCellMonitorPID,
    kVoxCellMonitorSCN,      kVoxCellMonitorRSSI,  kVoxCellMonitorRSCP,   kVoxCellMonitorECN0,
    kVoxCellMonitorBandInfo,
};
inline constexpr std::size_t cellNumberCount = std::size(cellNumberKeys);
inline constexpr std::string_view cellTechnologies[] = {
    kVoxCellMonitorRadioAccessTechnologyGSM,
    kVoxCellMonitorRadioAccessTechnologyUMTS,
    kVoxCellMonitorRadioAccessTechnologyUTRAN,
    kVoxCellMonitorRadioAccessTechnologyLTE,
};
inline constexpr std::string_view cellTypes[] = {kVoxCellMonitorCellTypeServing,
                                                 kVoxCellMonitorCellTypeNeighbor};

/// One of those keys; any other does not compile.
struct CellKey {
    std::uint8_t index;

    consteval CellKey(std::string_view key) : index(indexOf(key, cellNumberKeys)) {
        if (index == cellNumberCount)
            throw "a key that is none of a cell's numbers";
    }
};

/// A radio access technology and a cell type.
struct CellKind {
    std::uint8_t technology = std::size(cellTechnologies); ///< none of the known ones
    std::uint8_t type = std::size(cellTypes);

    CellKind() = default;
    consteval CellKind(std::string_view technologyText, std::string_view typeText)
        : technology(indexOf(technologyText, cellTechnologies)), type(indexOf(typeText, cellTypes)) {
        if (technology == std::size(cellTechnologies) || type == std::size(cellTypes))
            throw "an unknown technology or type";
    }
    friend bool operator==(const CellKind& a, const CellKind& b) = default;
};

/// What sections read of one cell of the cell information array.
struct Cell {
    CellKind kind;
    std::uint32_t present = 0; ///< bit by bit, which numbers it has
    std::array<std::int32_t, cellNumberCount> numbers;

    [[nodiscard]] bool has(CellKey key) const { return (present >> key.index & 1) != 0; }
    [[nodiscard]] std::optional<std::int32_t> number(CellKey key) const {
        return has(key) ? std::optional(numbers[key.index]) : std::nullopt;
    }
    /// Sets a number; one that does not fit 32 bits is absent.
    void setNumber(std::size_t index, std::int64_t number) {
        const bool fits = number >= std::numeric_limits<std::int32_t>::min() &&
                          number <= std::numeric_limits<std::int32_t>::max();
        numbers[index] = static_cast<std::int32_t>(number);
        present = (present & ~(1u << index)) | std::uint32_t{fits} << index;
    }
    /// The value under that key is no number.
    void clearNumber(std::size_t index) { present &= ~(1u << index); }
};

} // namespace velmora
