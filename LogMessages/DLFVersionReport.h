// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

class Clock;

/// The first record of a DLF log (the modem maker's diagnostic log file), which identifies the program that
/// wrote it; shared by the writers of such logs.

/// The size of a version report.
inline constexpr std::size_t dlfVersionReportSize = 161;
/// Its log code.
inline constexpr std::uint16_t dlfVersionReportCode = 0x1FFD;
/// The offset in it of the time of writing: seconds since 1970, 32 bits.
inline constexpr std::size_t dlfVersionReportTimeOffset = 81;

/// Writes a DLF log's version report into `buffer` and its size into `written`; 0 on success. A buffer that
/// is too short is not written to, `written` becomes 0 and the result is 3. `packedTime`: seconds since 1970
/// in the low 32 bits, then the zone's offset in minutes (16), then 1 while daylight-saving time is in effect
/// (8). Texts that do not fit their field are truncated, as the format has it.
[[nodiscard]] int DLFAddVersionReport(std::span<std::uint8_t> buffer, std::size_t& written,
                                      std::uint16_t firstReport, std::uint16_t secondReport,
                                      std::string_view version, std::string_view executable,
                                      std::string_view build, std::uint64_t packedTime);

/// As above, with this program's version from the resources and the clock's time.
[[nodiscard]] int addOwnVersionReport(std::span<std::uint8_t> buffer, std::size_t& written,
                                      const Clock& clock);

} // namespace velmora
