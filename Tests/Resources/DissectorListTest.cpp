// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/OpenMessages.h"
#include "Tests/Recordings/ExampleRecording.h"
#include "Tests/Resources/Dissection.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <iomanip>
#include <sstream>
#include <string>
#include <vector>

/// The property lists in messages, as the Wireshark dissector shows them.

namespace velmora {
namespace {

using testing::HasSubstr;

constexpr Date from2001 = std::chrono::sys_days(std::chrono::year(2001) / 1 / 1);

/// How a value that is no list shows.
std::string shownValue(const Value& value) {
    if (const std::string* text = value.asString())
        return *text;
    if (const std::int64_t* number = value.asInteger())
        return std::to_string(*number);
    if (const bool* flag = value.asBoolean())
        return *flag ? "true" : "false";
    std::ostringstream words;
    if (const double* real = value.asReal()) {
        int digits = 15;
        do {
            words.str({});
            words << std::setprecision(digits) << *real;
        } while (std::strtod(words.str().c_str(), nullptr) != *real && ++digits <= 17);
    } else if (const Date* date = value.asDate()) {
        words << (*date - from2001).count() << ".000 s since 2001-01-01";
    } else if (const Data* data = value.asData()) {
        for (const std::uint8_t byte : data->bytes())
            words << std::hex << std::setw(2) << std::setfill('0') << unsigned{byte};
    } else {
        ADD_FAILURE() << "a value of kind " << nameOf(value.kind());
    }
    return words.str();
}

/// The keys of a list, and its other values, in their order.
struct ListTexts {
    std::string keys;
    std::string values;
    std::string all;

    void add(const Value& value) {
        if (const Dictionary* dictionary = value.asDictionary()) {
            for (const auto& [key, entry] : *dictionary) {
                put(keys, key);
                put(all, key);
                add(entry);
            }
        } else if (const Array* array = value.asArray()) {
            for (const Value& element : *array)
                add(element);
        } else {
            const std::string text = shownValue(value);
            put(values, text);
            put(all, text);
        }
    }

private:
    static void put(std::string& texts, const std::string& text) {
        texts += (texts.empty() ? "" : ";") + text;
    }
};

constexpr std::string_view binaryMarker = "bplist";

TEST(DissectorList, agreesOnEveryListOfTheRecordings) {
    NEEDS_PROGRAM("tshark");
    int binary = 0;
    int xml = 0;
    for (const ExampleRecording& recording : exampleRecordings()) {
        const std::string path = VELMORA_SOURCE_DIR "/Tests/Recordings/" + recording.fileName();
        const std::vector<std::string> found =
            dissectedFields(path, {"velmora.plist", "velmora.plist.key", "velmora.plist.value", "xml.cdata"});
        const auto reader = openMessages(path);
        ASSERT_TRUE(reader) << reader.reason();
        for (std::size_t i = 0; const auto message = (*reader)->next(); ++i) {
            ASSERT_LT(i, found.size());
            Bytes list = message->message.bytes();
            if (recording.scenario != "ifx") {
                const auto header = LogMessage::parse(list);
                if (!header || header->type != LogMessage::extraType) {
                    EXPECT_EQ(found[i], "\t\t\t");
                    continue;
                }
                list = header->payload();
            }
            const Result<Value> value = readPropertyList(list);
            ASSERT_TRUE(value) << value.reason();
            ListTexts texts;
            texts.add(*value);
            if (std::equal(binaryMarker.begin(), binaryMarker.end(), list.begin())) {
                ++binary;
                EXPECT_EQ(found[i], "binary\t" + texts.keys + "\t" + texts.values + "\t")
                    << "message " << i + 1 << " of " << path;
            } else {
                ++xml;
                EXPECT_EQ(found[i], "XML\t\t\t" + texts.all) << "message " << i + 1 << " of " << path;
            }
        }
    }
    EXPECT_GT(binary, 50);
    EXPECT_GT(xml, 50);
}

TEST(DissectorList, escapesWhatWouldDisturbATerminal) {
    NEEDS_PROGRAM("tshark");
    const std::string hostile =
        "a\x1b[1m\u009B\u200F\u202E\u061C\U000E0041\uFEFF e\u0301\u00FC\U0001F4E1\n\t\x7F";
    const std::string shown =
        "a\\x1B[1m\\u{9B}\\u{200F}\\u{202E}\\u{61C}\\u{E0041}\\u{FEFF} e\u0301\u00FC\U0001F4E1\\n\\t\\x7F";
    std::string marks = "e";
    for (int i = 0; i < 9; ++i)
        marks += "\u0301";
    const auto list =
        writeBinaryPropertyList(std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
            {hostile, hostile}, {"marks", marks}, {hostile + "2", std::make_shared<Array>()}}));
    ASSERT_TRUE(list) << list.reason();
    const TemporaryDirectory directory;
    const std::string path = directory / "a.pcapng";
    writeCapture(path, "IFX", std::vector<Data>{Data(std::vector<std::uint8_t>(*list))});
    std::string tree;
    for (const std::string& line : dissected(path, "-O velmora"))
        tree += line + "\n";
    EXPECT_THAT(tree, HasSubstr("        " + shown + ": " + shown + "\n"));
    EXPECT_THAT(tree, HasSubstr("        marks: " + marks.substr(0, 17) + "\\u{301}\n"));
    EXPECT_THAT(tree, HasSubstr("        " + shown + "2: 0 elements\n"));
    EXPECT_EQ(tree.find('\x1b'), std::string::npos);
    // What filters compare is the text itself.
    EXPECT_EQ(dissected(path, "-Y " + shellQuoted("velmora.plist.value == \"" + marks + "\"")).size(), 1U);

