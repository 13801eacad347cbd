// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Recording/MessageReader.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/Hex.h"

#include <cstdint>
#include <string>
#include <vector>

/// DLF logs and snapshots for tests, and what is read of a file of any form as plain text.

namespace velmora {

/// A record less its type byte, as in a DLF log: length, code, time stamp, payload.
[[nodiscard]] Data bareRecord(std::uint16_t code, std::string_view payloadHex, std::uint64_t timestamp = 0);
/// As above with the type byte: the message as it arrives.
[[nodiscard]] Data stampedRecord(std::uint16_t code, std::string_view payloadHex, std::uint64_t timestamp,
                                 std::uint8_t type = 1);
/// A version report of 161 bytes, written 2026-11-16 05:00:00 UTC.
[[nodiscard]] Data versionReport();
/// A time stamp: 2026-11-16 05:00:00 UTC and so many units of 1.25 ms.
[[nodiscard]] std::uint64_t stampAfter(std::uint64_t units);

/// A history entry with these raw messages and that date.
[[nodiscard]] DictionaryRef historyEntry(Value rawMessages, std::string_view date);
/// A snapshot of the entries.
[[nodiscard]] Value snapshotOf(std::initializer_list<Value> entries);
/// The same as a file, an XML or a binary property list.
[[nodiscard]] Data snapshotFile(std::initializer_list<Value> entries, bool binary = false);

/// What openMessages and the reader returned until the end. A message that a refresh follows is followed by
/// the refresh's time: "1 at 0, 5 ns: 0A0B, refresh at 2 ns".
[[nodiscard]] ReadOut readAnyForm(const Data& file, std::size_t piece = SIZE_MAX,
                                  std::size_t good = SIZE_MAX);

} // namespace velmora
