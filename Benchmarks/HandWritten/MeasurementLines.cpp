// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/HandWritten/MeasurementLines.h"

#include <charconv>
#include <cstring>

namespace velmora {

namespace {

template <std::size_t size>
char* put(char* to, const char (&text)[size]) {
    std::memcpy(to, text, size - 1);
    return to + size - 1;
}

/// `width` bits of `word` from `bit` on.
unsigned bitsOf(std::uint32_t word, unsigned bit, unsigned width) {
    return word >> bit & ((1u << width) - 1);
}

} // namespace

template <template <unsigned> class Values>
char* MeasurementLines<Values>::append(char* to, std::uint64_t time_ns, Bytes record) {
    if (record.size() >= recordLength)
        std::memcpy(_record.data(), record.data(), recordLength);
    const auto cell = numberAt<std::uint16_t>(&_record[19], std::endian::little);
    const auto levels = numberAt<std::uint32_t>(&_record[21], std::endian::little);
    const auto limits = numberAt<std::uint32_t>(&_record[25], std::endian::little);
    const auto selection = numberAt<std::uint32_t>(&_record[29], std::endian::little);

    to = put(to, "{\"time\":\"");
    to = _time.append(to, time_ns);
    to = put(to, "\",\"code\":45439,\"sections\":{\"Serving Cell Measurements\":{\"Version\":\"");
    to = _number.append(to, _record[13]);
    to = put(to, ",\"E-ARFCN\":\"");
    to = std::to_chars(to, to + 5, numberAt<std::uint16_t>(&_record[17], std::endian::little)).ptr;
    to = put(to, "\",\"Physical Cell ID\":\"");
    to = std::to_chars(to, to + 3, bitsOf(cell, 0, 9)).ptr;
    to = put(to, "\",\"Serving Layer Priority\":\"");
    to = _number.append(to, bitsOf(cell, 9, 4));
    to = put(to, ",\"Measured RSRP\":\"");
    to = _receivedPower.append(to, bitsOf(levels, 0, 9));
    to = put(to, ",\"Average RSRP\":\"");
    to = _receivedPower.append(to, bitsOf(levels, 9, 9));
    to = put(to, ",\"Measured RSRQ\":\"");
    to = _receivedQuality.append(to, bitsOf(levels, 18, 7));
    to = put(to, ",\"Average RSRQ\":\"");
    to = _receivedQuality.append(to, bitsOf(levels, 25, 7));
    to = put(to, ",\"Measured RSSI\":\"");
    to = _signalStrength.append(to, bitsOf(limits, 0, 9));
    to = put(to, ",\"Qrxlevmin\":\"");
    to = _accessLevel.append(to, bitsOf(limits, 9, 6));
    to = put(to, ",\"P_Max\":\"");
    to = _power.append(to, bitsOf(limits, 15, 7));
    to = put(to, ",\"Max UE Tx Power\":\"");
    to = _power.append(to, bitsOf(limits, 22, 6));
    to = put(to, ",\"Srxlev\":\"");
    to = _selectionLevel.append(to, bitsOf(selection, 0, 7));
    to = put(to, ",\"Num of Consecutive DRX Cycles of S < 0\":\"");
    to = _number.append(to, bitsOf(selection, 7, 6));
    to = put(to, ",\"S Intra Search\":\"");
    to = _intraSearch.append(to, bitsOf(selection, 13, 6));
    to = put(to, ",\"S Non Intra Search\":\"");
    to = _nonIntraSearch.append(to, bitsOf(selection, 19, 6));
    to = put(to, ",\"Measurement Rules Updated\":\"");
    to = _flag.append(to, bitsOf(selection, 25, 1));
    to = put(to, ",\"Measurement Rules\":\"");
    to = _number.append(to, bitsOf(selection, 26, 4));
    return put(to, "}}}\n");
}

template class MeasurementLines<ValueTexts>;
template class MeasurementLines<WrittenValues>;

} // namespace velmora
