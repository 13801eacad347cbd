// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/XMLCellReader.h"

#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/Extra/CellTexts.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

namespace velmora {
namespace {

const std::string head = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">\n";
const std::string mcc = "<key>kVoxCellMonitorMCC</key>";
const std::string mnc = "<key>kVoxCellMonitorMNC</key>";

std::string listOf(const std::string& cells, const std::string& behind = "\n") {
    return head + "<array>" + cells + "</array>\n</plist>" + behind;
}

std::string cellOf(const std::string& entries) {
    return "<dict>" + entries + "</dict>";
}

/// What the reader finds, learning as it goes and then by what it has learnt; "left" where it leaves the list
/// to the property-list reader.
std::string readOf(const std::string& list) {
    XMLCellReader reader;
    std::string outcomes[2];
    for (std::string& outcome : outcomes) {
        std::vector<Cell> cells;
        outcome = reader.read(list, cells) ? textOf(cells) : "left";
    }
    EXPECT_EQ(outcomes[0], outcomes[1]);
    if (outcomes[0] != "left") { // that reader would have taken it
        EXPECT_TRUE(readPropertyList({reinterpret_cast<const std::uint8_t*>(list.data()), list.size()}));
    }
    return outcomes[0];
}

struct NumberCase {
    const char* odd;
    const char* text;
    const char* cells;
};

class XMLCellNumberTest : public testing::TestWithParam<NumberCase> {};

TEST_P(XMLCellNumberTest, IsRead) {
    const std::string number = "<integer>" + std::string(GetParam().text) + "</integer>";
    EXPECT_EQ(readOf(listOf(cellOf(mcc + number))), GetParam().cells);
}

INSTANTIATE_TEST_SUITE_P(
    , XMLCellNumberTest,
    testing::Values(NumberCase{"AllDigits", "1234567890", "[4 2 MCC=1234567890]"},
                    NumberCase{"Zero", "0", "[4 2 MCC=0]"}, NumberCase{"Negative", "-41", "[4 2 MCC=-41]"},
                    NumberCase{"Largest", "2147483647", "[4 2 MCC=2147483647]"},
                    NumberCase{"Smallest", "-2147483648", "[4 2 MCC=-2147483648]"},
                    NumberCase{"TooLarge", "2147483648", "[4 2]"},
                    NumberCase{"EighteenDigits", "000000000000000007", "[4 2 MCC=7]"},
                    NumberCase{"EighteenDigitsAndASign", "-000000000000000007", "[4 2 MCC=-7]"},
                    NumberCase{"NineteenDigits", "0000000000000000007", "left"},
                    NumberCase{"None", "", "left"}, NumberCase{"SignAlone", "-", "left"},
                    NumberCase{"BeforeTheDigits", "/", "left"}, NumberCase{"BehindTheDigits", ":", "left"},
                    NumberCase{"Blank", " 7", "left"}),
    [](const auto& test) { return std::string(test.param.odd); });

struct TextCase {
    const char* odd;
    std::string text;
    const char* cells;
};

TEST(XMLCellReaderTest, TextsArePlain) {
    for (const TextCase& c :
         {TextCase{"first and last", " ~", "[4 2 MNC=1]"}, TextCase{"empty", "", "[4 2 MNC=1]"},
          TextCase{"a tabulator", "\t", "left"}, TextCase{"behind the last", "\x7F", "left"},
          TextCase{"an entity", "&amp;", "left"}, TextCase{"a bracket", ">", "left"}})
        EXPECT_EQ(
            readOf(listOf(cellOf(mcc + "<string>" + c.text + "</string>" + mnc + "<integer>1</integer>"))),
            c.cells)
            << c.odd;
}

TEST(XMLCellReaderTest, TechnologyAndTypeAreTexts) {
    const std::string technology = "<key>kVoxCellMonitorCellRadioAccessTechnology</key>";
    const std::string type = "<key>kVoxCellMonitorCellType</key>";
    EXPECT_EQ(readOf(listOf(cellOf(technology + "<string>kVoxCellMonitorRadioAccessTechnologyLTE</string>"))),
              "[3 2]");
    EXPECT_EQ(readOf(listOf(cellOf(type + "<string>kVoxCellMonitorCellTypeNeighbor</string>"))), "[4 1]");
    EXPECT_EQ(readOf(listOf(cellOf(technology + "<integer>0</integer>"))), "left");
    EXPECT_EQ(readOf(listOf(cellOf(type + "<integer>0</integer>"))), "left");
}

TEST(XMLCellReaderTest, TheLastValueOfADuplicateKeyIsUsed) {
    EXPECT_EQ(readOf(listOf(cellOf(mcc + "<integer>7</integer>" + mcc + "<integer>8</integer>"))),
              "[4 2 MCC=8]");
    EXPECT_EQ(readOf(listOf(cellOf(mcc + "<integer>7</integer>" + mcc + "<string>8</string>"))), "[4 2]");
}

TEST(XMLCellReaderTest, OtherKeysAreReadAndLeftOut) {
    EXPECT_EQ(readOf(listOf(cellOf("<key>Name</key><string>x</string>"))), "[4 2]");
    EXPECT_EQ(readOf(listOf(cellOf("<key>Name</key><integer>7</integer>" + mcc + "<integer>1</integer>"))),
              "[4 2 MCC=1]");
}

TEST(XMLCellReaderTest, NothingButWhiteSpaceFollows) {
    const std::string cells = cellOf(mcc + "<integer>1</integer>");
    EXPECT_EQ(readOf(listOf(cells, "")), "[4 2 MCC=1]");
    EXPECT_EQ(readOf(listOf(cells, " \t\n")), "[4 2 MCC=1]");
    EXPECT_EQ(readOf(listOf(cells, "x")), "left");
    const std::string list = listOf(cells, "");
    for (std::size_t length = 0; length < list.size(); ++length)
        EXPECT_EQ(readOf(list.substr(0, length)), "left") << length;
}

TEST(XMLCellReaderTest, TextBetweenTwoNumbersHasUpTo2048Characters) {
    // "</integer>", the key and "<integer>" are 10 + 29 + 9 characters.
    const auto apart = [](std::size_t blanks) {
        return listOf(
            cellOf(mcc + "<integer>1</integer>" + std::string(blanks, ' ') + mnc + "<integer>2</integer>"));
    };
    EXPECT_EQ(readOf(apart(2000)), "[4 2 MCC=1 MNC=2]");
    EXPECT_EQ(readOf(apart(2001)), "left");
}

TEST(XMLCellReaderTest, TakesListsOfUpToAMebibyte) {
    const std::string cell = cellOf(mcc + "<integer>1</integer>");
    std::string cells;
    std::string expected;
    while (cells.size() < (std::size_t{1} << 20) - 1000) {
        cells += cell;
        expected += "[4 2 MCC=1]";
    }
    const auto filled = [&cells](std::size_t size) {
        return listOf(cells + std::string(size - listOf(cells).size(), ' '));
    };
    EXPECT_EQ(readOf(filled(std::size_t{1} << 20)), expected);
    EXPECT_EQ(readOf(filled((std::size_t{1} << 20) + 1)), "left");
}

TEST(XMLCellReaderTest, MoreStretchesThanItRemembers) {
    std::string cells;
    std::string expected;
    for (int i = 0; i < 200; ++i) {
        const std::string number = std::to_string(i);
        cells += cellOf("<key>Name " + number + "</key><string>x</string>" + mcc + "<integer>" + number +
                        "</integer>");
        expected += "[4 2 MCC=" + number + "]";
    }
    EXPECT_EQ(readOf(listOf(cells)), expected);
}

TEST(XMLCellReaderTest, AppendsToTheCellsThatAreThere) {
    XMLCellReader reader;
    std::vector<Cell> cells(1);
    EXPECT_TRUE(reader.read(listOf(cellOf(mcc + "<integer>1</integer>")), cells));
    EXPECT_EQ(textOf(cells), "[4 2][4 2 MCC=1]");
}

} // namespace
} // namespace velmora
