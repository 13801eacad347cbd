// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/SIMFileBytes.h"

#include <string>

namespace velmora {

namespace {

constexpr std::uint8_t unused = 0xFF;
constexpr std::size_t networkLength = 3;

using File = std::vector<std::uint8_t>;

/// Four bytes and three of temporary identities and signatures.
void maskTemporary(std::span<std::uint8_t> bytes, NumberPseudonyms& numbers) {
    std::uint64_t value = 0;
    for (const std::uint8_t byte : bytes)
        value = value << 8 | byte;
    const auto width = static_cast<unsigned>(8 * bytes.size());
    value = numbers.number(PseudonymKind::Temporary, value, width, width);
    for (std::size_t i = bytes.size(); i > 0; --i, value >>= 8)
        bytes[i - 1] = static_cast<std::uint8_t>(value);
}

void maskArea(std::span<std::uint8_t> area, NumberPseudonyms& numbers) {
    maskNetwork(area.first(networkLength), numbers);
    const auto code = static_cast<unsigned>(area[3] << 8 | area[4]);
    const std::uint64_t masked = numbers.area(PseudonymKind::LocationArea, code, 16, 16);
    area[3] = static_cast<std::uint8_t>(masked >> 8);
    area[4] = static_cast<std::uint8_t>(masked);
    if (area.size() > 5)
        area[5] = static_cast<std::uint8_t>(numbers.area(PseudonymKind::RoutingArea, area[5], 8, 8));
}

} // namespace

void maskNetwork(std::span<std::uint8_t> network, NumberPseudonyms& numbers) {
    const auto low = [&](std::size_t i) -> unsigned { return network[i] & 0xF; };
    const auto high = [&](std::size_t i) -> unsigned { return network[i] >> 4; };
    unsigned digits[] = {low(0), high(0), low(1), low(2), high(2), high(1)};
    const bool hasThird = digits[5] < 10;
    for (std::size_t i = 0; i < (hasThird ? 6 : 5); ++i)
        if (digits[i] > 9)
            return;
    const unsigned country = numbers.countryCode(digits[0] * 100 + digits[1] * 10 + digits[2]);
    const unsigned code = numbers.networkCode(hasThird ? digits[3] * 100 + digits[4] * 10 + digits[5]
                                                       : digits[3] * 10 + digits[4]);
    digits[0] = country / 100;
    digits[1] = country / 10 % 10;
    digits[2] = country % 10;
    digits[3] = hasThird ? code / 100 : code / 10;
    digits[4] = hasThird ? code / 10 % 10 : code % 10;
    digits[5] = hasThird ? code % 10 : digits[5];
    network[0] = static_cast<std::uint8_t>(digits[1] << 4 | digits[0]);
    network[1] = static_cast<std::uint8_t>(digits[5] << 4 | digits[2]);
    network[2] = static_cast<std::uint8_t>(digits[4] << 4 | digits[3]);
}

namespace simFileBytes {

File other(Bytes file, Pseudonyms& pseudonyms) {
    File message{static_cast<std::uint8_t>(PseudonymKind::Data)};
    message.insert(message.end(), file.begin(), file.end());
    File result(file.size());
    fillKeyed(pseudonyms.hash, message, result, 256);
    for (std::size_t i = 0; i < file.size(); ++i)
        if (file[i] == unused)
            result[i] = unused;
    return result;
}

File iccid(Bytes file, Pseudonyms& pseudonyms) {
    constexpr std::size_t length = 10;
    std::string digits;
    for (const std::uint8_t byte : file)
        for (const int half : {byte & 0xF, byte >> 4})
            if (half < 10)
                digits += static_cast<char>('0' + half);
            else if (half != 0xF)
                return other(file, pseudonyms);
    if (file.size() != length)
        return other(file, pseudonyms);
    const std::string masked = pseudonyms.digits.iccid(digits);
    File result(file.begin(), file.end());
    auto next = masked.begin();
    for (std::uint8_t& byte : result) {
        const unsigned low = (byte & 0xFU) < 10 ? static_cast<unsigned>(*next++ - '0') : byte & 0xFU;
        const unsigned high = byte >> 4U < 10 ? static_cast<unsigned>(*next++ - '0') : byte >> 4U;
        byte = static_cast<std::uint8_t>(high << 4 | low);
    }
    return result;
}

File location(Bytes file, const MaskOptions& options, Pseudonyms& pseudonyms) {
    constexpr std::size_t circuitSwitchedLength = 11; // TMSI, LAI, time, status
    constexpr std::size_t packetSwitchedLength = 14;  // P-TMSI, its signature, RAI, status
    constexpr std::size_t temporaryLength = 4;
    constexpr std::size_t signatureLength = 3;
    const bool isPacketSwitched = file.size() == packetSwitchedLength;
    File result(file.begin(), file.end());
    if (!isPacketSwitched && file.size() != circuitSwitchedLength)
        return options.masksIdentities() ? other(file, pseudonyms) : result;
    const std::span<std::uint8_t> bytes(result);
    if (options.masksIdentities()) {
        maskTemporary(bytes.first(temporaryLength), pseudonyms.numbers);
        if (isPacketSwitched)
            maskTemporary(bytes.subspan(temporaryLength, signatureLength), pseudonyms.numbers);
    }
    if (options.masksAreas()) {
        if (isPacketSwitched)
            maskArea(bytes.subspan(temporaryLength + signatureLength, 6), pseudonyms.numbers);
        else
            maskArea(bytes.subspan(temporaryLength, 5), pseudonyms.numbers);
    }
    return result;
}

File networks(Bytes file, Pseudonyms& pseudonyms) {
    File result(file.begin(), file.end());
    for (std::size_t at = 0; at + networkLength <= result.size(); at += networkLength)
        maskNetwork(std::span(result).subspan(at, networkLength), pseudonyms.numbers);
    return result;
}

} // namespace simFileBytes

} // namespace velmora
