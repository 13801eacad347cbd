// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// One value of an enumeration and its text.
struct EnumText {
    std::uint32_t value;
    std::string_view text;
};

/// An enumeration's texts in ascending order of value, with gaps, and what every other value shows: one
/// fixed text, or the value itself (signed, 32 bits) between two texts, as in "[Reserved 7]".
class EnumTexts {
public:
    template <std::size_t N>
    consteval EnumTexts(const EnumText (&table)[N], std::string_view fallback)
        : rows(table), before(fallback) {
        expectAscending();
    }
    template <std::size_t N>
    consteval EnumTexts(const EnumText (&table)[N], std::string_view beforeValue, std::string_view afterValue)
        : rows(table), before(beforeValue), after(afterValue), showsOthers(true) {
        expectAscending();
    }
    /// Every value shows itself.
    consteval EnumTexts(std::string_view beforeValue, std::string_view afterValue)
        : before(beforeValue), after(afterValue), showsOthers(true) {}

    /// The row of the value, or null for one that shows the fallback.
    [[nodiscard]] constexpr const EnumText* find(std::uint32_t value) const {
        for (const EnumText& row : rows)
            if (row.value == value)
                return &row;
        return nullptr;
    }

    std::span<const EnumText> rows;
    std::string_view before; ///< the fallback, or its part before the value
    std::string_view after;
    bool showsOthers = false; ///< the fallback shows the value

private:
    consteval void expectAscending() const {
        for (std::size_t i = 1; i < rows.size(); ++i)
            if (rows[i].value <= rows[i - 1].value)
                throw "an enumeration table that does not ascend";
    }
};

} // namespace velmora
