// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/BinaryCellReader.h"

#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/Extra/CellTexts.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

namespace velmora {
namespace {

Data ascii(std::string_view text) {
    return Data(std::vector<std::uint8_t>(text.begin(), text.end()));
}

/// A text object with its length in a byte of its own.
Data textObject(std::string_view text) {
    const auto length = static_cast<std::uint8_t>(text.size());
    return joined(hex("5F 10"), Data(std::vector<std::uint8_t>{length}), ascii(text));
}

Data bigEndian(std::size_t number, std::size_t width) {
    std::vector<std::uint8_t> bytes(width);
    for (std::size_t i = width; i-- > 0; number >>= 8)
        bytes[i] = static_cast<std::uint8_t>(number);
    return Data(std::move(bytes));
}

/// How a list is put together; what a test does not set is as a good list has it.
struct Form {
    std::size_t offsetWidth = 1;
    std::size_t referenceWidth = 1;
    std::size_t root = 0;
    std::size_t padding = 0;     ///< between the objects and their table
    std::size_t moreObjects = 0; ///< in the trailer's count
    std::size_t firstOffset = 8;
};

Data listOf(const std::vector<Data>& objects, const Form& form = {}) {
    Data body = ascii("bplist00");
    Data table;
    std::size_t offset = form.firstOffset;
    for (const Data& object : objects) {
        table = joined(table, bigEndian(offset, form.offsetWidth));
        offset += object.size();
        body = joined(body, object);
    }
    body = joined(body, Data(std::vector<std::uint8_t>(form.padding)));
    return joined({body, table, hex("00 00 00 00 00 00"), bigEndian(form.offsetWidth, 1),
                   bigEndian(form.referenceWidth, 1), bigEndian(objects.size() + form.moreObjects, 8),
                   bigEndian(form.root, 8), bigEndian(body.size(), 8)});
}

/// What the reader finds; "left" where it leaves the list to the property-list reader.
std::string readOf(const Data& list) {
    std::vector<Cell> cells;
    if (!readBinaryCells(list.bytes(), cells))
        return "left";
    EXPECT_TRUE(readPropertyList(list.bytes())); // which would have taken it
    return textOf(cells);
}

const Data oneCell = hex("A1 01");     // an array of object 1
const Data oneEntry = hex("D1 02 03"); // a dictionary: object 2 is object 3
const Data mcc = textObject("kVoxCellMonitorMCC");
const Data technology = textObject("kVoxCellMonitorCellRadioAccessTechnology");
const Data type = textObject("kVoxCellMonitorCellType");

struct ValueCase {
    const char* odd;
    const char* value; ///< of the one entry, in hexadecimal
    const char* cells;
};

class BinaryCellValueTest : public testing::TestWithParam<ValueCase> {};

TEST_P(BinaryCellValueTest, OfANumber) {
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, mcc, hex(GetParam().value)})), GetParam().cells);
}

INSTANTIATE_TEST_SUITE_P(
    , BinaryCellValueTest,
    testing::Values(ValueCase{"OneByteHasNoSign", "10 FF", "[4 2 MCC=255]"},
                    ValueCase{"TwoBytesHaveNoSign", "11 FF FE", "[4 2 MCC=65534]"},
                    ValueCase{"LargestOfFourBytes", "12 7F FF FF FF", "[4 2 MCC=2147483647]"},
                    ValueCase{"FourBytesThatDoNotFit", "12 80 00 00 00", "[4 2]"},
                    ValueCase{"EightBytesHaveASign", "13 FF FF FF FF FF FF FF D7", "[4 2 MCC=-41]"},
                    ValueCase{"SmallestOfEightBytes", "13 FF FF FF FF 80 00 00 00", "[4 2 MCC=-2147483648]"},
                    ValueCase{"EightBytesThatDoNotFit", "13 FF FF FF FF 7F FF FF FF", "[4 2]"},
                    ValueCase{"SixteenBytes", "14 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 07", "left"},
                    ValueCase{"NumberCutOff", "11 07", "left"}, ValueCase{"NumberWithoutBytes", "10", "left"},
                    ValueCase{"Text", "51 37", "[4 2]"}, ValueCase{"EmptyText", "50", "[4 2]"},
                    ValueCase{"TextCutOff", "52 37", "left"}, ValueCase{"LastOfASCII", "51 7F", "[4 2]"},
                    ValueCase{"BehindASCII", "51 80", "left"},
                    ValueCase{"TextOfTwoByteUnits", "61 00 37", "left"}, ValueCase{"Boolean", "09", "left"},
                    ValueCase{"LengthOfOneByte", "5F 10 01 37", "[4 2]"},
                    ValueCase{"LengthOfTwoBytes", "5F 11 00 01 37", "[4 2]"},
                    ValueCase{"LengthOfTwoBytesInOrder", "5F 11 01 00 37", "left"},
                    ValueCase{"LengthOfFourBytes", "5F 12 00 00 00 01 37", "left"},
                    ValueCase{"NoLength", "5F", "left"}, ValueCase{"LengthCutOff", "5F 10", "left"},
                    ValueCase{"LongLengthCutOff", "5F 11 00", "left"}),
    [](const auto& test) { return std::string(test.param.odd); });

