// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/DLFVersionReport.h"

#include "Platform/Clock.h"
#include "Platform/Resources.h"

#include <algorithm>
#include <chrono>
#include <optional>
#include <string>

namespace velmora {

namespace {

void putLittleEndian(std::span<std::uint8_t> field, std::uint64_t value) {
    for (std::uint8_t& byte : field) {
        byte = static_cast<std::uint8_t>(value);
        value >>= 8;
    }
}

/// Copies at most `limit` bytes, the last of which is the terminating zero.
void putText(std::span<std::uint8_t> field, std::string_view text, std::size_t limit) {
    const std::size_t length = std::min(text.size(), limit - 1);
    std::copy_n(text.begin(), length, field.begin());
}

std::uint64_t packedTime(const Clock& clock) {
    const Time now = clock.now();
    const ZoneState zone = clock.zoneAt(now);
    const auto seconds = std::chrono::floor<std::chrono::seconds>(now).time_since_epoch().count();
    const auto minutes = zone.offset.count() / 60; // toward zero
    return static_cast<std::uint32_t>(seconds) | std::uint64_t{static_cast<std::uint16_t>(minutes)} << 32 |
           std::uint64_t{zone.daylightSaving ? 1u : 0u} << 48;
}

} // namespace

int DLFAddVersionReport(std::span<std::uint8_t> buffer, std::size_t& written, std::uint16_t firstReport,
                        std::uint16_t secondReport, std::string_view version, std::string_view executable,
                        std::string_view build, std::uint64_t packedTime) {
    written = 0;
    if (buffer.size() < dlfVersionReportSize)
        return 3;
    const auto report = buffer.first(dlfVersionReportSize);
    std::fill(report.begin(), report.end(), std::uint8_t{0});
    putLittleEndian(report.subspan(0, 2), dlfVersionReportSize);
    putLittleEndian(report.subspan(2, 2), dlfVersionReportCode);
    putLittleEndian(report.subspan(12, 2), firstReport);
    putLittleEndian(report.subspan(14, 2), secondReport);
    putText(report.subspan(16, 7), version, 7);
    putText(report.subspan(23, 40), executable, 16);
    putText(report.subspan(63, 18), build, 18);
    putLittleEndian(report.subspan(dlfVersionReportTimeOffset, 4), packedTime);
    putLittleEndian(report.subspan(85, 2), packedTime >> 32);
    putLittleEndian(report.subspan(87, 1), packedTime >> 48);
    written = dlfVersionReportSize;
    return 0;
}

int addOwnVersionReport(std::span<std::uint8_t> buffer, std::size_t& written, const Clock& clock) {
    const std::optional<std::string> bundleVersion = resources().bundleVersion();
    const std::string version = bundleVersion ? "Velmora " + *bundleVersion : "(none)";
    return DLFAddVersionReport(buffer, written, 1, 1, version, "EXECUTABLE_NAME", resources().buildStamp(),
                               packedTime(clock));
}

} // namespace velmora
