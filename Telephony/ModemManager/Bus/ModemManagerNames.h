// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string_view>

/// What ModemManager 1.20 calls its service, objects, interfaces and errors on the bus, and the numbers that
/// its enumerations have there.
namespace velmora::mm {

inline constexpr std::string_view service = "org.freedesktop.ModemManager1";
inline constexpr std::string_view rootPath = "/org/freedesktop/ModemManager1";
/// What the paths of modems begin with; a number without leading zeros follows.
inline constexpr std::string_view modemPathPrefix = "/org/freedesktop/ModemManager1/Modem/";
/// Whether a text is the path of an object: parts of letters, digits and underscores, each after a slash. A
/// single slash is the path of no object.
[[nodiscard]] constexpr bool isObject(std::string_view path) {
    if (!path.starts_with('/') || path.ends_with('/') || path.find("//") != path.npos)
        return false;
    for (const char each : path)
        if (each != '/' && each != '_' && !(each >= '0' && each <= '9') && !(each >= 'A' && each <= 'Z') &&
            !(each >= 'a' && each <= 'z'))
            return false;
    return true;
}

inline constexpr std::string_view objectManager = "org.freedesktop.DBus.ObjectManager";
inline constexpr std::string_view properties = "org.freedesktop.DBus.Properties";
inline constexpr std::string_view modem = "org.freedesktop.ModemManager1.Modem";
inline constexpr std::string_view modem3gpp = "org.freedesktop.ModemManager1.Modem.Modem3gpp";
inline constexpr std::string_view modemCdma = "org.freedesktop.ModemManager1.Modem.ModemCdma";
inline constexpr std::string_view location = "org.freedesktop.ModemManager1.Modem.Location";
inline constexpr std::string_view signal = "org.freedesktop.ModemManager1.Modem.Signal";
inline constexpr std::string_view sim = "org.freedesktop.ModemManager1.Sim";
inline constexpr std::string_view bearer = "org.freedesktop.ModemManager1.Bearer";
/// ModemManager's own, at `rootPath`.
inline constexpr std::string_view manager = "org.freedesktop.ModemManager1";

/// Bits of Modem.AccessTechnologies.
namespace Access {
inline constexpr std::int64_t GSM = 1 << 1 | 1 << 2 | 1 << 3 | 1 << 4;           // with compact, GPRS, EDGE
inline constexpr std::int64_t UMTS = 1 << 5 | 1 << 6 | 1 << 7 | 1 << 8 | 1 << 9; // with HSDPA to HSPA+
inline constexpr std::int64_t CDMA1x = 1 << 10;
inline constexpr std::int64_t LTE = 1 << 14 | 1 << 16 | 1 << 17; // with Cat-M and NB-IoT
inline constexpr std::int64_t NR = 1 << 15;
} // namespace Access

/// A cell's "cell-type".
namespace CellType {
inline constexpr std::int64_t CDMA = 1;
inline constexpr std::int64_t GSM = 2;
inline constexpr std::int64_t UMTS = 3;
inline constexpr std::int64_t TDSCDMA = 4;
inline constexpr std::int64_t LTE = 5;
inline constexpr std::int64_t NR = 6;
} // namespace CellType

/// The bits of Location.Enabled for satellites, and the keys of what GetLocation answers: numbers of those
/// bits, as text.
inline constexpr std::int64_t satelliteBits = 1 << 1 | 1 << 2;
inline constexpr std::string_view networkLocationKey = "1";
inline constexpr std::string_view satelliteLocationKey = "2";
inline constexpr std::string_view sentencesKey = "4";

} // namespace velmora::mm
