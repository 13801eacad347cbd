// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ColumnRange.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <string>

namespace velmora {

namespace {

constexpr std::size_t longestText = 64;

std::string stored(std::uint64_t word) {
    std::string bytes;
    for (unsigned bits = 0; bits < 64; bits += 8)
        bytes.push_back(static_cast<char>(word >> bits));
    return bytes;
}

} // namespace

void ColumnRange::add(std::span<const std::uint64_t> words) {
    if (_type == StoredType::Number)
        for (const std::uint64_t word : words)
            addNumber(std::bit_cast<double>(word));
    else
        for (const std::uint64_t word : words)
            addInteger(static_cast<std::int64_t>(word));
}

void ColumnRange::addInteger(std::int64_t integer) {
    _leastInteger = _isEmpty ? integer : std::min(_leastInteger, integer);
    _greatestInteger = _isEmpty ? integer : std::max(_greatestInteger, integer);
    _isEmpty = false;
}

void ColumnRange::addNumber(double number) {
    if (std::isnan(number))
        return;
    _leastNumber = _isEmpty ? number : std::min(_leastNumber, number);
    _greatestNumber = _isEmpty ? number : std::max(_greatestNumber, number);
    _isEmpty = false;
}

void ColumnRange::add(std::string_view text) {
    // By the bytes as unsigned numbers, as std::string_view compares them.
    _leastText = _isEmpty ? text : std::min(_leastText, text);
    _greatestText = _isEmpty ? text : std::max(_greatestText, text);
    _isEmpty = false;
}

decltype(ColumnStatistics::range) ColumnRange::result() const {
    if (_isEmpty)
        return std::nullopt;
    switch (_type) {
    case StoredType::Integer:
        return std::pair(stored(static_cast<std::uint64_t>(_leastInteger)),
                         stored(static_cast<std::uint64_t>(_greatestInteger)));
    case StoredType::Number:
        // Both zeros lie between -0 and +0, whichever the values had.
        return std::pair(stored(std::bit_cast<std::uint64_t>(_leastNumber == 0 ? -0.0 : _leastNumber)),
                         stored(std::bit_cast<std::uint64_t>(_greatestNumber == 0 ? 0.0 : _greatestNumber)));
    case StoredType::Text:
        if (std::max(_leastText.size(), _greatestText.size()) > longestText)
            return std::nullopt;
        return std::pair(std::string(_leastText), std::string(_greatestText));
    case StoredType::Boolean: break;
    }
    return std::nullopt;
}

} // namespace velmora
