// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstdint>

namespace velmora::OstrelGSM {

/// 0x417A, the UMTS searcher's cells, as the four sets read it. All cell entries come first, then as many
/// measurement entries, the i-th of which belongs to the i-th cell. Powers and set types are as the modem
/// reports them.
///
/// Precondition: the record has the minimum length.
class SearcherRecord {
public:
    static constexpr std::uint32_t code = 0x417A;
    static constexpr std::size_t minimumLength = 16;
    static constexpr std::size_t cellLength = 15;
    static constexpr std::size_t measurementLength = 44;

    /// In a cell entry: the primary scrambling code (3GPP TS 25.213 5.2.2); set type 0 is the active set.
    static constexpr Place scramblingCode = bitsAt(7, 0, 13);
    static constexpr Place setType = bitsAt(8, 5, 3);
    static_assert(scramblingCode.end() <= cellLength && setType.end() <= cellLength);

    /// In a measurement entry: three linear values of CPICH Ec/No (a quantity of 3GPP TS 25.215) on the
    /// modem's own scale (see Base::lookUpECNO).
    static constexpr Place energies[] = {u32At(32), u32At(36), u32At(40)};
    static_assert(energies[2].end() <= measurementLength);

    explicit SearcherRecord(const Record& record)
        : _power(record.i16(13)), _cells(record, minimumLength, cellLength, record.u8(15)),
          _measurements(record, minimumLength + cellLength * _cells.count(), measurementLength,
                        _cells.count()) {}

    /// The received power term, in tenths of a dB.
    [[nodiscard]] int power() const { return _power; }
    [[nodiscard]] const CountedList& cells() const { return _cells; }
    [[nodiscard]] const CountedList& measurements() const { return _measurements; }

    /// A measurement's Ec/No: the first of its three values that is not zero.
    [[nodiscard]] static std::uint32_t energy(const Record& measurement) {
        for (const Place& place : energies)
            if (const std::int64_t value = place.read(measurement); value != 0)
                return static_cast<std::uint32_t>(value);
        return 0;
    }

private:
    std::int16_t _power;
    CountedList _cells;
    CountedList _measurements;
};

} // namespace velmora::OstrelGSM
