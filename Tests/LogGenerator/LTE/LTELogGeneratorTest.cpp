#include "LogGenerator/LTE/LTELogGenerator.h"

#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/OstrelGSM/SectionHarness.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <fstream>
#include <iterator>

namespace velmora {

namespace {

using testing::ElementsAre;

/// The display template that is shipped.
Data templateFile() {
    std::ifstream file(VELMORA_SOURCE_DIR "/Resources/LTE.plist", std::ios::binary);
    return Data(std::vector<std::uint8_t>(std::istreambuf_iterator<char>(file), {}));
}

class LTEGenerator : public testing::Test {
protected:
    LTEGenerator() {
        resources.put("LTE", "plist", templateFile());
        // Builds the display, so that later log lines are the sections' alone.
        generator->updateState(state, recordWith(0x0001, 13));
    }

    LogLines update(const Data& record) {
        CapturedLog log;
        generator->updateState(state, record);
        return log.lines();
    }
    [[nodiscard]] std::string node(std::string_view group, std::string_view section) const {
        return shown((*(*state["Display"].asDictionary())[group].asDictionary())[section]);
    }

    FakeClock clock;
    FakeResources resources;
    std::unique_ptr<LogGenerator> generator =
        LogGenerator::generatorFromTechnology(kVoxLogChannelTechnology_Ostrel_LTE, clock);
    Dictionary state;
};

std::vector<std::int64_t> numbers(const Value& list) {
    std::vector<std::int64_t> result;
    for (const Value& number : *list.asArray())
        result.push_back(*number.asInteger());
    std::sort(result.begin(), result.end());
    return result;
}

TEST_F(LTEGenerator, IsTheTechnologysDecoder) {
    EXPECT_NE(dynamic_cast<LTELogGenerator*>(generator.get()), nullptr);
    CapturedLog log;
    std::unique_ptr<LTELogGenerator> another = LTELogGenerator::generator(clock);
    ASSERT_FALSE(log.lines().empty());
    EXPECT_EQ(log.lines().front(),
              (CapturedLog::Line{LogPriority::Error, "Creating LTELogGenerator object"}));
    char address[40];
    std::snprintf(address, sizeof address, "%p", static_cast<void*>(another.get()));
    log.clear();
    another.reset();
    const std::string place(address);
    // The base class, which is at the same address, has one wording for every technology.
    EXPECT_EQ(log.lines(),
              (LogLines{{LogPriority::Warning, "LTELogGenerator is destructed " + place},
                        {LogPriority::Warning, "Ostrel_GSMLogGenerator is destructed " + place}}));
}

TEST_F(LTEGenerator, AsksForTheCodesOfItsSections) {
    const DictionaryRef command = generator->getStartCommand();
    EXPECT_EQ(command->size(), 3u);
    EXPECT_EQ((*command)["SetState"], Value("Streaming"));
    EXPECT_THAT(numbers((*command)["SetOstrelLogCodes"]),
                ElementsAre(45249, 45250, 45433, 45439, 45440, 45446));
    EXPECT_THAT(numbers((*command)["SetVoxExtraCodes"]), ElementsAre(0, 1, 2));
}

LogLines traces(std::initializer_list<const char*> words) {
    LogLines lines;
    for (const char* word : words)
        lines.push_back({LogPriority::Warning, word});
    return lines;
}

TEST_F(LTEGenerator, ARecordReachesItsSectionsInOrder) {
    EXPECT_EQ(update(recordWith(0xB0C1, 13)), traces({"LTE Serving Cell Info"}));
    EXPECT_EQ(update(recordWith(0xB0C2, 13)), traces({"LTE Serving Cell Info"}));
    EXPECT_EQ(update(recordWith(0xB179, 13)), traces({"Connected mode LTE Intra-frequency Measurement",
                                                      "Measured Neighbor Cells", "Detected Cells"}));
    EXPECT_EQ(update(recordWith(0xB17F, 13)), traces({"Serving Cell Measurements"}));
    EXPECT_EQ(update(recordWith(0xB180, 13)), traces({"Neighbor Measurements", "Neighbor Cells List"}));
    EXPECT_EQ(update(recordWith(0xB186, 13)),
              traces({"Reselection Candidates", "Reselection Candidates List"}));
    EXPECT_EQ(update(cellInfo({})), traces({"LTE Serving Cell Info"}));
    EXPECT_EQ(update(extraRecord(0, makeDictionary())), traces({"SimInfo"}));
    EXPECT_EQ(update(extraRecord(2, makeArray())), traces({"PDPContextList"}));
    EXPECT_EQ(update(recordWith(0x1234, 13)), traces({}));
    // The extra stream's code 0xB179 is another one.
    EXPECT_EQ(update(record(0xB179, "", 0xFF)), traces({}));
}

TEST_F(LTEGenerator, EachSectionWritesIntoItsOwnNode) {
    update(record(0xB179, "EE EE EE EE   14 05   F7 01   01 00   A0 00   50 00   01 01"
                          "02 00 A0 00 50 00   03 00"));
    EXPECT_EQ(node("Connected Mode", "Connected mode LTE Intra-frequency Measurement"),
              "{E-ARFCN '1300', Serving Physical Cell ID '503', Subframe Number '1', "
              "Serving Filtered RSRP '-100.00 dBm', Serving Filtered RSRQ '-10.00 dB'}");
    EXPECT_EQ(node("Connected Mode", "Measured Neighbor Cells"),
              "[{Physical Cell ID '2', Filtered RSRP '-100.00 dBm', Filtered RSRQ '-10.00 dB'}]");
    EXPECT_EQ(node("Connected Mode", "Detected Cells"), "[{Physical Cell ID '3'}]");

    update(record(0xB186, "01 EE   14 05   F7 01   01 00   06 00   07 00"));
    EXPECT_EQ(node("Reselection", "Reselection Candidates"),
              "{Version '1', Serving EARFCN '1300', Serving Cell ID '503'}");
    EXPECT_EQ(node("Reselection", "Reselection Candidates List"),
              "[{Candidate Priority '6', Candidate RAT Type '?\?'}]");

    update(recordWith(0xB180, 41, {{13, 2}}));
    EXPECT_EQ(node("Idle Mode Neighbors", "Neighbor Measurements"),
              "{Version '2', E-ARFCN '0', Qrxlevmin '-140 dBm'}");
    EXPECT_NE(node("Idle Mode Neighbors", "Neighbor Cells List"), "[]");
}

TEST_F(LTEGenerator, APrefixedRecordIsDecodedAlike) {
    update(joined(hex("81 00"), recordWith(0xB0C1, 22, {{20, 2}})));
    EXPECT_EQ(node("Serving Cell", "Serving Cell Info"), "{Num Tx Antennas '2'}");
}

} // namespace

} // namespace velmora
