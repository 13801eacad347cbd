// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ColumnSchema.h"
#include "Export/Columns/Parquet/FileMetadata.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// The least and the greatest of some values, as they are stored.
class ColumnRange {
public:
    explicit ColumnRange(StoredType type) : _type(type) {}

    void add(std::span<const std::uint64_t> words);
    void add(std::string_view text);

    /// Absent where there was no value that has an order (NaN has none), or the texts are too long to be
    /// worth it.
    [[nodiscard]] decltype(ColumnStatistics::range) result() const;

private:
    void addInteger(std::int64_t integer);
    void addNumber(double number);

    StoredType _type;
    bool _isEmpty = true;
    std::int64_t _leastInteger = 0;
    std::int64_t _greatestInteger = 0;
    double _leastNumber = 0;
    double _greatestNumber = 0;
    std::string_view _leastText;
    std::string_view _greatestText;
};

} // namespace velmora
