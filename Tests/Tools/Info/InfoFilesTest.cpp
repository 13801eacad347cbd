// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/ShellCommand.h"
#include "Tests/Tools/SeveralTechnologies.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <filesystem>
#include <string>

// `info` of several files and of several technologies, and its JSON.

namespace velmora {
namespace {

using Json = nlohmann::ordered_json;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

class InfoFilesTest : public SeveralTechnologiesTest {
protected:
    /// The number of objects, or the validation error of the first that does not conform to the schema.
    static std::string check(const std::string& json) {
        ToolProcess::Setup setup;
        setup.arguments = {VELMORA_SOURCE_DIR "/Tests/Tools/Decode/check-json.py",
                           VELMORA_SOURCE_DIR "/Resources/velmora-log-info.schema.json"};
        setup.input = json;
        setup.environment = {{"PYTHONUTF8", "1"}, {"LD_PRELOAD", ""}};
        ToolProcess checker(setup, "/usr/bin/python3");
        const std::optional<int> status = checker.exitStatus();
        return status == 0 ? checker.output() : "status " + std::to_string(*status) + ": " + checker.errors();
    }
};

TEST_F(InfoFilesTest, SeveralFilesAreHeadedByTheirNames) {
    writeRecording("a.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}});
    const std::string one = run({"info", path("a.pcapng")});
    EXPECT_THAT(one, StartsWith("form:       recording\n"));
    EXPECT_EQ(run({"info", path("a.pcapng"), path("gone.pcapng"), path("a.pcapng")}, 1),
              "== " + path("a.pcapng") + " ==\n" + one + "\n== " + path("a.pcapng") + " ==\n" + one);
    EXPECT_EQ(_errors, "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
}

TEST_F(InfoFilesTest, TechnologiesAreListedOneByOne) {
    write("both.pcapng", both());
    const std::size_t ifxBytes = ifxBand("GSM 900").size() + ifxBand("GSM 1800").size();
    const std::string gsm = "technology: Ostrel_GSM\n"
                            "first:      2026-11-16 05:00:00.000 UTC\n"
                            "last:       2026-11-16 05:00:02.100 UTC\n"
                            "duration:   2.100 s\n"
                            "messages:   2\n"
                            "bytes:      34\n"
                            "prefixed:   0\n"
                            "too short:  0\n"
                            "wrong type: 0\n";
    const std::string gsmCodes = "\n    code     messages  sections\n"
                                 "  0x512C            2  GSM RR Info\n";
    const std::string ifx = "technology: IFX\n"
                            "first:      2026-11-16 05:00:00.500 UTC\n"
                            "last:       2026-11-16 05:00:07.000 UTC\n"
                            "duration:   6.500 s\n"
                            "messages:   2\n"
                            "bytes:      " +
                            std::to_string(ifxBytes) + "\n";
    EXPECT_EQ(run({"info", path("both.pcapng")}),
              "form:       recording\nlost:       0\n\n" + gsm + gsmCodes + "\n" + ifx);
    EXPECT_EQ(run({"info", "--technology", "Ostrel_GSM", path("both.pcapng")}),
              "form:       recording\n" + gsm + "lost:       0\n" + gsmCodes);
    EXPECT_EQ(run({"info", "--technology", "IFX", path("both.pcapng")}),
              "form:       recording\n" + ifx + "lost:       0\n");
    run({"info", "--technology", "Ostrel_LTE", path("both.pcapng")}, 1);
    EXPECT_THAT(_errors, EndsWith(": holds Ostrel_GSM and IFX, wanted one of these and not Ostrel_LTE\n"));
}

TEST_F(InfoFilesTest, TechnologyWithoutMessagesIsListed) {
    PcapngFile file;
    file.section().messageInterface("Ostrel_GSM").messageInterface("Ostrel_LTE").messageInterface("Nonesuch");
    file.message(stamp(0), rrState(4).bytes(), 0);
    write("idle.pcapng", file);
    const std::string text = run({"info", path("idle.pcapng")}, 1);
    EXPECT_THAT(text, HasSubstr("\ntechnology: Ostrel_LTE\nmessages:   0\n"));
    EXPECT_THAT(text, HasSubstr("\ntechnology: Nonesuch\nmessages:   0\n"));
    EXPECT_THAT(_errors, HasSubstr(": technology \"Nonesuch\" is unknown, wanted one of "));
}

TEST_F(InfoFilesTest, MessagesThatEndTheApplicationAreCounted) {
    const Data unreadable = record(0x0000, "DE AD BE EF", 0xFF);
    const auto offsets = writeRecording("sim.pcapng", "Ostrel_GSM",
                                        {{at(0), extraRecord(0, makeDictionary())},
                                         {at(1), unreadable},
                                         {at(2), joined(hex("81 00"), unreadable)}});
    const std::string place = std::to_string(offsets[1]);
    EXPECT_THAT(run({"info", path("sim.pcapng")}, 1),
                HasSubstr("\nundecoded:  2 (first: record 2 at offset " + place + ")\n"));
    EXPECT_THAT(_errors, StartsWith("velmora-log: " + path("sim.pcapng") + ": record 2 at offset " + place +
                                    ": SIM File dictionary data could not be constructed\n"));
    EXPECT_THAT(_errors, EndsWith(": 2 messages could not be decoded\n"));
    writeRecording("ifx.pcapng", "IFX", {{at(0), hex("01 02 03")}, {at(1), serialized("idle")}});
    EXPECT_THAT(run({"info", path("ifx.pcapng")}, 1),
                HasSubstr("\nundecoded:  1 (first: record 1 at offset "));
    EXPECT_THAT(_errors, HasSubstr(": Could not deserialize the object ("));
}

TEST_F(InfoFilesTest, JsonIsAnObjectForEachFile) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "a.pcapng", "Ostrel_GSM",
        {{at(0), rrState(4)}, {at(1), hex("01")}, {at(1250), record(0x1234, "")}, {at(2), rrState(5)}});
    std::filesystem::resize_file(path("a.pcapng"), offsets[4] - 6);
    const std::string json = run({"info", "--format", "json", path("a.pcapng")}, 1);
    const std::string zero = R"({"messages":0})";
    EXPECT_EQ(Json::parse(json).dump(),
              R"({"file":")" + path("a.pcapng") +
                  R"(","form":"recording","compressed":false,"technologies":[{"technology":"Ostrel_GSM",)"
                  R"("first":"2026-11-16T05:00:00.000000000Z","last":"2026-11-16T05:00:01.250000000Z",)"
                  R"("messages":3,"bytes":31,"prefixed":)" +
                  zero + R"(,"tooShort":{"messages":1,"record":2,"offset":)" + std::to_string(offsets[1]) +
                  R"(},"wrongType":)" + zero + R"(,"undecoded":)" + zero +
                  R"(,"codes":[{"code":4660,"messages":1,"names":[]},)"
                  R"({"code":20780,"messages":1,"names":["GSM RR Info"]}]}],)"
                  R"("losses":{"count":1,"bytes":46,"first":[{"record":4,"offset":)" +
                  std::to_string(offsets[3]) +
                  R"(,"bytes":46,"reason":"block cut off after 46 of 52 bytes"}]},)"
                  R"("comments":{"count":0,"first":[]}})");
    EXPECT_EQ(check(json), "1\n");
    write("both.pcapng", both());
    writeRecording("none.pcapng", "", {});
    EXPECT_EQ(check(run({"info", "--format", "json", path("a.pcapng"), path("both.pcapng"),
                         path("gone.pcapng"), path("none.pcapng")},
                        1)),
              "3\n");
}

TEST_F(InfoFilesTest, JsonOfEveryRecordingAndFormKeepsToTheSchema) {
    std::vector<std::string> arguments = {"info", "--format", "json"};
    for (const std::string name : {"gsm", "lte", "utran", "c2k", "ifx", "modem"}) {
        const std::string file = std::string(VELMORA_SOURCE_DIR "/Tests/Recordings/") + name + ".pcapng";
        arguments.push_back(file);
        for (const std::string form : {".velmora", ".dlf"}) {
            if (name == "ifx" && form == ".dlf")
                continue;
            ToolProcess::Setup setup =
                tool({"convert", "--description", "a <b> \"c\"", file, path(name + form)});
            setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
            ToolProcess convert(setup);
            ASSERT_TRUE(convert.exitStatus());
            arguments.push_back(path(name + form));
        }
    }
    const std::string json = run(arguments);
    EXPECT_EQ(check(json), "17\n");
    EXPECT_THAT(json, HasSubstr(R"("text": "a <b> \"c\"")"));
}

TEST_F(InfoFilesTest, CommentsAreInTheJson) {
    NEEDS_PROGRAM("editcap");
    writeRecording("plain.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}});
    ASSERT_EQ(runShell("editcap -a '1:handover' --capture-comment 'gate 4' " + path("plain.pcapng") + " " +
                       path("noted.pcapng"))
                  .status,
              0);
    const std::string json = run({"info", "--format", "json", path("noted.pcapng")});
    EXPECT_EQ(check(json), "1\n");
    const Json comments = Json::parse(json)["comments"];
    EXPECT_EQ(comments["count"], 2);
    EXPECT_EQ(comments["first"][0]["about"], "section");
    EXPECT_EQ(comments["first"][0]["text"], "gate 4");
    EXPECT_EQ(comments["first"][1]["about"], "record");
    EXPECT_EQ(comments["first"][1]["number"], 1);
    EXPECT_EQ(comments["first"][1]["text"], "handover");
}

TEST_F(InfoFilesTest, CheckerFindsWhatIsWrong) {
    // So that the tests above can fail.
    write("both.pcapng", both());
    const Json good = Json::parse(run({"info", "--format", "json", path("both.pcapng")}));
    EXPECT_EQ(check(good.dump() + "\n"), "1\n");
    const auto changed = [&](const char* pointer, const Json& value) {
        Json bad = good;
        bad[Json::json_pointer(pointer)] = value;
        return bad.dump() + "\n";
    };
    for (const std::string& bad :
         {changed("/form", "book"), changed("/more", 1), changed("/technologies", Json::array()),
          changed("/technologies/0/first", "2026-11-16 05:00:00"),
          changed("/technologies/0/tooShort/messages", 1), changed("/technologies/0/codes/0/code", -1),
          changed("/losses/count", "0")})
        EXPECT_THAT(check(bad), StartsWith("status 1")) << bad;
}

} // namespace
} // namespace velmora
