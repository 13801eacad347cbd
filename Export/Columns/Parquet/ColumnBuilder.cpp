// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ColumnBuilder.h"

#include "Export/Columns/Parquet/BitPacking.h"
#include "Export/Columns/Parquet/ColumnRange.h"
#include "Export/Columns/Parquet/DifferenceEncoder.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

void appendPlain(std::vector<std::uint8_t>& out, std::span<const std::uint64_t> words) {
    out.reserve(out.size() + words.size() * sizeof(std::uint64_t));
    for (const std::uint64_t word : words)
        appendFixed(out, word);
}

void appendPlain(std::vector<std::uint8_t>& out, std::string_view text) {
    appendFixed(out, static_cast<std::uint32_t>(text.size()));
    out.insert(out.end(), text.begin(), text.end());
}

/// In bits. Wide ones are whole bytes: Zstandard, which works on bytes, then makes less of them than it makes
/// of those without gaps.
unsigned indexWidth(std::size_t entries) {
    constexpr unsigned narrow = 4;
    const auto width = static_cast<unsigned>(std::bit_width(entries - 1));
    return width > narrow ? (width + 7) / 8 * 8 : std::max(width, 1U);
}

} // namespace

void ColumnBuilder::setText(std::uint32_t row, std::string_view value) {
    setPresent(row);
    if (!_isPlain) {
        if (const std::optional<std::uint16_t> index = _texts.indexOf(value)) {
            _indices.push_back(*index);
            return;
        }
        expandTexts();
    }
    appendPlain(_plainBytes, value);
}

std::optional<std::size_t> ColumnBuilder::setTextOf(std::uint32_t row, const TextSource& source) {
    const auto slot = static_cast<std::size_t>(source.raw) % _textsOfRaw.size();
    const TextOfRaw& known = _textsOfRaw[slot];
    if (_isPlain || known.source != source)
        return std::nullopt;
    setPresent(row);
    _indices.push_back(known.index);
    return known.size;
}

void ColumnBuilder::setText(std::uint32_t row, std::string_view value, const TextSource& source,
                            std::size_t size) {
    setText(row, value);
    if (!_isPlain)
        _textsOfRaw[static_cast<std::size_t>(source.raw) % _textsOfRaw.size()] = {source, _indices.back(),
                                                                                  size};
}

void ColumnBuilder::setFlag(std::uint32_t row, bool value) {
    setPresent(row);
    _plainBytes.push_back(value ? 1 : 0);
}

void ColumnBuilder::setAllTexts(std::uint32_t rows, std::string_view value) {
    setText(0, value);
    _indices.assign(rows, 0);
    _present = rows;
    _rows = rows;
}

void ColumnBuilder::skipTo(std::uint32_t row) {
    _levels.put(1, _present);
    _levels.put(0, row - _rows);
    _nulls += row - _rows;
    _present = 0;
    _rows = row;
}

void ColumnBuilder::expandWords() {
    _isPlain = true;
    _plainWords.reserve(_indices.size() + 1);
    for (const std::uint16_t index : _indices)
        _plainWords.push_back(_words.values()[index]);
    _indices = {};
    _words = {};
}

void ColumnBuilder::expandTexts() {
    _isPlain = true;
    for (const std::uint16_t index : _indices)
        appendPlain(_plainBytes, _texts.at(index));
    _indices = {};
    _texts = {};
}

std::size_t ColumnBuilder::size() const {
    return _words.size() + _texts.size() + _indices.capacity() * sizeof(std::uint16_t) +
           _plainWords.capacity() * sizeof(std::uint64_t) + _plainBytes.capacity();
}

/// Not where most values are there once.
bool ColumnBuilder::isWorthDictionary() const {
    return _words.values().size() * 2 <= _indices.size() || _words.values().size() <= 2;
}

EncodedChunk ColumnBuilder::finish(std::uint32_t rows) {
    EncodedChunk chunk;
    if (_rows < rows)
        skipTo(rows);
    if (_column.schema.isNullable) {
        _levels.put(1, _present);
        const std::vector<std::uint8_t>& levels = _levels.finish();
        appendFixed(chunk.data, static_cast<std::uint32_t>(levels.size()));
        chunk.data.insert(chunk.data.end(), levels.begin(), levels.end());
    }
    chunk.statistics.nulls = _nulls;
    addValues(chunk);
    *this = ColumnBuilder(_column);
    return chunk;
}

void ColumnBuilder::addValues(EncodedChunk& chunk) {
    ColumnRange range(_column.schema.type);
    switch (_column.schema.type) {
    case StoredType::Boolean: {
        BitPacker packer(chunk.data);
        for (const std::uint8_t flag : _plainBytes)
            packer.put(flag, 1);
        packer.finish();
        break;
    }
    case StoredType::Integer:
    case StoredType::Number:
        if (!_indices.empty() && !isWorthDictionary())
            expandWords();
        range.add(_words.values());
        range.add(_plainWords);
        if (_column.isSequence) {
            chunk.encoding = PageEncoding::Differences;
            appendDifferences(chunk.data, std::span(reinterpret_cast<const std::int64_t*>(_plainWords.data()),
                                                    _plainWords.size()));
        } else if (!_indices.empty()) {
            appendPlain(chunk.dictionary, _words.values());
            addIndices(chunk, _words.values().size());
        } else {
            appendPlain(chunk.data, _plainWords);
        }
        break;
    case StoredType::Text:
        if (!_indices.empty()) {
            for (std::size_t i = 0; i < _texts.count(); ++i) {
                range.add(_texts.at(i));
                appendPlain(chunk.dictionary, _texts.at(i));
            }
            addIndices(chunk, _texts.count());
        } else {
            for (std::size_t at = 0; at < _plainBytes.size();) {
                const auto length = numberAt<std::uint32_t>(_plainBytes.data() + at, std::endian::little);
                at += sizeof length;
                range.add(std::string_view(reinterpret_cast<const char*>(_plainBytes.data()) + at, length));
                at += length;
            }
            chunk.data.insert(chunk.data.end(), _plainBytes.begin(), _plainBytes.end());
        }
        break;
    }
    // Bytes that are no text have none: readers take the ends of their range for texts.
    if (_column.schema.type != StoredType::Text || _column.schema.meaning == ValueMeaning::Text)
        chunk.statistics.range = range.result();
}

void ColumnBuilder::addIndices(EncodedChunk& chunk, std::size_t entries) const {
    chunk.encoding = PageEncoding::DictionaryIndex;
    chunk.dictionaryValues = entries;
    const unsigned width = indexWidth(entries);
    RunEncoder runs(width);
    runs.put(_indices);
    chunk.data.push_back(static_cast<std::uint8_t>(width));
    const std::vector<std::uint8_t>& encoded = runs.finish();
    chunk.data.insert(chunk.data.end(), encoded.begin(), encoded.end());
}

} // namespace velmora
