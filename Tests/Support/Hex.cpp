// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/Hex.h"

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"

#include <stdexcept>
#include <string>
#include <vector>

namespace velmora {

namespace {

int digitValue(char character) {
    if (character >= '0' && character <= '9')
        return character - '0';
    if (character >= 'a' && character <= 'f')
        return character - 'a' + 10;
    if (character >= 'A' && character <= 'F')
        return character - 'A' + 10;
    return -1;
}

} // namespace

Data hex(std::string_view text) {
    std::vector<std::uint8_t> bytes;
    for (std::size_t i = 0; i < text.size();) {
        if (text[i] == '#' || text.substr(i, 2) == "//") {
            const auto lineEnd = text.find('\n', i);
            i = lineEnd == std::string_view::npos ? text.size() : lineEnd;
        } else if (std::string_view(" \t\r\n").find(text[i]) != std::string_view::npos) {
            ++i;
        } else {
            const int high = digitValue(text[i]);
            const int low = i + 1 < text.size() ? digitValue(text[i + 1]) : -1;
            if (high < 0 || low < 0)
                throw std::invalid_argument("offset " + std::to_string(i) +
                                            " of the hexadecimal text holds \"" +
                                            std::string(text.substr(i, 2)) + "\", not two digits");
            bytes.push_back(static_cast<std::uint8_t>(high * 16 + low));
            i += 2;
        }
    }
    return Data(std::move(bytes));
}

Data recordOf(std::uint16_t code, Bytes payload, std::uint8_t type) {
    const std::size_t length = LogMessage::headerLength - 1 + payload.size();
    if (length > 0xFFFF)
        throw std::invalid_argument("a record's length of " + std::to_string(length) +
                                    " does not fit 16 bits");
    const auto header = LogMessage::header(type, code, payload.size());
    std::vector<std::uint8_t> bytes(header.begin(), header.end());
    bytes.insert(bytes.end(), payload.begin(), payload.end());
    return Data(std::move(bytes));
}

Data record(std::uint16_t code, std::string_view payloadHex, std::uint8_t type) {
    return recordOf(code, hex(payloadHex).bytes(), type);
}

Data extraRecord(std::uint16_t code, const Value& plist) {
    const auto xml = writeXMLPropertyList(plist);
    if (!xml)
        throw std::invalid_argument(xml.reason());
    return recordOf(code, Data(std::vector<std::uint8_t>(xml->begin(), xml->end())).bytes(),
                    LogMessage::extraType);
}

Data joined(std::initializer_list<Data> parts) {
    std::vector<std::uint8_t> bytes;
    for (const Data& part : parts)
        bytes.insert(bytes.end(), part.bytes().begin(), part.bytes().end());
    return Data(std::move(bytes));
}

} // namespace velmora
