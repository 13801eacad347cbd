// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LogMessage.h"
#include "PropertyLists/Value.h"
#include "Telephony/Drives/Scenario.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <set>
#include <vector>

/// What the tests of the scenarios share: a drive's messages, their fields and layouts, and what is expected
/// of every drive.

namespace velmora {

using Drive = std::vector<ScenarioEvent>;

/// All messages of the scenario's first `duration`.
[[nodiscard]] Drive driveOf(Scenario& scenario, std::chrono::nanoseconds duration);
template <class Kind>
[[nodiscard]] Drive driveOf(std::uint64_t seed, std::chrono::nanoseconds duration) {
    Kind scenario(seed);
    return driveOf(scenario, duration);
}

/// Little-endian fields of a record. Precondition: they lie inside.
[[nodiscard]] unsigned u16(Bytes record, std::size_t offset);
[[nodiscard]] std::int64_t u32(Bytes record, std::size_t offset);
[[nodiscard]] int s8(Bytes record, std::size_t offset);

/// What a record of a code needs: its least length, and the bytes that its counts ask for.
struct Requirement {
    std::size_t minimum;
    std::function<std::size_t(Bytes record)> needed;
};
/// By log code.
using Requirements = std::map<std::uint32_t, Requirement>;

/// Whether a record is as its table says.
using RecordCheck = std::function<bool(const LogMessage&)>;
/// The same for a table of requirements, which must outlive it.
[[nodiscard]] RecordCheck meets(const Requirements& requirements);

/// Calls `look` with every good record of that code; there is to be one.
void eachRecord(const Drive& drive, std::uint32_t code, const RecordCheck& good,
                const std::function<void(Bytes)>& look);

/// The records of a drive that have a table, by log code; views of the drive, which must outlive them.
/// Those of a wrong type byte are left out.
struct RecordCensus {
    std::map<std::uint32_t, std::vector<Bytes>> good;
    std::map<std::uint32_t, std::vector<Bytes>> belowMinimum;
    std::map<std::uint32_t, std::vector<Bytes>> overrun; ///< long enough, but not for their counts
};
/// Expects of every record, too, that its header has its length.
[[nodiscard]] RecordCensus censusOf(const Drive& drive, const Requirements& requirements);
/// The codes of such a table.
template <class Entry>
[[nodiscard]] std::set<std::uint32_t> codesOf(const std::map<std::uint32_t, Entry>& table) {
    std::set<std::uint32_t> codes;
    for (const auto& [code, entry] : table)
        codes.insert(code);
    return codes;
}
/// Expects the three lists of the extra stream in the binary and the XML form: the SIM's a dictionary, the
/// others arrays. Calls `look` with each and its code, 0 to 2.
void expectExtraLists(const Drive& drive, const std::function<void(unsigned code, const Value& list)>& look);

/// The seeds with which a test tries more than one drive.
inline constexpr std::uint64_t severalSeeds[] = {1, 2, 3, 99};

} // namespace velmora
