// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellFields.h"

#include "LogGenerator/ArrayLock.h"
#include "LogMessages/Record.h"
#include "Platform/SystemLog.h"

#include <array>

namespace velmora {

namespace {

std::int64_t part(std::int32_t number, CellNumber wanted) {
    switch (wanted) {
    case CellNumber::Low16: return static_cast<std::uint16_t>(number);
    case CellNumber::SignedLow16: return static_cast<std::int16_t>(number);
    case CellNumber::Whole: break;
    }
    return number;
}

constexpr std::size_t width = 4;
constexpr std::size_t maximumFields = 31;

/// What a cell is kept as until its fields are looked at: which of them it has, as a mask, then the numbers
/// in table order, all as 32 bits, little-endian.
class CellNumbers {
public:
    /// Writes the error lines.
    CellNumbers(const Cell& cell, std::span<const CellField> fields)
        : _length(lengthFor(fields)), _all((std::uint32_t{1} << fields.size()) - 1) {
        for (std::size_t i = 0; i < fields.size(); ++i) {
            if (const auto number = cell.number(fields[i].key)) {
                put(i + 1, static_cast<std::uint32_t>(*number));
                _mask |= std::uint32_t{1} << i;
            } else if (!fields[i].failure.empty()) {
                logLine(LogPriority::Error, fields[i].failure);
            }
        }
        put(0, _mask);
    }

    [[nodiscard]] static std::size_t lengthFor(std::span<const CellField> fields) {
        return width * (1 + fields.size());
    }
    [[nodiscard]] Bytes bytes() const { return Bytes(_bytes).first(_length); }
    [[nodiscard]] bool hasAllFields() const { return _mask == _all; }

    static void write(Dictionary& node, const Record& numbers, std::span<const CellField> fields) {
        const std::uint32_t mask = numbers.u32(0);
        for (std::size_t i = 0; i < fields.size(); ++i)
            if ((mask >> i & 1) != 0)
                writeValue(node, fields[i].label, fields[i].show,
                           part(numbers.i32(width * (1 + i)), fields[i].number));
    }

private:
    void put(std::size_t place, std::uint32_t number) {
        for (std::size_t i = 0; i < width; ++i)
            _bytes[width * place + i] = static_cast<std::uint8_t>(number >> 8 * i);
    }

    std::array<std::uint8_t, width*(1 + maximumFields)> _bytes{};
    std::size_t _length;
    std::uint32_t _mask = 0;
    std::uint32_t _all;
};

} // namespace

void writeCellFields(Dictionary* node, const Cell& cell, std::span<const CellField> fields) {
    constexpr auto write = [](Dictionary& target, Bytes bytes, const void* table) {
        CellNumbers::write(target, Record(bytes),
                           {static_cast<const CellField*>(table), bytes.size() / width - 1});
    };
    const CellNumbers numbers(cell, fields);
    if (!node)
        return;
    // Only what sets the same labels whatever the cell may wait.
    if (numbers.hasAllFields())
        node->writeLater({write, fields.data()}, numbers.bytes());
    else
        CellNumbers::write(*node, Record(numbers.bytes()), fields);
}

void writeCellRows(Array* node, const std::vector<Cell>& cells, const CellRows& table,
                   std::vector<std::uint8_t>& buffer) {
    constexpr auto write = [](Array& rows, Bytes bytes, const void* constant) {
        const auto fields = static_cast<const CellRows*>(constant)->fields;
        const std::size_t length = CellNumbers::lengthFor(fields);
        const CountedList entries(Record(bytes), 0, length, bytes.size() / length);
        for (std::size_t i = 0; i < entries.count(); ++i)
            CellNumbers::write(rows.appendRow(), entries[i], fields);
    };
    buffer.clear();
    for (const Cell& cell : cells) {
        if (cell.kind != table.kind)
            continue;
        const CellNumbers numbers(cell, table.fields);
        buffer.insert(buffer.end(), numbers.bytes().begin(), numbers.bytes().end());
    }
    if (node) {
        ArrayLock::Guard guard;
        node->writeLater({write, &table}, buffer);
    }
}

} // namespace velmora
