// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/DisplayWriter.h"

#include "Tests/LogGenerator/SectionHarness.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace velmora {
namespace {

constexpr List rows{};
constexpr List nested{"Inner", List::Entries::Values, ""};
constexpr Field a{"A", computed, integer("%d")};
constexpr Field b{"B", computed, integer("%d")};
constexpr Field value{"", computed, integer("%d")};
constexpr Field level{"Level", computed, real("%.1f dB")};
constexpr Field name{"Name", computed, plainText()};

/// A list node and what the section keeps beside it.
class ListWriting {
public:
    /// Writes a row for each of the texts: its letters choose the fields, in their order.
    std::string write(const std::vector<std::string>& letters) {
        DisplayWriter writer(*node, spare);
        writer.beginList(rows);
        for (const std::string& row : letters) {
            writer.beginRow();
            for (const char letter : row)
                writer.number(letter == 'a' ? a : b, letter);
            writer.endRow();
        }
        writer.endList();
        return shown(node);
    }

    ArrayRef node = makeArray();
    DisplayWriter::SpareRows spare;
};

TEST(DisplayWriterTest, WritesUnderLabelsAndKeepsTheirOrder) {
    const DictionaryRef node = makeDictionary();
    DisplayWriter::SpareRows spare;
    DisplayWriter writer(*node, spare);
    writer.number(b, 2);
    writer.text(name, "x");
    writer.real(level, -0.25);
    writer.number(a, 1);
    writer.number(b, 3);
    EXPECT_EQ(shown(node), "{B '3', Name 'x', Level '-0.2 dB', A '1'}");
    writer.removed("Name");
    writer.removed("Absent");
    EXPECT_EQ(shown(node), "{B '3', Level '-0.2 dB', A '1'}");
}

TEST(DisplayWriterTest, AWholeAccountReplacesWhatThereWasInItsOwnOrder) {
    constexpr List list{"List", List::Entries::Values, ""};
    const DictionaryRef node = makeDictionary();
    DisplayWriter::SpareRows spare;
    const auto write = [&](std::string_view letters) {
        DisplayWriter writer(*node, spare);
        writer.beginWhole();
        for (const char letter : letters) {
            if (letter == 'l') {
                writer.beginList(list);
                writer.number(value, 7);
                writer.endList();
            } else {
                writer.number(letter == 'a' ? a : b, letter);
            }
        }
        writer.endWhole();
        return shown(node);
    };
    EXPECT_EQ(write("b"), "{B '98'}");
    EXPECT_EQ(write("alb"), "{A '97', List ['7'], B '98'}"); // B, which was there first, is last
    EXPECT_EQ(write("lb"), "{List ['7'], B '98'}");
    EXPECT_EQ(write("ab"), "{A '97', B '98'}");
    EXPECT_EQ(write(""), "{}");
}

TEST(DisplayWriterTest, AWholeAccountLeavesANodeOfTheOtherKindAlone) {
    ListWriting list;
    list.write({"a"});
    DisplayWriter writer(*list.node, list.spare);
    writer.beginWhole();
    writer.number(a, 1);
    writer.endWhole();
    EXPECT_EQ(shown(list.node), "[{A '97'}]");
}

TEST(DisplayWriterTest, SuppliedValuesStandAsTheyAre) {
    const DictionaryRef node = makeDictionary();
    const ArrayRef list = makeArray();
    DisplayWriter::SpareRows spare;
    DisplayWriter writer(*node, spare);
    writer.supplied(name, list);
    EXPECT_EQ((*node)["Name"].asArray(), list.get());
    writer.supplied(name, "text");
    EXPECT_EQ(shown(node), "{Name 'text'}");
}

TEST(DisplayWriterTest, FieldsOfADictionaryGoNowhereInAListAndTheReverse) {
    ListWriting list;
    list.write({"a"});
    DisplayWriter intoList(*list.node, list.spare);
    intoList.removed("A");
    EXPECT_EQ(shown(list.node), "[{A '97'}]");
    const DictionaryRef node = makeDictionary();
    DisplayWriter intoDictionary(*node, list.spare);
    intoDictionary.beginList(rows);
    intoDictionary.beginRow();
    intoDictionary.number(a, 1);
    intoDictionary.endRow();
    intoDictionary.endList();
    EXPECT_EQ(shown(node), "{}");
}

TEST(DisplayWriterTest, AListIsWrittenOverTheOneBefore) {
    ListWriting list;
    EXPECT_EQ(list.write({"ab", "a", "b"}), "[{A '97', B '98'}, {A '97'}, {B '98'}]");
    EXPECT_EQ(list.write({"ba"}), "[{B '98', A '97'}]");
    EXPECT_EQ(list.write({}), "[]");
    EXPECT_EQ(list.write({"", "ab"}), "[{}, {A '97', B '98'}]");
}

TEST(DisplayWriterTest, RowsThatNothingElseRefersToAreFilledAgain) {
    ListWriting list;
    list.write({"ab", "ab"});
    const Dictionary* const first = (*list.node)[0].asDictionary();
    const Dictionary* const second = (*list.node)[1].asDictionary();
    list.write({"a"});
    EXPECT_EQ((*list.node)[0].asDictionary(), first);
    list.write({"a", "b"});
    EXPECT_EQ((*list.node)[1].asDictionary(), second);
}

TEST(DisplayWriterTest, RowsThatAreHeldElsewhereStayWhatTheyAre) {
    ListWriting list;
    list.write({"a", "b"});
    const Value held = (*list.node)[0];
    const Value copy = Value(list.node).copy();
    EXPECT_EQ(list.write({"ab"}), "[{A '97', B '98'}]");
    EXPECT_EQ(list.write({"b", "b"}), "[{B '98'}, {B '98'}]");
    EXPECT_EQ(shown(held), "{A '97'}");
    EXPECT_EQ(shown(copy), "[{A '97'}, {B '98'}]");
}

TEST(DisplayWriterTest, ListsNestInRows) {
    ListWriting list;
    for (const int count : {2, 3, 0}) {
        DisplayWriter writer(*list.node, list.spare);
        writer.beginList(rows);
        writer.beginRow();
        writer.number(a, 1);
        writer.beginList(nested);
        for (int i = 0; i < count; ++i)
            writer.number(value, i);
        writer.endList();
        writer.number(b, 2);
        writer.endRow();
        writer.endList();
        const std::string inner = count == 2 ? "['0', '1']" : count == 3 ? "['0', '1', '2']" : "[]";
        EXPECT_EQ(shown(list.node), "[{A '1', Inner " + inner + ", B '2'}]");
    }
}

TEST(DisplayWriterTest, AListThatIsHeldElsewhereStaysWhatItIs) {
    const DictionaryRef node = makeDictionary();
    Value earlier;
    for (const int number : {1, 2}) {
        DisplayWriter::SpareRows spare;
        DisplayWriter writer(*node, spare);
        writer.beginList(nested);
        writer.number(value, number);
        writer.endList();
        if (number == 1)
            earlier = (*node)["Inner"];
    }
    EXPECT_EQ(shown(earlier), "['1']");
    EXPECT_EQ(shown(node), "{Inner ['2']}");
}

} // namespace
} // namespace velmora
