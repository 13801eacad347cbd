// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANLogGenerator.h"

#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/DecoderFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::MatchesRegex;

class UTRANGenerator : public DecoderFixture {
protected:
    UTRANGenerator() : DecoderFixture("Ostrel_UTRAN", kVoxLogChannelTechnology_Ostrel_UTRAN2) {}
};

TEST_F(UTRANGenerator, SaysEachStepOfItsCreationInOrder) {
    CapturedLog log;
    const std::unique_ptr<UTRANLogGenerator> another = UTRANLogGenerator::generator(clock);
    ASSERT_NE(another, nullptr);
    const LogLines& lines = log.lines();
    ASSERT_EQ(lines.size(), 12u);
    for (std::size_t i = 0; i < 8; ++i)
        EXPECT_EQ(lines[i],
                  (CapturedLog::Line{LogPriority::Warning, i == 1 ? "Array Count: 2" : "Array Count: 1"}));
    EXPECT_EQ(lines[8].priority, LogPriority::Error);
    EXPECT_THAT(lines[8].text, MatchesRegex("Creating OstrelLogGenerator2 object with 0x[0-9a-f]+"));
    EXPECT_EQ(lines[9].priority, LogPriority::Warning);
    EXPECT_THAT(lines[9].text, MatchesRegex("Creating Log object: 0x[0-9a-f]+"));
    EXPECT_EQ(lines[10], (CapturedLog::Line{LogPriority::Error, "Class Index: 1"}));
    EXPECT_EQ(lines[11], (CapturedLog::Line{LogPriority::Error, "Created UTRANLogGenerator object"}));
}

TEST_F(UTRANGenerator, EachSectionWritesIntoItsOwnNode) {
    update(record(0xD0E0, "01 02"));
    update(recordWith(0xD0E2, 26, {{17, 0x46}, {18, 0x27}, {19, 0x46}, {20, 0x27}, {21, 7}, {25, 1}}));
    update(recordWith(0xD00A, 184, {{16, 2}, {168, 0x46}, {169, 0x27}, {171, 0x80}}));
    update(recordWith(0xD00E, 25, {{16, 1}}));
    update(
        recordWith(0xD00C, 331, {{14, 0x40}, {15, 0x10}, {17, 1}, {18, 9}, {323, 3}, {324, 1}, {325, 40}}));
    update(extraRecord(2, std::make_shared<Array>(Array{"context"})));
    update(extraRecord(0, std::make_shared<Dictionary>(Dictionary{{"kSimFile_ICCID", "89"}})));
    EXPECT_EQ(display(),
              "{Serving Cell {RRC Info {State 'Cell Fach'}, "
              "Serving Cell Info {Cell Access Restrictions '0', Cell ID '7', Downlink UARFCN '10054', "
              "Uplink UARFCN '10054', URA ID '0', Allowed Access 'Emergency Calls Only'}}, "
              "Neighbors {Neighbor Cell List [{UARFCN '10054', Cell ID '0', Filter RSCP '0.000000', "
              "Status 'ASET', inJDCS 'TRUE'}], GSM Neighbor Cell List []}, "
              "Channel Quality {TRCH BLER [{TRCH ID '1', TRCH BLER Measurement '9'}], "
              "CCTRCH SIR [{CCTRCH ID '3', TSNUM '1', SIR ['40', '0', '0', '0', '0', '0']}]}, "
              "PDP Context Info ['context'], SIM Info {EF-ICCID '89'}}");
}

TEST_F(UTRANGenerator, APrefixedRecordIsDecodedAsFarAsItGoes) {
    update(joined(hex("81 00"), record(0xD0E0, "01 04")));
    // Thirteen bytes with the prefix: eleven reach the section, which reads nothing past them.
    update(joined(hex("81 00"), prefixOf(record(0xD0E0, "01 04"), 11)));
    EXPECT_THAT(display(), testing::HasSubstr("{State 'Unknown RRC Mode'}"));
}

class UTRANTemplateChoice : public testing::Test {
protected:
    /// A template that shows nothing but its own name.
    void put(const std::string& name, const std::string& type = "plist") {
        resources.put(name, type, Value(std::make_shared<Dictionary>(Dictionary{{"Name", name}})));
    }
    std::string chosen() {
        const auto generator = UTRANLogGenerator::generator(clock);
        if (!generator)
            return "(none)";
        Dictionary state;
        static_cast<void>(generator->getDisplayFromState(state));
        return shown(state["Display"]);
    }

    FakeClock clock;
    FakeResources resources;
};

TEST_F(UTRANTemplateChoice, TheNameIsMatchedIgnoringCase) {
    for (const char* name : {"UTRAN", "utran", "my_utran_view", "OstrelUtRaN2", "xUUTRANx"}) {
        FakeResources fresh;
        fresh.put(name, "plist", Value(std::make_shared<Dictionary>(Dictionary{{"Name", name}})));
        EXPECT_EQ(chosen(), "{Name '" + std::string(name) + "'}");
    }
}

TEST_F(UTRANTemplateChoice, TheFirstOfSeveralIsTaken) {
    put("LTE");
    put("Ostrel_GSM");
    put("b_utran");
    put("Z_UTRAN");
    put("A_UTRAN", "txt");
    EXPECT_EQ(chosen(), "{Name 'Z_UTRAN'}"); // capital letters sort before the small ones
    put("M_utran");
    EXPECT_EQ(chosen(), "{Name 'M_utran'}");
}

TEST_F(UTRANTemplateChoice, WithoutATemplateThereIsNoDecoder) {
    put("Ostrel_GSM");
    put("LTE");
    put("UTRA N");
    put("UTRAN", "txt");
    CapturedLog log;
    EXPECT_EQ(UTRANLogGenerator::generator(clock), nullptr);
    EXPECT_EQ(LogGenerator::generatorFromTechnology(kVoxLogChannelTechnology_Ostrel_UTRAN2, clock), nullptr);
    const CapturedLog::Line line{
        LogPriority::Error,
        "resources of type plist are LTE, Ostrel_GSM, UTRA N, wanted one whose name contains UTRAN"};
    EXPECT_EQ(log.lines(), (LogLines{line, line}));
}

TEST_F(UTRANTemplateChoice, WithoutAnyResourceTheLineReportsIt) {
    CapturedLog log;
    EXPECT_EQ(UTRANLogGenerator::generator(clock), nullptr);
    EXPECT_EQ(log.lines(),
              (LogLines{{LogPriority::Error, "resources of type plist are none, wanted one whose "
                                             "name contains UTRAN"}}));
}

} // namespace

} // namespace velmora
