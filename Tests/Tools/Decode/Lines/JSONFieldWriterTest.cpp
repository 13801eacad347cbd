// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/JSONFieldWriter.h"

#include "PropertyLists/Value.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

// What a record names as the JSON of a node, after the records before it.

namespace velmora {
namespace {

using Into = JSONFieldWriter::Into;

class JSONFieldWriterTest : public testing::Test {
    JSONTexts _texts;
    JSONFieldWriter _writer;

protected:
    std::string write(JSONNode& node, const std::function<void(FieldVisitor&)>& decode,
                      Into into = Into::Section) {
        _writer.begin(node, into);
        decode(_writer);
        _writer.end();
        return text(node);
    }
    std::string write(JSONNode& node, const Layout& layout, const std::vector<std::uint8_t>& bytes) {
        return write(node, [&](FieldVisitor& visitor) { visitor.fields(Record(Bytes(bytes)), layout); });
    }
    static std::string text(const JSONNode& node) {
        TextBuffer out;
        node.append(out);
        return std::string(out.view());
    }

    JSONNode dictionary{false, _texts};
    JSONNode array{true, _texts};
};

constexpr Field levelFields[] = {
    {"Cell", u8At(0), integer("%d")},
    {"Level \"1\"", u8At(1), real("%4.2f dBm", 0.5, -140)},
    {"Power", u8At(2), unless(64, "Not\tpresent", integer("%d dBm", -30))},
};
constexpr Layout levels = layout(3, levelFields);
constexpr const Field& cell = levelFields[0];
constexpr Field name{"Name", computed, plainText()};
constexpr Field number{"Number", computed, integer("%d")};
constexpr Field ratio{"Ratio", computed, real("%.1f dB")};
constexpr List cells{.label = "Cells"};
constexpr List ownRows{};

TEST_F(JSONFieldWriterTest, ATableIsADictionaryInItsOrder) {
    EXPECT_EQ(text(dictionary), "{}");
    EXPECT_EQ(write(dictionary, levels, {1, 90, 64}),
              R"({"Cell":"1","Level \"1\"":"-95.00 dBm","Power":"Not\tpresent"})");
}

TEST_F(JSONFieldWriterTest, ValuesOfOtherLengthsMoveWhatFollows) {
    write(dictionary, levels, {1, 90, 64});
    EXPECT_EQ(write(dictionary, levels, {100, 255, 64}),
              R"({"Cell":"100","Level \"1\"":"-12.50 dBm","Power":"Not\tpresent"})");
    EXPECT_EQ(write(dictionary, levels, {9, 255, 20}),
              R"({"Cell":"9","Level \"1\"":"-12.50 dBm","Power":"-10 dBm"})");
    EXPECT_EQ(write(dictionary, levels, {1, 90, 64}),
              R"({"Cell":"1","Level \"1\"":"-95.00 dBm","Power":"Not\tpresent"})");
}

TEST_F(JSONFieldWriterTest, EveryPlaceIsReadWhereverItLies) {
    static constexpr Field fields[] = {
        {"a", i8At(1), integer("%d")},           {"b", bitsAt(1, 1, 8), integer("%d")},
        {"c", u16BigEndianAt(8), integer("%d")}, {"d", u16At(8), integer("%d")},
        {"e", i16At(12), integer("%d")},         {"f", i32At(12), integer("%d")},
        {"g", u32At(11), integer("%u")},         {"h", bitsAt(13, 3, 19), integer("%d")},
        {"i", i8At(15), integer("%d")},          {"j", bitsAt(14, 7, 1), integer("%d")},
        {"k", u8At(0), integer("%d")},
    };
    static constexpr Layout places = layout(16, fields);
    EXPECT_EQ(write(dictionary, places,
                    {0x01, 0xFF, 0x80, 0x7F, 0xFE, 0xFF, 0x12, 0x34, 0x56, 0x78, 0x9A, 0xBC, 0xDE, 0xF0, 0x0F,
                     0xA5}),
              R"({"a":"-1","b":"127","c":"22136","d":"30806","e":"-3874","f":"-1525681954",)"
              R"("g":"267443900","h":"303614","i":"-91","j":"0","k":"1"})");
}

