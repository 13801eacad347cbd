// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

class Clock;

/// The first record of a DLF log (the modem maker's diagnostic log file), which says what wrote it: those who
/// write such logs share it.

/// The size of a version report.
inline constexpr std::size_t dlfVersionReportSize = 161;
/// Its log code.
inline constexpr std::uint16_t dlfVersionReportCode = 0x1FFD;
/// Where in it the time stands at which the log was written: seconds since 1970, 32 bits.
inline constexpr std::size_t dlfVersionReportTimeOffset = 81;

/// Writes a DLF log's version report into `buffer` and its size into `written`; 0 on success. A buffer that
/// is too short gets nothing, `written` becomes 0 and the result is 3. `packedTime`: seconds since 1970 in
/// the low 32 bits, then the zone's offset in minutes (16), then 1 while daylight-saving time is in effect
/// (8). Texts that do not fit their field are cut, as the format has it.
[[nodiscard]] int DLFAddVersionReport(std::span<std::uint8_t> buffer, std::size_t& written,
                                      std::uint16_t firstReport, std::uint16_t secondReport,
                                      std::string_view version, std::string_view executable,
                                      std::string_view build, std::uint64_t packedTime);

/// As above, with what the resources say of this program and the time that the clock shows.
[[nodiscard]] int addOwnVersionReport(std::span<std::uint8_t> buffer, std::size_t& written,
                                      const Clock& clock);

} // namespace velmora