/// So many references, of two bytes each, to one dictionary of 250 entries, all of the same key and number.
Data sharedCells(std::size_t references) {
    constexpr std::size_t entries = 250;
    Data array = joined(hex("AF 11"), bigEndian(references, 2));
    for (std::size_t i = 0; i < references; ++i)
        array = joined(array, bigEndian(1, 2));
    Data dictionary = hex("DF 10 FA");
    for (std::size_t i = 0; i < 2 * entries; ++i)
        dictionary = joined(dictionary, bigEndian(i < entries ? 2 : 3, 2));
    return listOf({array, dictionary, mcc, hex("10 07")}, {.offsetWidth = 2, .referenceWidth = 2});
}

TEST(BinaryCellReaderTest, CountsWhatIsReferredToSeveralTimes) {
    // The array, and 501 for each dictionary: 199 make 99,700 objects, 200 make 100,201.
    std::vector<Cell> cells;
    EXPECT_TRUE(readBinaryCells(sharedCells(199).bytes(), cells));
    EXPECT_EQ(cells.size(), 199U);
    cells.clear();
    EXPECT_FALSE(readBinaryCells(sharedCells(200).bytes(), cells));
    EXPECT_TRUE(readPropertyList(sharedCells(199).bytes(), messageLimits));
    EXPECT_FALSE(readPropertyList(sharedCells(200).bytes(), messageLimits));
}

TEST(BinaryCellReaderTest, TakesTextsOfUpTo64Characters) {
    const auto withText = [](std::size_t length) {
        return listOf({oneCell, oneEntry, mcc, textObject(std::string(length, 'x'))});
    };
    EXPECT_EQ(readOf(withText(64)), "[4 2]");
    EXPECT_EQ(readOf(withText(65)), "left");
}

TEST(BinaryCellReaderTest, TechnologyAndTypeAreTexts) {
    const Data gsm = textObject("kVoxCellMonitorRadioAccessTechnologyGSM");
    const Data neighbor = textObject("kVoxCellMonitorCellTypeNeighbor");
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, technology, gsm})), "[0 2]");
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, type, neighbor})), "[4 1]");
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, technology, hex("10 00")})), "left");
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, type, hex("10 00")})), "left");
}

TEST(BinaryCellReaderTest, OtherKeysAreReadAndLeftOut) {
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, textObject("Name"), hex("10 07")})), "[4 2]");
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, textObject("Name"), hex("51 37")})), "[4 2]");
    EXPECT_EQ(readOf(listOf({oneCell, oneEntry, hex("10 07"), hex("10 07")})), "left"); // a key is a text
}

TEST(BinaryCellReaderTest, TheLastValueOfADuplicateKeyIsUsed) {
    const Data twice = hex("D2 02 02 03 04");
    EXPECT_EQ(readOf(listOf({oneCell, twice, mcc, hex("10 07"), hex("10 08")})), "[4 2 MCC=8]");
    EXPECT_EQ(readOf(listOf({oneCell, twice, mcc, hex("10 07"), hex("51 37")})), "[4 2]");
}

TEST(BinaryCellReaderTest, TheRootIsAnArrayOfDictionaries) {
    EXPECT_EQ(readOf(listOf({hex("A0")})), "");
    EXPECT_EQ(readOf(listOf({hex("A1 01"), hex("D0")})), "[4 2]");
    EXPECT_EQ(readOf(listOf({hex("D0")})), "left");
    EXPECT_EQ(readOf(listOf({hex("A1 01"), hex("A0")})), "left");
    EXPECT_EQ(readOf(listOf({hex("D0"), hex("A1 00")}, {.root = 1})), "[4 2]");
}