TEST_F(JSONFieldWriterTest, LabelsOfEarlierRecordsStay) {
    write(dictionary, [](FieldVisitor& visitor) {
        visitor.text(name, "first");
        visitor.number(number, 7);
    });
    EXPECT_EQ(write(dictionary,
                    [](FieldVisitor& visitor) {
                        visitor.real(ratio, -3.25);
                        visitor.text(name, "a name that is longer than a number's text may be");
                    }),
              R"({"Name":"a name that is longer than a number's text may be","Number":"7",)"
              R"("Ratio":"-3.2 dB"})");
}

TEST_F(JSONFieldWriterTest, ANumberCountsAgainAfterAText) {
    write(dictionary, [](FieldVisitor& visitor) { visitor.number(number, 7); });
    EXPECT_EQ(write(dictionary, [](FieldVisitor& visitor) { visitor.text(number, "N/A"); }),
              R"({"Number":"N/A"})");
    EXPECT_EQ(write(dictionary, [](FieldVisitor& visitor) { visitor.number(number, 7); }),
              R"({"Number":"7"})");
}

TEST_F(JSONFieldWriterTest, AFieldOfTheSameLabelReplacesTheValue) {
    static constexpr Field inTenths{"Number", computed, real("%.1f", 0.1)};
    write(dictionary, [](FieldVisitor& visitor) { visitor.number(number, 7); });
    EXPECT_EQ(write(dictionary, [](FieldVisitor& visitor) { visitor.number(inTenths, 7); }),
              R"({"Number":"0.7"})");
}

TEST_F(JSONFieldWriterTest, WhatIsRemovedComesBackAtTheEnd) {
    write(dictionary, levels, {1, 90, 64});
    EXPECT_EQ(write(dictionary, [](FieldVisitor& visitor) { visitor.removed("Cell"); }),
              R"({"Level \"1\"":"-95.00 dBm","Power":"Not\tpresent"})");
    EXPECT_EQ(write(dictionary, levels, {1, 255, 20}),
              R"({"Level \"1\"":"-12.50 dBm","Power":"-10 dBm","Cell":"1"})");
    EXPECT_EQ(write(dictionary, [](FieldVisitor& visitor) { visitor.removed("Unknown"); }),
              R"({"Level \"1\"":"-12.50 dBm","Power":"-10 dBm","Cell":"1"})");
}

TEST_F(JSONFieldWriterTest, AWholeAccountReplacesWhatThereWas) {
    write(dictionary, levels, {1, 90, 64});
    EXPECT_EQ(write(dictionary,
                    [](FieldVisitor& visitor) {
                        visitor.beginWhole();
                        visitor.text(name, "only");
                        visitor.number(cell, 1);
                        visitor.endWhole();
                    }),
              R"({"Name":"only","Cell":"1"})");
    EXPECT_EQ(write(dictionary,
                    [](FieldVisitor& visitor) {
                        visitor.beginWhole();
                        visitor.endWhole();
                    }),
              "{}");
}

void nameRows(FieldVisitor& visitor, const List& list, const std::vector<int>& numbers) {
    visitor.beginList(list);
    for (const int each : numbers) {
        visitor.beginRow();
        visitor.number(number, each);
        if (each > 10)
            visitor.text(name, "large");
        visitor.endRow();
    }
    visitor.endList();
}

TEST_F(JSONFieldWriterTest, AListReplacesTheOneBefore) {
    const auto rows = [this](const std::vector<int>& numbers) {
        return write(array, [&](FieldVisitor& visitor) { nameRows(visitor, ownRows, numbers); });
    };
    EXPECT_EQ(rows({1, 20}), R"([{"Number":"1"},{"Number":"20","Name":"large"}])");
    EXPECT_EQ(rows({30}), R"([{"Number":"30","Name":"large"}])");
    EXPECT_EQ(rows({}), "[]");
    EXPECT_EQ(rows({2, 3, 1}), R"([{"Number":"2"},{"Number":"3"},{"Number":"1"}])");
}

