// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <string_view>

/// The values of a live modem's messages (LogMessages/LiveModem.h), checked: what is of the wrong kind, not
/// finite or out of range is absent.
namespace velmora::LiveModem {

/// The numbers that a value may have, both ends included.
struct Range {
    double least = std::numeric_limits<double>::lowest();
    double most = std::numeric_limits<double>::max();

    [[nodiscard]] constexpr bool contains(double number) const { return number >= least && number <= most; }
};

/// An integer or a real.
[[nodiscard]] std::optional<double> numberOf(const Value& value, const Range& range = {});
/// The same where it is whole and a double holds it exactly.
[[nodiscard]] std::optional<std::int64_t> wholeNumberOf(const Value& value, const Range& range = {});
/// A text that is not empty; several of an array with ", " between them; a date in UTC; the hexadecimal
/// digits of bytes.
[[nodiscard]] std::optional<std::string> textOf(const Value& value);

/// The array under the key; an empty one where there is none.
[[nodiscard]] const Array& arrayIn(const Dictionary& dictionary, std::string_view key);
/// The dictionary; an empty one for a value of another kind.
[[nodiscard]] const Dictionary& dictionaryOf(const Value& value);

} // namespace velmora::LiveModem
