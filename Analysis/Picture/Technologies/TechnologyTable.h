// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/RadioTechnology.h"
#include "Analysis/Picture/Technologies/DetectorTable.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace velmora {

/// Whose cell the leaves below a path describe; the first row that fits counts. Leaves that no row fits are
/// of whichever radio technology the phone uses.
struct TechnologyRow {
    std::string_view path; ///< of the leaf or of what it lies in
    RadioTechnology technology;
};

/// What a value of a state says of the radio.
struct ModeRow {
    std::int64_t raw;        ///< of an enumeration
    std::string_view text{}; ///< of a text; empty: the raw number counts
    RadioMode mode;
    /// Whether the network moves the phone from cell to cell in this state; otherwise the phone does.
    bool isMovedByNetwork = false;
};

/// A leaf whose value says what the radio does. A value without a row says nothing.
struct ModeTable {
    std::string_view path;
    std::span<const ModeRow> rows;
};

/// A leaf that only records of that mode have.
struct ModeEvidence {
    std::string_view path;
    RadioMode mode;
};

/// What a leaf is of a neighbour, beside what its role says.
enum class NeighbourPart : std::uint8_t {
    None,
    Channel, ///< of all rows of the message that have none of their own
    Technology,
    Set,          ///< which set it is in: `TechnologyTable::activeSet`, `detectedSet`
    DetectedCell, ///< its list is of cells that the phone found by itself
};
struct NeighbourRow {
    std::string_view path;
    NeighbourPart part;
};

/// The radio technology that a raw number stands for.
struct TechnologyNumber {
    std::int64_t raw;
    RadioTechnology technology;
};

/// What is known of a decoder's display beyond its roles: one table a decoder, by path.
struct TechnologyTable {
    std::string_view name; ///< as the catalogue has it
    std::span<const TechnologyRow> technologies{};
    std::span<const ModeTable> modes{};
    std::span<const ModeEvidence> evidence{};
    std::span<const NeighbourRow> neighbours{};
    std::int64_t activeSet = -1; ///< raw number of a neighbour's set that stands for a serving cell
    std::int64_t detectedSet = -1;
    std::string_view servingTechnology{}; ///< the leaf that names the serving cell's radio technology
    std::span<const TechnologyNumber> technologyNumbers{};
    std::span<const std::string_view> ignored{}; ///< leaves whose role another one has as well
    /// The phone has a serving cell of each radio technology at the same time.
    bool isHybrid = false;
    /// Records have zeros in the place of a cell identity and a channel where there is no cell.
    bool hasZerosForNone = false;
    /// Of that technology records report a cell before the phone is on it; it counts when idle and connected.
    std::optional<RadioTechnology> searched{};
    /// Areas that stand for none: with one of them, a message reports no serving cell.
    std::span<const std::int64_t> noAreas{};
    DetectorTable detectors{};
};

/// The table of the decoder; an empty one for a decoder that has none.
[[nodiscard]] const TechnologyTable& technologyTable(std::string_view name);

/// The radio technology that the number stands for in the table, if there is one.
[[nodiscard]] std::optional<RadioTechnology> technologyOf(std::int64_t raw, const TechnologyTable& table);

/// Whether the leaf's path is that path, or lies below it.
[[nodiscard]] bool isAtOrBelow(std::string_view leaf, std::string_view path);

namespace technologies {
extern const TechnologyTable ifx;
extern const TechnologyTable ostrelCDMA;
extern const TechnologyTable ostrelGSM;
extern const TechnologyTable ostrelLTE;
extern const TechnologyTable ostrelUTRAN2;
extern const TechnologyTable modem;
} // namespace technologies

} // namespace velmora
