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
#include <optional>
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
/// Expects of every record, too, that its header tells its length.
[[nodiscard]] RecordCensus censusOf(const Drive& drive, const Requirements& requirements);
/// The codes of such a table.
template <class Entry>
[[nodiscard]] std::set<std::uint32_t> codesOf(const std::map<std::uint32_t, Entry>& table) {
    std::set<std::uint32_t> codes;
    for (const auto& [code, entry] : table)
        codes.insert(code);
    return codes;
}
/// How many records all codes have together.
[[nodiscard]] std::size_t countOf(const std::map<std::uint32_t, std::vector<Bytes>>& records);

/// The messages of a drive with unusual framing, or of a code without a table.
struct OddMessages {
    int tooShort = 0; ///< five bytes
    int wrongType = 0;
    int prefixed = 0;
    int unknownCode = 0;
};
/// Expects the prefixed ones to be good records.
[[nodiscard]] OddMessages unusualMessagesOf(const Drive& drive, const RecordCheck& good,
                                            const std::set<std::uint32_t>& codes);

/// Expects the same offsets and bytes.
void expectSame(const Drive& again, const Drive& first);
/// Expects ascending offsets, and time stamps that follow them.
void expectStampsFollow(const Drive& drive);
/// Expects so many messages a second.
void expectRate(const Drive& drive, std::chrono::seconds duration, double least, double most);
/// Expects a good record of each code.
void expectEachCode(const Drive& drive, const std::set<std::uint32_t>& codes, const RecordCheck& good);
/// Expects the three lists of the extra stream in the binary and the XML form: the SIM's a dictionary, the
/// others arrays. Calls `look` with each and its code, 0 to 2.
void expectExtraLists(const Drive& drive, const std::function<void(unsigned code, const Value& list)>& look);

/// What tells one drive from another: of most records nothing.
using Trait = std::function<std::optional<unsigned>(const LogMessage&)>;
[[nodiscard]] std::vector<unsigned> traitsOf(const Drive& drive, const Trait& trait);
/// How many of five seeds' drives differ in that, by their first two minutes.
template <class Kind>
[[nodiscard]] std::size_t differentDrives(const Trait& trait) {
    std::set<std::vector<unsigned>> drives;
    for (std::uint64_t seed = 1; seed <= 5; ++seed)
        drives.insert(traitsOf(driveOf<Kind>(seed, std::chrono::minutes(2)), trait));
    return drives.size();
}

/// The seeds with which a test tries more than one drive.
inline constexpr std::uint64_t severalSeeds[] = {1, 2, 3, 99};

} // namespace velmora
