// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstdint>
#include <string>
#include <string_view>

namespace velmora::C2K {

/// An enumeration's texts whose fallback shows the value: "[Reserved 7]".
class NumberedTexts {
public:
    /// `before` and `after`: what the fallback has around the value.
    template <std::size_t N>
    consteval NumberedTexts(const EnumText (&table)[N], std::string_view before, std::string_view after)
        : _texts(table, ""), _before(before), _after(after) {}

    /// The value's text; in the fallback the value is a signed 32-bit number.
    [[nodiscard]] std::string operator[](std::uint32_t value) const;

private:
    EnumTexts _texts;
    std::string_view _before;
    std::string_view _after;
};

/// The band classes of both radio systems.
extern const NumberedTexts bandClasses;

} // namespace velmora::C2K
