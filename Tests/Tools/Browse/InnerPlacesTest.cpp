// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <string>
#include <string_view>

// Where the values of property lists and of sub-packets lie, as `browse --line` prints it.

namespace velmora {
namespace {

using testing::HasSubstr;

class InnerPlacesTest : public ToolTest {
protected:
    static Data extraRecord(std::uint16_t code, Bytes payload) {
        const auto header = LogMessage::header(LogMessage::extraType, code, payload.size());
        std::vector<std::uint8_t> record(header.begin(), header.end());
        record.insert(record.end(), payload.begin(), payload.end());
        return Data::copyOf(record);
    }
    static Data extraRecord(std::uint16_t code, std::string_view payload) {
        return extraRecord(code,
                           Bytes(reinterpret_cast<const std::uint8_t*>(payload.data()), payload.size()));
    }
    /// The lines of `x` for the only message of a recording of that technology.
    [[nodiscard]] std::string fieldsOf(const char* technology, const Data& message) {
        writeRecording("drive.pcapng", technology, {{at(0), message}});
        return fieldsOf(path("drive.pcapng"), "x\n");
    }
    [[nodiscard]] std::string fieldsOf(const std::string& file, const std::string& commands) {
        ToolProcess::Setup setup = tool({"browse", "--line", file});
        setup.input = commands;
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources"; // all sections
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 0);
        return process.output();
    }
    /// " (bytes 3 to 5)" of a text that is in the message once.
    static std::string placeOf(const Data& message, std::string_view text) {
        const std::string all(message.bytes().begin(), message.bytes().end());
        const std::size_t begin = all.find(text);
        EXPECT_NE(begin, std::string::npos) << text;
        EXPECT_EQ(all.find(text, begin + 1), std::string::npos) << text;
        return " (bytes " + std::to_string(begin) + " to " + std::to_string(begin + text.size() - 1) + ")";
    }
};

TEST_F(InnerPlacesTest, FilesOfTheSIMInBothForms) {
    const DictionaryRef files = makeDictionary();
    files->set("kSimFile_ICCID", "8949000000000000001");
    files->set("kSimFile_RATMODE", "Automatic");
    const auto xml = writeXMLPropertyList(Value(files));
    const auto binary = writeBinaryPropertyList(Value(files));
    ASSERT_TRUE(xml && binary);
    for (const Data& message : {extraRecord(0, *xml), extraRecord(0, Bytes(*binary))}) {
        const std::string text = fieldsOf("Ostrel_GSM", message);
        EXPECT_THAT(text,
                    HasSubstr("/EF-ICCID = 8949000000000000001" + placeOf(message, "8949000000000000001")));
        EXPECT_THAT(text, HasSubstr("/EF-RAT MODE = Automatic" + placeOf(message, "Automatic")));
    }
}

TEST_F(InnerPlacesTest, CellsOfTheSameValuesLieEachInItsOwnDictionary) {
    const auto cell = [](std::int64_t channel) {
        const DictionaryRef made = makeDictionary();
        made->set("kVoxCellMonitorCellRadioAccessTechnology", "kVoxCellMonitorRadioAccessTechnologyGSM");
        made->set("kVoxCellMonitorCellType", "kVoxCellMonitorCellTypeNeighbor");
        made->set("kVoxCellMonitorARFCN", Value(channel));
        made->set("kVoxCellMonitorRSSI", Value(std::int64_t{-30}));
        made->set("kVoxCellMonitorBandInfo", Value(std::int64_t{900}));
        return Value(made);
    };
    const ArrayRef cells = makeArray();
    cells->append(cell(812));
    cells->append(cell(637));
    const auto xml = writeXMLPropertyList(Value(cells));
    ASSERT_TRUE(xml);
    const Data message = extraRecord(1, *xml);
    const std::string text = fieldsOf("Ostrel_GSM", message);
    EXPECT_THAT(text, HasSubstr("/0/ARFCN = 812" + placeOf(message, "812")));
    EXPECT_THAT(text, HasSubstr("/1/ARFCN = 637" + placeOf(message, "637")));
    const std::string all(message.bytes().begin(), message.bytes().end());
    const std::size_t first = all.find("-30");
    const std::size_t second = all.find("-30", first + 1);
    EXPECT_THAT(text, testing::ContainsRegex("/0/RSSI = [^\n]*bytes " + std::to_string(first) + " to"));
    EXPECT_THAT(text, testing::ContainsRegex("/1/RSSI = [^\n]*bytes " + std::to_string(second) + " to"));
}

TEST_F(InnerPlacesTest, DisplaysOfIFX) {
    const DictionaryRef cell = makeDictionary();
    cell->set("RxLev", "-71 dBm");
    cell->set("Cell ID", "4711");
    const DictionaryRef root = makeDictionary();
    root->set("Serving Cell", Value(cell));
    root->set("State", "Ready");
    const auto xml = writeXMLPropertyList(Value(root));
    ASSERT_TRUE(xml);
    const Data message = Data::copyOf(Bytes(reinterpret_cast<const std::uint8_t*>(xml->data()), xml->size()));
    const std::string text = fieldsOf("IFX", message);
    EXPECT_THAT(text, HasSubstr("/Serving Cell/RxLev = -71 dBm" + placeOf(message, "-71 dBm")));
    EXPECT_THAT(text, HasSubstr("/State = Ready" + placeOf(message, "Ready")));
}

/// The first 1x status record: sub-packets 1 (4 bytes of header, the state), 2 and 3 from byte 17 on.
TEST_F(InnerPlacesTest, SubPacketsOfCDMA) {
    const std::string text = fieldsOf(std::string(VELMORA_SOURCE_DIR) + "/Tests/Recordings/c2k.pcapng",
                                      "/1x/Device State\nx\nh\n");
    const std::size_t digits = text.rfind('\n', text.size() - 2) + 1;
    const auto byte = [&](std::size_t at) {
        return std::stoul(text.substr(digits + 2 * at, 2), nullptr, 16);
    };
    ASSERT_EQ(byte(17), 1U) << "the id of the first sub-packet";
    const std::size_t radio = 17 + byte(19) + 256 * byte(20);
    ASSERT_EQ(byte(radio), 2U) << "the id of the second sub-packet";
    EXPECT_THAT(text, testing::ContainsRegex("/1x/Device State = [^\n]* \\(byte 21\\)"));
    EXPECT_THAT(text,
                HasSubstr("/1x/Channel = " + std::to_string(byte(radio + 6) + 256 * byte(radio + 7)) +
                          " (bytes " + std::to_string(radio + 6) + " to " + std::to_string(radio + 7) + ")"));
}

} // namespace
} // namespace velmora