TEST_F(JSONFieldWriterTest, AListInADictionaryIsAmongItsLabels) {
    const auto named = [](const std::vector<int>& numbers) {
        return [numbers](FieldVisitor& visitor) {
            visitor.number(cell, static_cast<int>(numbers.size()));
            nameRows(visitor, cells, numbers);
            visitor.text(name, "end");
        };
    };
    EXPECT_EQ(write(dictionary, named({1})), R"({"Cell":"1","Cells":[{"Number":"1"}],"Name":"end"})");
    EXPECT_EQ(write(dictionary, named({})), R"({"Cell":"0","Cells":[],"Name":"end"})");
    EXPECT_EQ(write(dictionary, [](FieldVisitor& visitor) { visitor.removed("Cells"); }),
              R"({"Cell":"0","Name":"end"})");
}

TEST_F(JSONFieldWriterTest, ListsNestInRowsAndHoldValues) {
    const auto decode = [](int count) {
        return [count](FieldVisitor& visitor) {
            visitor.beginList(ownRows);
            visitor.beginRow();
            visitor.beginList(cells);
            for (int i = 0; i < count; ++i)
                visitor.number(number, i);
            visitor.endList();
            visitor.number(cell, count);
            visitor.endRow();
            visitor.endList();
        };
    };
    EXPECT_EQ(write(array, decode(2)), R"([{"Cells":["0","1"],"Cell":"2"}])");
    EXPECT_EQ(write(array, decode(1)), R"([{"Cells":["0"],"Cell":"1"}])");
}

TEST_F(JSONFieldWriterTest, WhatIsForANodeOfTheOtherKindIsIgnored) {
    EXPECT_EQ(write(array, levels, {1, 90, 64}), "[]");
    EXPECT_EQ(write(array, [](FieldVisitor& visitor) { nameRows(visitor, cells, {1}); }), "[]");
    EXPECT_EQ(write(dictionary, [](FieldVisitor& visitor) { nameRows(visitor, ownRows, {1}); }), "{}");
}

TEST_F(JSONFieldWriterTest, SuppliedValuesAreOfAnyKind) {
    const DictionaryRef context = makeDictionary();
    context->set("APN", "internet");
    context->set("ID", 5);
    EXPECT_EQ(write(dictionary,
                    [&](FieldVisitor& visitor) {
                        visitor.supplied(name, "a \"name\"");
                        visitor.supplied(number, Value(context));
                    }),
              R"({"Name":"a \"name\"","Number":{"APN":"internet","ID":5}})");
}

TEST_F(JSONFieldWriterTest, ValuesAreWhatThisMessagePublished) {
    constexpr static List pilots{"kPilots", List::Entries::Numbered, "(none)"};
    const auto published = [](const std::vector<std::uint16_t>& offsets) {
        return [offsets](FieldVisitor& visitor) {
            visitor.number(number, static_cast<std::int64_t>(offsets.size()));
            visitor.beginList(pilots);
            for (std::size_t i = 0; i < offsets.size(); ++i) {
                visitor.entryNumber(i, offsets[i]);
                visitor.real(ratio, -0.5);
            }
            visitor.endList();
        };
    };
    EXPECT_EQ(write(dictionary, published({12, 500}), Into::Values),
              R"({"Number":"2","kPilots":{"_sorted":"_sorted","0;12":"-0.5 dB","1;500":"-0.5 dB"}})");
    EXPECT_EQ(write(dictionary, published({}), Into::Values), R"-({"Number":"0","kPilots":"(none)"})-");
    EXPECT_EQ(write(dictionary, published({7}), Into::Values),
              R"({"Number":"1","kPilots":{"_sorted":"_sorted","0;7":"-0.5 dB"}})");
    const auto three = [](FieldVisitor& visitor) { visitor.number(number, 3); };
    EXPECT_EQ(write(dictionary, three, Into::Values), R"({"Number":"3"})");
    const auto nothing = [](FieldVisitor&) {};
    EXPECT_EQ(write(dictionary, nothing, Into::Values), "{}");
}

TEST_F(JSONFieldWriterTest, RecordsContinueANodeThatWasRead) {
    const DictionaryRef node = makeDictionary();
    node->set("Number", "7");
    node->set("Cells", makeArray());
    dictionary.read(node);
    EXPECT_EQ(text(dictionary), R"({"Number":"7","Cells":[]})");
    EXPECT_EQ(write(dictionary,
                    [](FieldVisitor& visitor) {
                        nameRows(visitor, cells, {1});
                        visitor.number(number, 8);
                    }),
              R"({"Number":"8","Cells":[{"Number":"1"}]})");
}

} // namespace
} // namespace velmora
