// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Benchmarks/HandWritten/TimeText.h"
#include "Benchmarks/HandWritten/ValueTexts.h"
#include "Platform/Bytes.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace velmora {

/// Writes the JSON line of an LTE serving cell measurement (0xB17F) as one writes a program for this record
/// alone: the labels are constants, and the values are `Values<bits>` of a form. The bytes are those of
/// `velmora-log decode
/// --format jsonl --every message`.
template <template <unsigned> class Values>
class MeasurementLines {
public:
    static constexpr std::uint16_t code = 0xB17F;
    static constexpr std::size_t recordLength = 33;
    static constexpr std::size_t longestLine = 1024;

    /// Appends the line of a record; returns its end. A record that is too short shows what the one before it
    /// did, and must not be the first.
    char* append(char* to, std::uint64_t time_ns, Bytes record);

private:
    using Kind = ValueForm::Kind;

    TimeText _time;
    std::array<std::uint8_t, recordLength> _record{}; ///< what is shown
    Values<8> _number{{}};
    Values<9> _receivedPower{{Kind::Hundredths, 25, -14000, " dBm"}};
    Values<7> _receivedQuality{{Kind::Hundredths, 25, -3000, " dB"}};
    Values<9> _signalStrength{{Kind::Hundredths, 50, -14000, " dBm"}};
    Values<6> _accessLevel{{Kind::Whole, 2, -140, " dBm"}};
    Values<7> _power{{Kind::Whole, 1, -30, " dBm", 64}};
    Values<7> _selectionLevel{{Kind::Whole, 1, -30, " dBm"}};
    Values<6> _intraSearch{{Kind::Whole, 2, 0, " dB", 32}};
    Values<6> _nonIntraSearch{{Kind::Whole, 2, 0, " dBm", 32}};
    Values<1> _flag{{Kind::Flag}};
};

} // namespace velmora
