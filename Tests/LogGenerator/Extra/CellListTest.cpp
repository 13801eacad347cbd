// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellList.h"

#include "LogGenerator/Extra/BinaryCellReader.h"

#include "LogGenerator/Extra/CellInfoArray.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/Extra/CellTexts.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

Data recordWith(Bytes payload) {
    return recordOf(1, payload, 0xFF);
}

Bytes bytesOf(const std::string& text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

DictionaryRef cell(std::string_view technology, std::string_view type,
                   std::initializer_list<Dictionary::Entry> more) {
    auto fields = std::make_shared<Dictionary>(
        Dictionary{{std::string(kVoxCellMonitorCellRadioAccessTechnology), technology},
                   {std::string(kVoxCellMonitorCellType), type}});
    for (const auto& [key, value] : more)
        fields->set(key, value);
    return fields;
}

Value cellArray() {
    return std::make_shared<Array>(Array{
        cell(kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeServing,
             {{"kVoxCellMonitorMCC", 1}, {"kVoxCellMonitorARFCN", 62}, {"kVoxCellMonitorRSSI", -41}}),
        cell(kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeNeighbor,
             {{"Name", "x"}, {"Other", 5}, {"kVoxCellMonitorSCN", 300}, {"kVoxCellMonitorMCC", "1"}}),
        cell("of no kind", "at all",
             {{"kVoxCellMonitorCellId", 4294967296}, {"kVoxCellMonitorMNC", -2147483648}}),
    });
}

std::string xmlOf(const Value& list) {
    return *writeXMLPropertyList(list);
}

/// What a list says, by the property-list reader alone.
std::string slowly(const Data& record) {
    const CellInfoArrayReader reader(record);
    const Array* cells = reader.parsed().asArray();
    if (!cells)
        return "none";
    std::string text;
    for (const Value& each : *cells) {
        const Dictionary* fields = each.asDictionary();
        if (!fields)
            continue;
        const auto place = [&](std::string_view key, const auto& known) {
            const std::string* held = (*fields)[key].asString();
            return std::to_string(held ? indexOf(*held, known) : std::size(known));
        };
        text += "[" + place(kVoxCellMonitorCellRadioAccessTechnology, cellTechnologies) + " " +
                place(kVoxCellMonitorCellType, cellTypes);
        for (const std::string_view key : cellNumberKeys)
            if (const auto number = cellNumber(*fields, key))
                text += " " + std::string(key.substr(15)) + "=" + std::to_string(*number);
        text += "]";
    }
    return text;
}

std::string quickly(CellList& list, const Data& record) {
    const std::vector<Cell>* cells = list.read(record);
    return cells ? textOf(*cells) : "none";
}

constexpr const char* shownCells = "[0 0 MCC=1 ARFCN=62 RSSI=-41][1 1 SCN=300][4 2 MNC=-2147483648]";

TEST(CellListTest, ReadsBothForms) {
    CellList list;
    EXPECT_EQ(quickly(list, recordWith(bytesOf(xmlOf(cellArray())))), shownCells);
    EXPECT_EQ(quickly(list, recordWith(*writeBinaryPropertyList(cellArray()))), shownCells);
    EXPECT_EQ(quickly(list, recordWith(bytesOf(xmlOf(cellArray())))), shownCells);
}

TEST(CellListTest, TakesTheFormsThatAreWrittenWithoutThePropertyListReader) {
    std::vector<Cell> cells;
    const std::string xml = xmlOf(cellArray());
    XMLCellReader reader;
    EXPECT_TRUE(reader.read(xml, cells));
    EXPECT_TRUE(reader.read(xml, cells)); // now by the stretches that it knows
    EXPECT_EQ(cells.size(), 6u);
    EXPECT_EQ(cells[0].present, cells[3].present);
    cells.clear();
    EXPECT_TRUE(readBinaryCells(*writeBinaryPropertyList(cellArray()), cells));
    EXPECT_EQ(cells.size(), 3u);
}

TEST(CellListTest, FindsTheFirstOfAKind) {
    CellList list;
    const std::vector<Cell>* cells = list.read(recordWith(bytesOf(xmlOf(cellArray()))));
    ASSERT_NE(cells, nullptr);
    EXPECT_EQ(firstCell(*cells, {kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeNeighbor}),
              &(*cells)[1]);
    EXPECT_EQ(firstCell(*cells, {kVoxCellMonitorRadioAccessTechnologyLTE, kVoxCellMonitorCellTypeServing}),
              nullptr);
}

TEST(CellListTest, EveryUnreadableListIsLoggedEachTime) {
    const CapturedLog log;
    CellList list;
    for (int i = 0; i < 2; ++i)
        EXPECT_EQ(list.read(recordWith(bytesOf("rubbish"))), nullptr);
    const CapturedLog::Line line{LogPriority::Error, "Cell Info Array data could not be constructed"};
    EXPECT_THAT(log.lines(), testing::ElementsAre(line, line));
}

TEST(CellListTest, OtherFormsOfTheXMLSayTheSame) {
    const std::string head = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">\n";
    const std::string key = "<key>kVoxCellMonitorMCC</key>";
    for (const std::string body : {
             "<array/>",
             "<array></array>",
             "<array><dict/></array>",
             "<array><array/></array>",
             "<array><string>x</string></array>",
             "<dict/>",
             "<array><dict>KEY<integer> 7 </integer></dict></array>",
             "<array><dict>KEY<integer>+7</integer></dict></array>",
             "<array><dict>KEY<integer>007</integer></dict></array>",
             "<array><dict>KEY<integer>0x10</integer></dict></array>",
             "<array><dict>KEY<integer>-</integer></dict></array>",
             "<array><dict>KEY<integer></integer></dict></array>",
             "<array><dict>KEY<integer>99999999999999999999</integer></dict></array>",
             "<array><dict>KEY<integer>2147483648</integer></dict></array>",
             "<array><dict>KEY<real>7</real></dict></array>",
             "<array><dict>KEY<real>7.5</real></dict></array>",
             "<array><dict>KEY<string>7</string></dict></array>",
             "<array><dict>KEY<true/></dict></array>",
             "<array><dict>KEY<integer>1</integer>KEY<integer>2</integer></dict></array>",
             "<array><dict>KEY<integer>1</integer>KEY<string>2</string></dict></array>",
             "<array><dict>KEY<integer>1</integer></dict><dict>KEY<integer>2</integer></dict></array>",
             "<array><dict>KEY<integer>1</integer><!-- 2 --></dict></array>",
             "<array><dict>KEY<integer>1</integer>text</dict></array>",
             "<array><dict>KEY<integer>1</integer></dict></array></plist>",
             "<array><dict>KEY</dict></array>",
             "<array><dict>KEY<integer>1</integer><key>a &amp; b</key><integer>2</integer></dict></array>",
             ("<array><dict><key>kVoxCellMonitorCellRadioAccessTechnology</key><integer>1</integer>"
              "</dict></array>"),
             "<array><dict><key>kVoxCellMonitorCellType</key><integer>1</integer></dict></array>",
             "<array><dict>KEY<integer>1</integer><key>a & b</key><integer>2</integer></dict></array>",
         }) {
        std::string xml = body;
        for (std::size_t at; (at = xml.find("KEY")) != std::string::npos;)
            xml.replace(at, 3, key);
        const Data record = recordWith(bytesOf(head + xml + "\n</plist>\n"));
        CellList list;
        EXPECT_EQ(quickly(list, record), slowly(record)) << body;
        EXPECT_EQ(quickly(list, record), slowly(record)) << body;
    }
}

TEST(CellListTest, ListOfMoreThanAMebibyteSaysTheSame) {
    std::string xml = xmlOf(cellArray());
    xml.insert(xml.find("<array>") + 7, (std::size_t{1} << 20) + 1, ' ');
    // The header's length has 16 bits; nothing here looks at it.
    const Data record = joined(Data(std::vector<std::uint8_t>(13)), Data::copyOf(bytesOf(xml)));
    CellList list;
    EXPECT_EQ(quickly(list, record), shownCells);
    EXPECT_EQ(quickly(list, record), shownCells);
}

/// A list with one byte changed or its end cut off says the same whichever way it is read, also by a reader
/// that has learnt from the complete one.
void expectSameOfEveryChange(const Bytes whole) {
    CellList list;
    const auto expectSame = [&list](Bytes bytes, std::size_t at) {
        const Data record = recordWith(bytes);
        EXPECT_EQ(quickly(list, record), slowly(record)) << "changed at " << at;
    };
    expectSame(whole, whole.size());
    for (std::size_t length = 0; length < whole.size(); ++length)
        expectSame(whole.first(length), length);
    for (std::size_t at = 0; at < whole.size(); ++at)
        for (const int change : {0x01, 0x10, 0x80}) {
            std::vector<std::uint8_t> changed(whole.begin(), whole.end());
            changed[at] = static_cast<std::uint8_t>(changed[at] ^ change);
            expectSame(changed, at);
        }
}

TEST(CellListTest, EveryChangedByteOfTheXMLSaysTheSame) {
    const std::string xml = xmlOf(cellArray());
    expectSameOfEveryChange(bytesOf(xml));
}

TEST(CellListTest, EveryChangedByteOfTheBinaryFormSaysTheSame) {
    expectSameOfEveryChange(*writeBinaryPropertyList(cellArray()));
}

} // namespace
} // namespace velmora