TEST(BinaryCellReaderTest, ReferencesStayInsideTheList) {
    EXPECT_EQ(readOf(listOf({hex("A1 02"), hex("D0")})), "left");                     // the element
    EXPECT_EQ(readOf(listOf({oneCell, hex("D1 04 03"), mcc, hex("10 07")})), "left"); // the key
    EXPECT_EQ(readOf(listOf({oneCell, hex("D1 02 04"), mcc, hex("10 07")})), "left"); // the value
    EXPECT_EQ(readOf(listOf({hex("A0")}, {.root = 1})), "left");                      // the root
    EXPECT_EQ(readOf(listOf({hex("A1")})), "left");                                   // one is missing
    EXPECT_EQ(readOf(listOf({hex("A2 01"), hex("D0")})), "left");    // the second would be object 0xD0
    EXPECT_EQ(readOf(listOf({hex("A1 01"), hex("D1 00")})), "left"); // a value is missing
}

TEST(BinaryCellReaderTest, ObjectsLieBetweenMagicAndTable) {
    EXPECT_EQ(readOf(listOf({hex("A0")}, {.firstOffset = 7})), "left");
    EXPECT_EQ(readOf(listOf({hex("A0")}, {.firstOffset = 9})), "left");
    EXPECT_EQ(readOf(listOf({hex("00 A0")}, {.firstOffset = 9})), "");
    EXPECT_EQ(readOf(listOf({hex("A0")}, {.moreObjects = 1})), "left"); // the table would end in the trailer
}

struct WidthCase {
    std::size_t offsets;
    std::size_t references;
    const char* array;
    const char* cells;
};

TEST(BinaryCellReaderTest, OffsetsAndReferencesAreOneOrTwoBytesWide) {
    for (const WidthCase& c : {WidthCase{1, 1, "A1 01", "[4 2]"}, WidthCase{2, 1, "A1 01", "[4 2]"},
                               WidthCase{1, 2, "A1 00 01", "[4 2]"}, WidthCase{2, 2, "A1 00 01", "[4 2]"},
                               WidthCase{3, 1, "A1 01", "left"}, WidthCase{1, 3, "A1 00 00 01", "left"},
                               WidthCase{0, 1, "A1 01", "left"}, WidthCase{1, 0, "A1", "left"}})
        EXPECT_EQ(readOf(listOf({hex(c.array), hex("D0")},
                                {.offsetWidth = c.offsets, .referenceWidth = c.references})),
                  c.cells)
            << c.offsets << " and " << c.references;
}

TEST(BinaryCellReaderTest, OffsetsOfThreeBytesAreNotTakenForLongerOnes) {
    // Eight bytes from the table on are the number 8, where the empty array is.
    const char* const list = "62 70 6C 69 73 74 30 30 "  // "bplist00"
                             "A0 "                       // offset 8: an array of nothing
                             "00 00 00 "                 // the table: offset 0
                             "00 00 00 00 08 00 "        // the trailer's unused bytes
                             "03 01 "                    // widths of offsets and references
                             "00 00 00 00 00 00 00 01 "  // objects
                             "00 00 00 00 00 00 00 00 "  // the root's number
                             "00 00 00 00 00 00 00 09 "; // where the table begins
    EXPECT_EQ(readOf(hex(list)), "left");
}

TEST(BinaryCellReaderTest, TakesListsOfUpTo65536Bytes) {
    // Magic 8, array 1, padding, one offset of two bytes, trailer 32.
    EXPECT_EQ(readOf(listOf({hex("A0")}, {.offsetWidth = 2, .padding = 65536 - 43})), "");
    EXPECT_EQ(readOf(listOf({hex("A0")}, {.offsetWidth = 2, .padding = 65537 - 43})), "left");
}

TEST(BinaryCellReaderTest, ShortestListIsMagicAndTrailer) {
    const Data list = listOf({hex("A0")});
    for (std::size_t length = 0; length < list.size(); ++length)
        EXPECT_EQ(readOf(Data::copyOf(list.bytes().first(length))), "left") << length;
    EXPECT_EQ(readOf(list), "");
}

TEST(BinaryCellReaderTest, ReadsManyObjects) {
    // 300 cells with a key, a number and a text of their own each: more objects than a byte counts.
    const ArrayRef cells = makeArray();
    std::string expected;
    for (int i = 0; i < 300; ++i) {
        const DictionaryRef fields = makeDictionary();
        fields->set("kVoxCellMonitorMCC", i);
        fields->set("Name " + std::to_string(i), "x");
        cells->append(fields);
        expected += "[4 2 MCC=" + std::to_string(i) + "]";
    }
    EXPECT_EQ(readOf(Data(*writeBinaryPropertyList(cells))), expected);
}

} // namespace
} // namespace velmora
