// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/CheckedJSON.h"
#include "Tests/Tools/ParsedCommandLine.h"
#include "Tests/Tools/SeveralTechnologies.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <string>
#include <vector>

// `velmora-log stats`: its options, formats and groups. Its figures are compared with an independent script's
// by check-stats.py.

namespace velmora {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

constexpr const char* schema = "velmora-log-stats.schema.json";
constexpr const char* rrStatePath = "/GSM RR Info/RR State";

class StatsCommandTest : public SeveralTechnologiesTest {
protected:
    /// A phone that is idle for 10 s, builds its list of networks for 5 s, and is idle again.
    void writeStates(const std::string& name, std::int64_t from = 0) const {
        writeRecording(name, "Ostrel_GSM",
                       {{at(from), rrState(5)},
                        {at(from + 10'000), rrState(4)},
                        {at(from + 15'000), rrState(5)},
                        {at(from + 15'000), rrState(5)}});
    }
    /// The only object of a run.
    Json object(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"stats", "--format", "json"});
        const std::string text = run(std::move(arguments));
        EXPECT_EQ(checkJSON(schema, text), "1\n");
        return Json::parse(text);
    }
    static Json state(const Json& group, const std::string& path = rrStatePath) {
        for (const Json& each : group["technologies"][0]["states"])
            if (each["path"] == path)
                return each;
        return nullptr;
    }
};

TEST_F(StatsCommandTest, StatesHaveSharesOfTime) {
    writeStates("a.pcapng");
    const Json states = state(object({path("a.pcapng")}));
    EXPECT_EQ(states["samples"], 4);
    EXPECT_EQ(states["seconds"], 15);
    EXPECT_EQ(states["transitions"], 2);
    EXPECT_EQ(states["values"].dump(), R"([{"value":5,"text":"RR_IDLE","samples":3,"seconds":10,"share":)"
                                       R"(0.6666666666666666},{"value":4,"text":"RR_PLMN_LIST_CONSTRUCTION",)"
                                       R"("samples":1,"seconds":5,"share":0.3333333333333333}])");
    EXPECT_EQ(states["changes"].dump(), R"([{"from":5,"to":4,"count":1},{"from":4,"to":5,"count":1}])");
}

TEST_F(StatsCommandTest, TextHasTables) {
    writeStates("a.pcapng");
    const std::string text = run({"stats", path("a.pcapng")});
    EXPECT_THAT(text,
                StartsWith("Ostrel_GSM: 4 messages, 2026-11-16 05:00:00.000 UTC to 2026-11-16 05:00:15.000 "
                           "UTC\n\nnumbers\n  field "));
    EXPECT_THAT(text, HasSubstr("  /GSM RR Info/RR State: 4 samples, known for 15.000 s, 2 transitions\n"
                                "    66.7 %  10.000 s  3  RR_IDLE\n"
                                "    33.3 %   5.000 s  1  RR_PLMN_LIST_CONSTRUCTION\n"
                                "      1  RR_IDLE -> RR_PLMN_LIST_CONSTRUCTION\n"
                                "      1  RR_PLMN_LIST_CONSTRUCTION -> RR_IDLE\n"));
}

TEST_F(StatsCommandTest, CSVHasARowForEachValue) {
    writeStates("a.pcapng");
    EXPECT_EQ(run({"stats", "--format", "csv", "--select", rrStatePath, path("a.pcapng")}),
              "technology,path,role,unit,samples,absent,minimum,p5,p50,p95,maximum,mean,state,seconds,share,"
              "worst_minute\r\n"
              "Ostrel_GSM,/GSM RR Info/RR State,radio.state,,3,0,,,,,,,RR_IDLE,10,0.6666666666666666,\r\n"
              "Ostrel_GSM,/GSM RR Info/RR State,radio.state,,1,0,,,,,,,RR_PLMN_LIST_CONSTRUCTION,5,"
              "0.3333333333333333,\r\n");
}

TEST_F(StatsCommandTest, HistogramsAreOnDemand) {
    writeStates("a.pcapng");
    const std::vector<std::string> select = {"--select", "status=/GSM RR Info/RR Status", path("a.pcapng")};
    EXPECT_FALSE(object(select)["technologies"][0]["numbers"][0].contains("histogram"));
    std::vector<std::string> arguments = select;
    arguments.insert(arguments.begin(), "--histogram");
    const Json numbers = object(arguments)["technologies"][0]["numbers"][0];
    EXPECT_EQ(numbers["name"], "status");
    EXPECT_EQ(numbers["histogram"].dump(), R"({"bins":[{"value":1,"samples":4}],"others":0})");
    arguments.insert(arguments.begin(), "stats");
    EXPECT_THAT(run(arguments),
                HasSubstr("\n  status\n    1    4  ########################################\n"));
}

TEST_F(StatsCommandTest, FilesFollowEachOther) {
    writeStates("a.pcapng");
    writeStates("b.pcapng", 20'000);
    const std::string a = path("a.pcapng");
    const std::string b = path("b.pcapng");
    // From 15 s to 20 s the state of the first file holds.
    EXPECT_EQ(state(object({a, b}))["seconds"], 35);
    const std::string files = run({"stats", "--by", "file", "--format", "json", "--role", "radio", a, b});
    EXPECT_EQ(checkJSON(schema, files), "2\n");
    EXPECT_THAT(files, HasSubstr("\"file\": \"" + a + "\""));
    EXPECT_THAT(run({"stats", "--by", "file", "--role", "radio", a, b}),
                testing::AllOf(StartsWith("== " + a + " ==\n"), HasSubstr("\n\n== " + b + " ==\n")));
}

TEST_F(StatsCommandTest, MinutesAndTechnologiesAreGroups) {
    write("both.pcapng", both());
    const std::string file = path("both.pcapng");
    for (const char* const by : {"technology", "minute", "cell"}) {
        const std::string json = run({"stats", "--by", by, "--format", "json", file});
        EXPECT_EQ(checkJSON(schema, json), "2\n") << by;
        EXPECT_THAT(json, HasSubstr("\"technology\": \"IFX\""));
    }
    EXPECT_THAT(run({"stats", "--by", "minute", file}),
                StartsWith("== 2026-11-16 05:00 UTC (Ostrel_GSM) ==\n"));
    EXPECT_THAT(run({"stats", "--by", "minute", "--format", "csv", file}),
                HasSubstr("\r\n2026-11-16T05:00:00Z,Ostrel_GSM,/GSM RR Info/RR State,"));
    EXPECT_EQ(object({"--technology", "IFX", file})["technologies"][0]["technology"], "IFX");
}

TEST_F(StatsCommandTest, ATimeRangeIsCountedAndWhatWasBeforeIsKnown) {
    writeStates("a.pcapng");
    const Json states = state(object({"--from", "+5", "--to", "+12", path("a.pcapng")}));
    EXPECT_EQ(states["seconds"], 7);
    EXPECT_EQ(states["values"][0]["seconds"], 5);
    EXPECT_EQ(states["values"][0]["samples"], 0);
}

TEST_F(StatsCommandTest, AFileWithoutMessagesSaysSo) {
    writeRecording("empty.pcapng", "Ostrel_GSM", {});
    EXPECT_EQ(run({"stats", path("empty.pcapng")}), "no messages\n");
    EXPECT_EQ(object({path("empty.pcapng")}).dump(), R"({"roles":[],"technologies":[]})");
}

TEST_F(StatsCommandTest, StandardInputIsReadWithoutAFile) {
    writeStates("a.pcapng");
    const std::string fromFile = run({"stats", path("a.pcapng")});
    EXPECT_EQ(run({"stats"}, 0, contentOf("a.pcapng")), fromFile);
    EXPECT_EQ(run({"stats", "-"}, 0, contentOf("a.pcapng")), fromFile);
}

TEST_F(StatsCommandTest, BadFilesAreReportedAndTheOthersCount) {
    writeStates("a.pcapng");
    const std::string alone = run({"stats", path("a.pcapng")});
    EXPECT_EQ(run({"stats", path("gone.pcapng"), path("a.pcapng")}, 1), alone);
    EXPECT_EQ(_errors, "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
    EXPECT_EQ(run({"stats", path("gone.pcapng")}, 1), "");
}

TEST_F(StatsCommandTest, APathThatIsNotPossibleNamesTheNearest) {
    writeStates("a.pcapng");
    const char* const wrong = "/GSM RR Info/RR Stat";
    for (const bool isInput : {false, true}) {
        EXPECT_EQ(run({"stats", "--select", wrong, isInput ? "-" : path("a.pcapng")}, 2,
                      isInput ? std::optional(contentOf("a.pcapng")) : std::nullopt),
                  "");
        EXPECT_THAT(_errors,
                    HasSubstr("velmora-log: --select: no display of Ostrel_GSM has "
                              "\"/GSM RR Info/RR Stat\"; the nearest paths are \"/GSM RR Info/RR Stat"));
    }
}

TEST_F(StatsCommandTest, OptionsThatMakeNoSenseTogetherAreRefused) {
    for (const auto& [arguments, reason] : std::vector<std::pair<std::vector<const char*>, const char*>>{
             {{"stats", "--safe", "a"}, "--safe: got another format, wanted --format csv"},
             {{"stats", "--histogram", "--format", "csv", "a"},
              "--histogram: got --format csv too, wanted --format text or json"},
             {{"stats", "--by", "hour", "a"},
              "--by: got hour, wanted file or technology or cell or minute or square:50m"},
             {{"stats", "--clock", "wall", "a"}, "--clock: got wall, wanted arrival or modem"},
             {{"stats", "--role", "level", "a"}, "--role: got level, wanted one of serving.mcc, "}}) {
        const CommandLine line = parse(arguments);
        const auto* const notice = std::get_if<CommandLine::Notice>(&line.command);
        ASSERT_TRUE(notice) << reason;
        EXPECT_EQ(notice->status, 2);
        EXPECT_THAT(notice->text, HasSubstr(reason));
    }
}

TEST_F(StatsCommandTest, TheRecordingsOfAllTechnologiesConform) {
    for (const char* const name : {"gsm", "lte", "utran", "c2k", "ifx", "modem"}) {
        ToolProcess::Setup setup =
            tool({"stats", "--format", "json", "--histogram", "--log-level", "0",
                  VELMORA_SOURCE_DIR "/Tests/Recordings/" + std::string(name) + ".pcapng"});
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
        ToolProcess process(setup);
        EXPECT_LE(process.exitStatus(), 1) << name; // some have messages that are malformed
        EXPECT_EQ(checkJSON(schema, process.output()), "1\n") << name;
    }
}

TEST_F(StatsCommandTest, TheCheckerFindsWhatIsWrong) {
    // So that the tests above can fail.
    const std::string begin = R"({"roles":[{"role":"serving.level",)";
    const std::string end = R"(}],"technologies":[]})"
                            "\n";
    EXPECT_EQ(checkJSON(schema, begin + R"("samples":0,"absent":1)" + end), "1\n");
    for (const char* const wrong : {
             R"("absent":1)",                        // no samples
             R"("samples":1,"absent":0)",            // and no figures
             R"("samples":0,"absent":0,"median":-1)" // unknown
         })
        EXPECT_THAT(checkJSON(schema, begin + wrong + end), StartsWith("status")) << wrong;
}

TEST_F(StatsCommandTest, WhatIsChosenAndReportsNothingIsListed) {
    writeStates("a.pcapng");
    const Json group = object({"--select", "/UMTS RR Info/Transmit Power", path("a.pcapng")});
    EXPECT_EQ(group["technologies"][0]["numbers"][0]["samples"], 0);
    EXPECT_THAT(run({"stats", path("a.pcapng")}), Not(HasSubstr("Transmit Power")));
}

} // namespace
} // namespace velmora
