// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/ParserHarness.h"

#include "LogGenerator/C2K/LookupWriter.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <ostream>

namespace velmora {

std::string shown(const Value& value) {
    if (const std::string* text = value.asString())
        return "'" + *text + "'";
    if (const std::int64_t* integer = value.asInteger())
        return std::to_string(*integer);
    std::string result;
    if (const Dictionary* dictionary = value.asDictionary()) {
        for (const auto& [key, entry] : *dictionary)
            result += (result.empty() ? "" : ", ") + key + " " + shown(entry);
        return "{" + result + "}";
    }
    if (const Array* array = value.asArray()) {
        for (const Value& element : *array)
            result += (result.empty() ? "" : ", ") + shown(element);
        return "[" + result + "]";
    }
    return "<" + std::string(nameOf(value.kind())) + ">";
}

const std::vector<std::string>& valueKeys() {
    static const std::vector<std::string> keys = {
        "kChannel",         "k1xEVDODeviceState",
        "kBandClass",       "kRxAGC0",
        "kRxAGC1",          "kTxAGC",
        "kServingPNOffset", "kSessionState",
        "kUATI24",          "kColorCode",
        "kActiveSetPilots", "kFingerC2I",
        "k1xDeviceState",   "k1xRx0BandClass",
        "k1xRx0ChanNum",    "k1xRxAGC0",
        "k1xRx1BandClass",  "k1xRx1ChanNum",
        "k1xRxAGC1",        "k1xTxAGC",
        "k1xActiveSetInfo", "k1xTrafficFER",
        "k1xRoamingHome",   "kSystemId",
        "kNetworkId",       "kPacketZoneId",
        "kBaseId",          "kProtocolRevision",
        "kFLDataRate",      "kRLDataRate",
    };
    return keys;
}

ParserHarness::ParserHarness() {
    state.set("ExtraInfo", makeDictionary());
    for (const std::string& key : valueKeys()) {
        const DictionaryRef target = makeDictionary();
        target->set("key", key);
        target->set("dict", _display);
        _lookup->set(key, std::make_shared<Array>(Array{target}));
    }
}

ParserHarness& ParserHarness::update(const Data& record) {
    CapturedLog log;
    const Record header(record);
    const C2K::LogCodeParser* parser = C2K::parserOfCode(header.u16(3));
    if (!parser)
        throw std::invalid_argument("a record that no parser takes");
    if (const std::optional<C2K::Reading> reading = parser->accept(header, state)) {
        C2K::LookupWriter writer(*_lookup);
        parser->decode(*reading, writer);
    }
    _lines = log.lines();
    return *this;
}

std::string ParserHarness::text(std::string_view valueKey) const {
    const std::string* text = (*_display)[valueKey].asString();
    return text ? *text : "(none)";
}

LogLines error(std::string text) {
    return {{LogPriority::Error, std::move(text)}};
}

Data withByte(const Data& record, std::size_t offset, std::uint8_t value) {
    return withFields(record, {{offset, 1, value}});
}

Data prefixOf(const Data& record, std::size_t length) {
    return Data::copyOf(record.bytes().first(length));
}

Data withFields(const Data& record, std::initializer_list<FieldAt> fields) {
    std::vector<std::uint8_t> bytes(record.bytes().begin(), record.bytes().end());
    for (const FieldAt& field : fields)
        for (std::size_t i = 0; i < field.width; ++i)
            bytes.at(field.offset + i) = static_cast<std::uint8_t>(field.value >> (8 * i));
    return Data(std::move(bytes));
}

Data recordWith(std::uint16_t code, std::size_t length, std::initializer_list<FieldAt> fields) {
    return withFields(recordOf(code, std::vector<std::uint8_t>(length - 13)), fields);
}

void expectEnumeration(const Data& record, std::size_t offset, std::string_view valueKey,
                       std::initializer_list<ExpectedText> table, std::string_view before,
                       std::string_view after) {
    for (unsigned value = 0; value < 256; ++value) {
        std::string expected(before);
        expected.append(std::to_string(value)).append(after);
        for (const ExpectedText& row : table)
            if (row.value == value)
                expected = row.text;
        ParserHarness parser;
        parser.update(withByte(record, offset, static_cast<std::uint8_t>(value)));
        EXPECT_EQ(parser.text(valueKey), expected) << valueKey << " of " << value;
        EXPECT_EQ(parser.lines(), LogLines());
    }
}

const std::initializer_list<ExpectedText> expectedBandClasses = {
    {0, "800 MHz cellular band [0]"},
    {1, "1.8 to 2.0GHz PCS band [1]"},
    {2, "872 to 960MHz TACS band [2]"},
    {3, "832 to 925MHz JTACS band [3]"},
    {4, "1.75 to 1.87GHz Korean PCS band [4]"},
    {5, "450MHz band [5]"},
    {6, "2GHz band [6]"},
    {7, "700MHz band [7]"},
    {8, "1800 MHz band [8]"},
    {9, "900 MHzband [9]"},
    {10, "Secondary 800 MHz band [10]"},
    {11, "400 MHz European PAMR band [11]"},
    {12, "800 MHz European PAMR band [12]"},
};

void PrintTo(const CapturedLog::Line& line, std::ostream* out) {
    *out << '<' << line.priority << '>' << line.text;
}

} // namespace velmora
