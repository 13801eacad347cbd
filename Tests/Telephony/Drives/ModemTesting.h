// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "Tests/Telephony/Drives/ScenarioTesting.h"

#include <cstdint>
#include <map>
#include <string_view>
#include <vector>

namespace velmora {

/// A message of the modem's drive that can be read.
struct ModemAccount {
    double at_s; ///< since the start
    std::uint32_t code;
    Value root;

    [[nodiscard]] const Value& operator[](std::string_view key) const { return (*root.asDictionary())[key]; }
    /// The whole number under the key; the default where there is none.
    [[nodiscard]] std::int64_t number(std::string_view key, std::int64_t otherwise = -100) const;
    /// The dictionaries of the array under the key.
    [[nodiscard]] std::vector<const Dictionary*> rows(std::string_view key) const;
};

/// Those of twenty minutes of seed 1, several rounds, without the unusual messages.
[[nodiscard]] const std::vector<ModemAccount>& modemAccounts();
/// The good message of the technology Modem; none of a record that is cut off or of the baseband's stream.
[[nodiscard]] Value modemRoot(const LogMessage& message);

/// The number under the key, whole or not; NaN where there is none.
[[nodiscard]] double numberOf(const Dictionary& dictionary, std::string_view key);

} // namespace velmora
