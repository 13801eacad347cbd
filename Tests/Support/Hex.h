// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "PropertyLists/Value.h"

#include <chrono>
#include <cstdint>
#include <initializer_list>
#include <string_view>

/// Bytes for tests, written so that a reader sees the fields: hexadecimal text, and the log records made of
/// it.

namespace velmora {

/// The bytes that the text spells: two hexadecimal digits a byte, in either case. White space between bytes
/// is left out, and so is everything from "//" or "#" to the end of its line. Throws std::invalid_argument
/// for anything else, a byte of one digit included.
[[nodiscard]] Data hex(std::string_view text);

/// A log record with a time stamp of zero (see LogMessage). Throws std::invalid_argument where the length
/// does not fit.
[[nodiscard]] Data recordOf(std::uint16_t code, Bytes payload, std::uint8_t type = 1);

/// As `recordOf`, the payload given as `hex` takes it.
[[nodiscard]] Data record(std::uint16_t code, std::string_view payloadHex, std::uint8_t type = 1);

/// 1980-01-06 00:00:00 UTC, the moment whose time stamp is the eight zero bytes of the records above.
[[nodiscard]] inline Time zeroHour() {
    using namespace std::chrono;
    return sys_days{year{1980} / January / 6};
}

/// A record of the telephony service's extra stream whose payload is the value as an XML property
/// list. Throws std::invalid_argument for a value that has no such form.
[[nodiscard]] Data extraRecord(std::uint16_t code, const Value& plist);

/// The parts concatenated.
[[nodiscard]] Data joined(std::initializer_list<Data> parts);

template <class... Part>
[[nodiscard]] Data joined(const Data& first, const Part&... others) {
    return joined({first, others...});
}

} // namespace velmora
