// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ColumnSchema.h"
#include "Export/Columns/Parquet/EncodedChunk.h"
#include "Export/Columns/Parquet/RunEncoder.h"
#include "Export/Columns/Parquet/TextDictionary.h"
#include "Export/Columns/Parquet/WordDictionary.h"

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// A column and how its values are kept.
struct TableColumn {
    ColumnSchema schema;
    /// Integers that mostly rise are stored as the differences between them, everything else by a dictionary,
    /// as long as that is worth it.
    bool isSequence = false;
};

/// The values of a column for a row group, in its rows' order. Rows without a value are null.
class ColumnBuilder {
public:
    explicit ColumnBuilder(const TableColumn& column) : _column(column) {}

    /// Whether the row has a value already.
    [[nodiscard]] bool hasRow(std::uint32_t row) const { return _rows > row; }

    // The value of the row, which is past all that have been set. Precondition: the column is of that type.
    void setNumber(std::uint32_t row, double value) { setWord(row, std::bit_cast<std::uint64_t>(value)); }
    void setInteger(std::uint32_t row, std::int64_t value) {
        setWord(row, static_cast<std::uint64_t>(value));
    }
    void setText(std::uint32_t row, std::string_view value);
    /// What a text is made from: the same makes the same text.
    struct TextSource {
        const void* format = nullptr;
        std::int64_t raw = 0;
        friend bool operator==(const TextSource&, const TextSource&) = default;
    };
    /// The same, which `setTextOf` finds again. `size` is what that returns.
    void setText(std::uint32_t row, std::string_view value, const TextSource& source, std::size_t size);
    /// Sets the text that an earlier row has got from the same source; absent, and nothing done, where that
    /// is not known any more.
    [[nodiscard]] std::optional<std::size_t> setTextOf(std::uint32_t row, const TextSource& source);
    void setFlag(std::uint32_t row, bool value);
    /// The same text in each of so many rows. Precondition: none has a value.
    void setAllTexts(std::uint32_t rows, std::string_view value);

    /// Bytes of memory.
    [[nodiscard]] std::size_t size() const;
    /// The column with so many rows. The builder is empty afterwards.
    [[nodiscard]] EncodedChunk finish(std::uint32_t rows);

private:
    void setWord(std::uint32_t row, std::uint64_t value) {
        setPresent(row);
        if (!_column.isSequence && !_isPlain) {
            if (const std::optional<std::uint16_t> index = _words.indexOf(value)) {
                _indices.push_back(*index);
                return;
            }
            expandWords();
        }
        _plainWords.push_back(value);
    }
    void setPresent(std::uint32_t row) {
        if (row != _rows)
            skipTo(row);
        ++_present;
        _rows = row + 1;
    }
    void skipTo(std::uint32_t row);
    /// The dictionary is full: the values are stored as they are, those so far as well.
    void expandWords();
    void expandTexts();
    [[nodiscard]] bool isWorthDictionary() const;
    void addValues(EncodedChunk& chunk);
    void addIndices(EncodedChunk& chunk, std::size_t entries) const;

    struct TextOfRaw {
        TextSource source;
        std::uint16_t index = 0; ///< in the dictionary
        std::size_t size = 0;
    };

    TableColumn _column;
    std::uint32_t _rows = 0;
    std::uint32_t _present = 0; ///< of the rows at the end, those that the levels lack
    std::uint32_t _nulls = 0;
    RunEncoder _levels{1};
    bool _isPlain = false;
    WordDictionary _words;
    TextDictionary _texts;
    std::array<TextOfRaw, 8> _textsOfRaw; ///< the latest of each remainder of the raw number
    std::vector<std::uint16_t> _indices;
    std::vector<std::uint64_t> _plainWords;
    std::vector<std::uint8_t> _plainBytes; ///< texts with their lengths; flags
};

} // namespace velmora