    writeCapture(path, hostile, std::vector<Data>{Data(std::vector<std::uint8_t>(*list))});
    tree.clear();
    for (const std::string& line : dissected(path, "-O velmora"))
        tree += line + "\n";
    EXPECT_THAT(tree, HasSubstr("Technology: " + shown));
}

/// A binary list of one object, an offset table of one byte and the trailer.
Data listOf(const char* object) {
    const Data head = hex("62706C6973743030");
    const Data content = hex(object);
    const auto tableAt = static_cast<std::uint8_t>(head.size() + content.size());
    const std::uint8_t last[] = {tableAt};
    return joined(head, content, hex("08"),
                  hex("000000000000 01 01 0000000000000001 0000000000000000 00000000000000"),
                  Data::copyOf(last));
}

struct ListRow {
    const char* what;
    Data list;
    const char* value;
    const char* expert;
};

TEST(DissectorList, showsEachKindOfValueAndMarksErrors) {
    NEEDS_PROGRAM("tshark");
    const ListRow rows[] = {
        {"false", listOf("08"), "false", ""},
        {"true", listOf("09"), "true", ""},
        {"a byte", listOf("10 FF"), "255", ""},
        {"four bytes", listOf("12 80000000"), "2147483648", ""},
        {"eight bytes have a sign", listOf("13 FFFFFFFFFFFFFFFE"), "-2", ""},
        {"a single", listOf("22 3FC00000"), "1.5", ""},
        {"a double", listOf("23 C004000000000000"), "-2.5", ""},
        {"a double of few decimal digits", listOf("23 C053A66666666666"), "-78.6", ""},
        {"a double of 17 digits", listOf("23 3FD3333333333334"), "0.30000000000000004", ""},
        {"a date", listOf("33 3FF8000000000000"), "1.500 s since 2001-01-01", ""},
        {"data", listOf("43 00FF7F"), "00ff7f", ""},
        {"text", listOf("53 616263"), "abc", ""},
        {"text of a counted length", listOf("5F 10 03 616263"), "abc", ""},
        {"UTF-16", listOf("61 00FC"), "\xC3\xBC", ""},
        {"ASCII in UTF-16", listOf("62 0061 0062"), "ab", ""},
        {"a wide character and a pair", listOf("63 4E2D D83D DCE1"), "\u4E2D\U0001F4E1", ""},
        {"half a pair", listOf("62 D83D 0061"), "\uFFFDa",
         "Property list cannot be read: a UTF-16 string has half a surrogate pair"},
        {"no ASCII", listOf("52 61FF"), "a\uFFFD",
         "Property list cannot be read: an ASCII string has other bytes"},
        {"16 bytes", listOf("14 00000000000000000000000000000001"), "",
         "Property list cannot be read: object of unknown kind 0x14 at 8"},
        {"text past the objects", listOf("54 616263"), "",
         "Property list cannot be read: 4 bytes at 9 pass the objects' end"},
        {"a count that is none", listOf("5F 20 03"), "", "Property list cannot be read: no count at 9"},
        {"an array of itself", listOf("A1 00"), "",
         "Property list cannot be read: nested deeper than 64 levels"},
        {"an array of what is not there", listOf("A1 01"), "", "Property list cannot be read: object 1 of 1"},
        {"a key that is a number", listOf("D1 00 00"), "",
         "Property list cannot be read: a key at 8 is no text"},
        {"cut off", hex("62706C6973743030 08"), "",
         "Property list cannot be read: 9 bytes, wanted at least 40"},
        {"a table outside",
         joined(hex("62706C6973743030 08 08"),
                hex("000000000000 01 01 0000000000000002 0000000000000000 0000000000000009")),
         "", "Property list cannot be read: its offset table is not inside it"},
        {"no list", hex("48656C6C6F"), "",
         "Property list cannot be read: 5 bytes that begin neither <?xml nor bplist00"},
    };
    std::vector<Data> messages;
    for (const ListRow& row : rows)
        messages.push_back(row.list);
    const TemporaryDirectory directory;
    const std::string path = directory / "a.pcapng";
    writeCapture(path, "IFX", messages);
    const std::vector<std::string> found =
        dissectedFields(path, {"velmora.plist.value", "_ws.expert.message"});
    ASSERT_EQ(found.size(), std::size(rows));
    for (std::size_t i = 0; i < found.size(); ++i)
        EXPECT_EQ(found[i], std::string(rows[i].value) + "\t" + rows[i].expert) << rows[i].what;
}

} // namespace
} // namespace velmora
