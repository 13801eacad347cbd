// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/Publisher.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <string_view>

namespace velmora::C2K {

/// The names under which one link's rate is shown and its counters are kept.
struct DataRateKeys {
    std::string_view value;     ///< the rate's value key
    std::string_view sequence;  ///< in the state: the latest record's number
    std::string_view sent;      ///< in the state: the latest record's bits so far
    std::string_view sequence1; ///< in "ExtraInfo": a copy of these two
    std::string_view sent1;
    std::string_view sequence2; ///< in "ExtraInfo": those of the record before
    std::string_view sent2;
};

/// Publishes the rate since the link's previous record and keeps this record's counters in the state.
/// `sent`: bits so far; `sequence`: counts on, modulo 2^32. The first record shows no rate (an empty text);
/// one whose number has not moved on leaves the rate as it is. Counters that start again show a negative
/// rate.
void updateDataRate(const DataRateKeys& keys, std::uint32_t sequence, std::uint64_t sent, Dictionary& state,
                    const Publisher& publisher);

} // namespace velmora::C2K
