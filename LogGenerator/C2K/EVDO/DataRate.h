// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParser.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora::C2K {

/// The names under which one link's rate is shown and its counters are kept.
struct DataRateKeys {
    std::string_view sequence;  ///< in the state: the latest record's number
    std::string_view sent;      ///< in the state: the latest record's bits so far
    std::string_view sequence1; ///< in "ExtraInfo": a copy of these two
    std::string_view sent1;
    std::string_view sequence2; ///< in "ExtraInfo": those of the record before
    std::string_view sent2;
};

/// Keeps this record's counters in the state. The reading's number is the rate in kbit/s (of 1024 bits) since
/// the link's previous record; the first record has none. No reading where the record's number has not
/// increased. Counters that restart result in a negative rate. `sent`: bits so far; `sequence`: increases,
/// modulo 2^32.
[[nodiscard]] std::optional<Reading> updateDataRate(const DataRateKeys& keys, std::uint32_t sequence,
                                                    std::uint64_t sent, Dictionary& state);

/// Names the rate of such a reading; without a number an empty text.
void visitDataRate(const Field& rate, const Reading& reading, FieldVisitor& visitor);

} // namespace velmora::C2K
