// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>

namespace velmora {

/// How values are stored (Parquet's physical types; the numbers are the format's).
enum class StoredType : std::uint8_t { Boolean = 0, Integer = 2, Number = 5, Text = 6 };

/// What the stored values mean.
enum class ValueMeaning : std::uint8_t {
    Plain,     ///< what is stored: a flag, a number, bytes
    Text,      ///< UTF-8
    Timestamp, ///< nanoseconds since 1970-01-01 00:00:00 UTC
    Degrees,   ///< a decimal number with `degreePlaces` places, as an integer
};

/// 1 cm on the ground, as far as any text of a position goes.
inline constexpr int degreePlaces = 7;

/// One column of a flat table.
struct ColumnSchema {
    std::string name;
    StoredType type = StoredType::Number;
    ValueMeaning meaning = ValueMeaning::Plain;
    bool isNullable = true;

    bool operator==(const ColumnSchema&) const = default;
};

} // namespace velmora
