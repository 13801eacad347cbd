// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/SectionHarness.h"

#include "LogMessages/LogMessage.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <ostream>

namespace velmora {

std::string shown(const Value& value) {
    if (const std::string* text = value.asString())
        return "'" + *text + "'";
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

SectionHarness::SectionHarness(std::unique_ptr<Base> section, Value node)
    : _section(std::move(section)), _node(std::move(node)) {
    _section->updateSectionRef(_node);
}

SectionHarness& SectionHarness::update(const Data& record) {
    return update(record, logCodeOf(record));
}

SectionHarness& SectionHarness::update(const Data& record, std::uint32_t logCode) {
    CapturedLog log;
    _section->updateWithData(record, logCode);
    _lines = log.lines();
    return *this;
}

std::string SectionHarness::text(std::string_view label) const {
    const std::string* text = (*value().asDictionary())[label].asString();
    return text ? *text : "(none)";
}

std::vector<std::string> SectionHarness::errors() const {
    std::vector<std::string> texts;
    for (const CapturedLog::Line& line : _lines)
        if (line.priority == LogPriority::Error)
            texts.push_back(line.text);
    return texts;
}

std::uint32_t logCodeOf(const Data& record) {
    const Record header(record);
    return header.u16(3) + (header.u8(0) == 0xFF ? LogMessage::firstExtraCode : 0);
}

Data withByte(const Data& record, std::size_t offset, std::uint8_t value) {
    std::vector<std::uint8_t> bytes(record.bytes().begin(), record.bytes().end());
    bytes.at(offset) = value;
    return Data(std::move(bytes));
}

Data prefixOf(const Data& record, std::size_t length) {
    return Data::copyOf(record.bytes().first(length));
}

Data recordWith(std::uint16_t code, std::size_t length, std::initializer_list<ByteAt> bytes) {
    std::vector<std::uint8_t> payload(length - 13);
    for (const ByteAt& byte : bytes)
        payload.at(byte.offset - 13) = byte.value;
    return recordOf(code, payload);
}

void expectEnumeration(const std::function<SectionHarness()>& make, const Data& record, std::size_t offset,
                       std::string_view label, std::initializer_list<ExpectedText> table,
                       std::string_view fallback) {
    for (unsigned value = 0; value < 256; ++value) {
        std::string_view expected = fallback;
        for (const ExpectedText& row : table)
            if (row.value == value)
                expected = row.text;
        SectionHarness section = make();
        section.update(withByte(record, offset, static_cast<std::uint8_t>(value)));
        EXPECT_EQ(section.text(label), expected) << label << " of " << value;
    }
}

void expectFlag(const std::function<SectionHarness()>& make, const Data& record, std::size_t offset,
                std::string_view label, std::string_view set, std::string_view clear) {
    expectEnumeration(make, record, offset, label, {{0, clear}}, set);
}

void expectPrefixes(const std::function<SectionHarness()>& make, const Data& record, std::size_t minimum,
                    std::string_view trace, const std::function<std::string(std::size_t)>& expected) {
    ASSERT_GE(record.size(), minimum);
    for (std::size_t length = 0; length <= record.size(); ++length) {
        SCOPED_TRACE("a record cut to " + std::to_string(length) + " bytes");
        SectionHarness section = make();
        const std::string before = section.node();
        section.update(prefixOf(record, length), logCodeOf(record));
        if (length < minimum) {
            EXPECT_EQ(section.node(), before);
            EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(trace)}}));
        } else {
            EXPECT_EQ(section.node(), expected(length));
        }
    }
}

void expectPrefixes(const std::function<SectionHarness()>& make, const Data& record, std::size_t minimum,
                    std::string_view trace, const std::string& expected) {
    expectPrefixes(make, record, minimum, trace, [&expected](std::size_t) { return expected; });
}

Value cell(std::string_view technology, std::string_view type,
           std::initializer_list<Dictionary::Entry> numbers) {
    const DictionaryRef result = makeDictionary();
    if (!technology.empty())
        result->set("kVoxCellMonitorCellRadioAccessTechnology",
                    "kVoxCellMonitorRadioAccessTechnology" + std::string(technology));
    if (!type.empty())
        result->set("kVoxCellMonitorCellType", "kVoxCellMonitorCellType" + std::string(type));
    for (const Dictionary::Entry& number : numbers)
        result->set("kVoxCellMonitor" + number.key, number.value);
    return result;
}

Data cellInfo(std::initializer_list<Value> cells) {
    return extraRecord(1, std::make_shared<Array>(Array(cells)));
}

Data unreadableCellInfo() {
    return record(1, "6E 6F 70 65", 0xFF); // "nope"
}

void PrintTo(const CapturedLog::Line& line, std::ostream* out) {
    *out << '<' << line.priority << '>' << line.text;
}

} // namespace velmora
