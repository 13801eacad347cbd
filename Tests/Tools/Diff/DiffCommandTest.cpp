// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/CheckedJSON.h"
#include "Tests/Tools/ParsedCommandLine.h"
#include "Tests/Tools/SeveralTechnologies.h"
#include "Tools/Diff/DiffInput.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <string>
#include <vector>

namespace velmora {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;

constexpr const char* schema = "velmora-log-diff.schema.json";

class DiffCommandTest : public SeveralTechnologiesTest {
protected:
    /// Idle for 10 s, and then building its list of networks.
    void writeStates(const std::string& name, std::int64_t idle = 10'000) const {
        writeRecording(name, "Ostrel_GSM",
                       {{at(0), rrState(5)}, {at(idle), rrState(4)}, {at(20'000), rrState(4)}});
    }
    Json object(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"diff", "--format", "json"});
        const std::string text = run(std::move(arguments));
        EXPECT_EQ(checkJSON(schema, text), "1\n");
        return Json::parse(text);
    }
};

TEST_F(DiffCommandTest, TwoMomentsAreComparedByTheirDisplays) {
    writeStates("a.pcapng");
    const std::string a = path("a.pcapng");
    // The moment is after the messages at that time.
    EXPECT_EQ(run({"diff", a + "@+9.999", a + "@+10"}),
              "Ostrel_GSM\n"
              "           field                  row  A        B                          B - A\n"
              "  changed  /GSM RR Info/RR State       RR_IDLE  RR_PLMN_LIST_CONSTRUCTION\n");
    const Json compared = object({a + "@2026-11-16T05:00:00Z", a + "@+10"});
    EXPECT_EQ(compared["compared"], "displays");
    EXPECT_EQ(compared["a"], a + "@2026-11-16T05:00:00Z");
    EXPECT_EQ(compared["technologies"][0]["differences"].dump(),
              R"([{"change":"changed","path":"/GSM RR Info/RR State","a":{"value":5,"text":"RR_IDLE"},)"
              R"("b":{"value":4,"text":"RR_PLMN_LIST_CONSTRUCTION"}}])");
}

TEST_F(DiffCommandTest, AMomentIsComparedWithTheEnd) {
    writeStates("a.pcapng");
    const std::string a = path("a.pcapng");
    EXPECT_EQ(run({"diff", a + "@+12", a}), "Ostrel_GSM: no differences\n");
    EXPECT_EQ(run({"diff", "--display", a, a}), "Ostrel_GSM: no differences\n");
}

TEST_F(DiffCommandTest, SnapshotsAreComparedByTheirDisplays) {
    writeStates("a.pcapng");
    writeRecording("b.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    for (const char* const name : {"a", "b"})
        run({"convert", path(name + std::string(".pcapng")), path(name + std::string(".velmora"))});
    EXPECT_THAT(run({"diff", path("a.velmora"), path("b.velmora")}),
                HasSubstr("  changed  /GSM RR Info/RR State       RR_PLMN_LIST_CONSTRUCTION  RR_IDLE\n"));
    EXPECT_EQ(run({"diff", path("b.velmora"), path("b.pcapng")}), "Ostrel_GSM: no differences\n");
}

TEST_F(DiffCommandTest, RecordingsAreComparedByTheirStatistics) {
    writeStates("a.pcapng", 10'000);
    writeStates("b.pcapng", 15'000);
    const std::vector<std::string> files = {"--role", "radio", path("a.pcapng"), path("b.pcapng")};
    std::vector<std::string> arguments = files;
    arguments.insert(arguments.begin(), "diff");
    EXPECT_EQ(run(arguments), "Ostrel_GSM: 3 and 3 messages\n"
                              "\nstates\n"
                              "  /GSM RR Info/RR State: 1 and 1 transitions\n"
                              "       A     B  B - A\n"
                              "    50 %  75 %    +25  RR_IDLE\n"
                              "    50 %  25 %    -25  RR_PLMN_LIST_CONSTRUCTION\n"
                              "  /UMTS RR Info/RRC State: 0 and 0 transitions\n"
                              "    A  B  B - A\n");
    const Json compared = object(files);
    EXPECT_EQ(compared["compared"], "statistics");
    const Json state = compared["technologies"][0]["states"][0];
    EXPECT_EQ(state["values"][0].dump(),
              R"({"value":5,"text":"RR_IDLE","a":0.5,"b":0.75,"difference":0.25})");
}

TEST_F(DiffCommandTest, NumbersAreSideBySideWithTheirDifference) {
    writeStates("a.pcapng");
    writeRecording("b.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    const Json compared = object({"--select", "/GSM RR Info/RR Status", path("a.pcapng"), path("b.pcapng")});
    const Json status = compared["technologies"][0]["numbers"][0];
    EXPECT_EQ(status["a"]["samples"], 3);
    EXPECT_EQ(status["b"]["samples"], 1);
    EXPECT_EQ(status["difference"]["mean"], 0);
    EXPECT_THAT(
        run({"diff", "--select", "/GSM RR Info/RR Status", path("a.pcapng"), path("b.pcapng")}),
        HasSubstr(
            "  /GSM RR Info/RR Status        A            3        1    1     1     1        1     1\n"
            "                                B            1        1    1     1     1        1     1\n"
            "                                B - A                 0    0     0     0        0     0\n"));
}

TEST_F(DiffCommandTest, TechnologiesThatOneHasAloneAreNamed) {
    write("both.pcapng", both());
    writeRecording("gsm.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    const std::string text = run({"diff", "--display", path("gsm.pcapng"), path("both.pcapng")});
    EXPECT_THAT(text, HasSubstr("Ostrel_GSM: no differences\n\nIFX, in B alone\n"));
    EXPECT_THAT(text, HasSubstr("  added  /Band        -  GSM 1800\n"));
    object({"--display", path("gsm.pcapng"), path("both.pcapng")});
    object({path("gsm.pcapng"), path("both.pcapng")});
}

TEST_F(DiffCommandTest, ARowIsChosenByItsNumber) {
    for (const char* const name : {"a.pcapng", "b.pcapng"}) {
        const bool isA = name[0] == 'a';
        const ArrayRef cells = makeArray();
        for (const char* const level : {isA ? "-70 dBm" : "-71 dBm", isA ? "-80 dBm" : "-85 dBm"}) {
            const DictionaryRef cell = makeDictionary();
            cell->set("Band", "GSM 900");
            cell->set("Level", level);
            cells->append(cell);
        }
        const DictionaryRef display = makeDictionary();
        display->set("Cells", cells);
        writeRecording(name, "IFX", {{at(0), serialized(display)}});
    }
    const std::string a = path("a.pcapng");
    const std::string b = path("b.pcapng");
    EXPECT_EQ(run({"diff", "--display", "--select", "/Cells/1", a, b}),
              "IFX\n"
              "           field           row  A        B        B - A\n"
              "  changed  /Cells/*/Level  1    -80 dBm  -85 dBm     -5\n");
    EXPECT_THAT(run({"diff", "--display", "--select", "/Cells/*/Level", a, b}),
                HasSubstr("  changed  /Cells/*/Level  0    -70 dBm  -71 dBm     -1\n"));
}

TEST_F(DiffCommandTest, NothingIsComparedWithWhatCannotBeRead) {
    writeStates("a.pcapng");
    EXPECT_EQ(run({"diff", path("a.pcapng"), path("gone.pcapng")}, 1), "");
    EXPECT_EQ(_errors, "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
}

TEST_F(DiffCommandTest, StandardInputIsOneOfThem) {
    writeStates("a.pcapng");
    EXPECT_EQ(run({"diff", "--display", "-", path("a.pcapng")}, 0, contentOf("a.pcapng")),
              "Ostrel_GSM: no differences\n");
    const CommandLine line = parse({"diff", "-", "-"});
    const auto* const notice = std::get_if<CommandLine::Notice>(&line.command);
    ASSERT_TRUE(notice);
    EXPECT_THAT(notice->text, HasSubstr("standard input is read once"));
}

TEST_F(DiffCommandTest, AFileWhoseNameHasAnAtIsThatFile) {
    EXPECT_EQ(DiffInput::of("drive.pcapng@+60").file, "drive.pcapng");
    EXPECT_TRUE(DiffInput::of("drive.pcapng@+60").time);
    EXPECT_EQ(DiffInput::of("me@home.pcapng").file, "me@home.pcapng");
    EXPECT_FALSE(DiffInput::of("me@home.pcapng").time);
    EXPECT_EQ(DiffInput::of("@+60").file, "@+60");
    writeStates("drive@+60");
    EXPECT_EQ(DiffInput::of(path("drive@+60")).file, path("drive@+60"));
    EXPECT_EQ(DiffInput::of(path("drive@+60@+1")).file, path("drive@+60"));
}

} // namespace
} // namespace velmora
