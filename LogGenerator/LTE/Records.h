// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstdint>

namespace velmora::LTE {

/// Records that several sections of this technology read. Offsets count from the record's first byte.
/// Precondition of every constructor: the record has the minimum length.

/// 0xB179, the intra-frequency measurement of connected mode: the serving cell, n neighbours, then m detected
/// cells.
class IntraFrequencyRecord {
public:
    static constexpr std::uint32_t code = 0xB179;
    static constexpr std::size_t minimumLength = 29;
    static constexpr Place neighbourCount = u8At(27);
    static constexpr Place detectedCount = u8At(28);
    static_assert(neighbourCount.end() <= minimumLength && detectedCount.end() <= minimumLength);
    static constexpr std::size_t neighbourLength = 6;
    static constexpr std::size_t detectedLength = 2;

    explicit IntraFrequencyRecord(const Record& record)
        : _neighbours(record, minimumLength, neighbourLength,
                      static_cast<std::size_t>(neighbourCount.read(record))),
          _detected(record, minimumLength + neighbourLength * _neighbours.count(), detectedLength,
                    static_cast<std::size_t>(detectedCount.read(record))) {}

    [[nodiscard]] const CountedList& neighbours() const { return _neighbours; }
    /// They lie after the counted neighbours, whether or not the record holds those.
    [[nodiscard]] const CountedList& detected() const { return _detected; }

private:
    CountedList _neighbours;
    CountedList _detected;
};

/// How 0xB179 shows a filtered level and quality, of the serving cell and of the neighbours alike. RSRP and
/// RSRQ are quantities of 3GPP TS 36.214 (5.1.1, 5.1.3); the scales are the modem's, not the steps of
/// TS 36.133 9.1.4 and 9.1.7. The quality's offset differs from that of the idle-mode records (-30), on
/// purpose.
inline constexpr TextFormat filteredRSRP = real("%4.2f dBm", 0.25, -140);
inline constexpr TextFormat filteredRSRQ = real("%4.2f dB", 0.125, -20);

/// 0xB180, the neighbours that idle mode measures: a header, then 1 to 32 cells.
class NeighborRecord {
public:
    static constexpr std::uint32_t code = 0xB180;
    static constexpr std::size_t minimumLength = 21;
    static constexpr Place countLessOne = bitsAt(19, 6, 5);
    static_assert(countLessOne.end() <= minimumLength);
    static constexpr std::size_t cellLength = 20;

    explicit NeighborRecord(const Record& record)
        : _cells(record, minimumLength, cellLength, static_cast<std::size_t>(countLessOne.read(record)) + 1) {
    }

    [[nodiscard]] const CountedList& cells() const { return _cells; }

private:
    CountedList _cells;
};

/// 0xB186, the reselection candidates: a header, then a header of four bytes a candidate. The fields of the
/// candidate's radio technology are read from after its header, where the next candidate's header lies: the
/// entries overlap, on purpose.
class ReselectionRecord {
public:
    static constexpr std::uint32_t code = 0xB186;
    static constexpr std::size_t minimumLength = 21;
    /// The low byte of a 16-bit field: 256 candidates count as none, on purpose.
    static constexpr Place count = u8At(19);
    static_assert(count.end() <= minimumLength);
    static constexpr std::size_t stride = 4;

    explicit ReselectionRecord(const Record& record) : _record(record) {}

    /// The candidates, seen as entries of `length` bytes each.
    [[nodiscard]] CountedList candidates(std::size_t length) const {
        return CountedList(_record, minimumLength, stride, length,
                           static_cast<std::size_t>(count.read(_record)));
    }

private:
    Record _record;
};

} // namespace velmora::LTE
