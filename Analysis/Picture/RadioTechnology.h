// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace velmora {

/// The radio technology of a serving cell.
enum class RadioTechnology : std::uint8_t { GSM, UMTS, TDSCDMA, LTE, NR, CDMA1x, EVDO };

inline constexpr std::size_t radioTechnologies = 7;

/// "GSM", "UMTS", "TD-SCDMA", "LTE", "NR", "CDMA2000 1x", "EV-DO".
[[nodiscard]] std::string_view nameOf(RadioTechnology technology);
/// What its channel number is called: "ARFCN", "EARFCN".
[[nodiscard]] std::string_view channelNameOf(RadioTechnology technology);
/// What distinguishes its cells on one channel: "BSIC", "PCI".
[[nodiscard]] std::string_view physicalCellNameOf(RadioTechnology technology);

/// What the radio-resource layer does, as far as all technologies have it in common.
enum class RadioMode : std::uint8_t {
    Off,
    Searching, ///< no serving cell yet
    Idle,      ///< camped on a cell
    Connected, ///< there is a connection, or a channel
};

/// "off", "searching", "idle", "connected".
[[nodiscard]] std::string_view nameOf(RadioMode mode);

} // namespace velmora
