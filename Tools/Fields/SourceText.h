// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The code of sources that are no log records.
inline constexpr std::uint32_t noCode = 0;

/// "0x512C", "0xFF0001" for the extra stream.
[[nodiscard]] std::string codeText(std::uint32_t code);

/// The shortest text that reads back as the same number.
[[nodiscard]] std::string numberText(double number);

/// The values of an enumeration or flag and their texts, then what every other value shows, a * in it for
/// that value: "0=Idle|1=Connected|*=[Reserved *]". Empty for any other field.
[[nodiscard]] std::string enumerationText(const Field& field);

template <class Texts>
[[nodiscard]] std::string joinedText(const Texts& texts, std::string_view separator) {
    std::string joined;
    std::string_view before;
    for (const std::string_view text : texts) {
        joined += before;
        joined += text;
        before = separator;
    }
    return joined;
}

} // namespace velmora
