// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

// velmora-log rules as a process.

namespace velmora {
namespace {

using testing::HasSubstr;

class RulesCommandTest : public ToolTest {
protected:
    /// With the display templates that are shipped.
    [[nodiscard]] ToolProcess::Setup shipped(std::vector<std::string> arguments) const {
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
        setup.environment["XDG_CONFIG_HOME"] = path("config");
        return setup;
    }
    void write(const std::string& name, const std::string& text) const {
        std::filesystem::create_directories(std::filesystem::path(path(name)).parent_path());
        std::ofstream(path(name)) << text;
    }
    /// A rule about a level of so many dBm, and a test that expects an event from that second on.
    static std::string rule(const std::string& name, const std::string& limit, int begin) {
        return "[[rule]]\nname = \"" + name + "\"\nwhen = \"serving.level < " + limit +
               "\"\ntext = \"{serving.level}\"\n[[rule.test]]\nname = \"falls\"\nvalues = [\n"
               "{ at = 0, serving.level = -90 }, { at = 1, serving.level = -111 }]\nevents = [{ begin = " +
               std::to_string(begin) + " }]\n";
    }
};

TEST_F(RulesCommandTest, CheckCountsRulesAndTests) {
    write("my.toml", rule("a", "-110", 1) + rule("b", "-100", 5));
    ToolProcess process(shipped({"rules", "check", path("my.toml")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), path("my.toml") + ": 2 rules, 2 tests\n");
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(RulesCommandTest, CheckCountsTheValuesThatHaveClasses) {
    write("my.toml", "[[class]]\nvalue = \"serving.level\"\nradio-technology = [\"LTE\", \"NR\"]\n"
                     "fair = -120\ngood = -105\nexcellent = -90\n");
    ToolProcess process(shipped({"rules", "check", path("my.toml")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), path("my.toml") + ": 0 rules, 0 tests, classes of 2 values\n");
}

TEST_F(RulesCommandTest, CheckReportsMistakesInClassesWithTheirPlace) {
    write("my.toml", "[[class]]\nvalue = \"serving.level\"\nradio-technology = \"LTE\"\n"
                     "fair = -90\ngood = -105\nexcellent = -80\n");
    ToolProcess process(shipped({"rules", "check", path("my.toml")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: " + path("my.toml") +
                  ":5:8: got limits that do not ascend, wanted fair below good\n");
}

TEST_F(RulesCommandTest, CheckReportsMistakesWithTheirPlace) {
    write("my.toml", rule("a", "-110 dB", 1) + rule("b", "-100", 1));
    ToolProcess process(shipped({"rules", "check", path("my.toml"), path("none.toml")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(),
              path("my.toml") + ": 1 rule, 1 test\n" + path("none.toml") + ": 0 rules, 0 tests\n");
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: " + path("my.toml") +
                  ":3:23: got a number in dBm and a number in dB, wanted the same unit\nvelmora-log: " +
                  path("none.toml") + ": cannot be opened: No such file or directory\n");
}

TEST_F(RulesCommandTest, TestReportsWhatARuleMakesInstead) {
    write("my.toml", rule("a", "-110", 1) + rule("b", "-100", 5));
    ToolProcess process(shipped({"rules", "test", path("my.toml")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), path("my.toml") + ": 2 rules, 1 of 2 tests passed\n");
    EXPECT_EQ(
        ownMessages(process.errors()),
        "velmora-log: " + path("my.toml") +
            ":14:1: b, \"falls\": got 1 s to an unknown end \"-111 dBm\", wanted 5 s to an unknown end\n");
}

TEST_F(RulesCommandTest, WithoutFilesTheBuiltInRulesAndTheUsersAreMeant) {
    write("config/velmora/rules/mine.toml", rule("weak-coverage", "-110", 1));
    ToolProcess process(shipped({"rules", "test"}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), HasSubstr("/coverage.toml: "));
    EXPECT_THAT(process.output(), HasSubstr(path("config/velmora/rules/mine.toml") + ": "));
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(RulesCommandTest, BuiltInRulesThatTheUsersTemplateHasNoPathsForAreLeftOut) {
    // The fixture's template of GSM has the sections at the root.
    ToolProcess process(tool({"rules", "check"}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(ownMessages(process.errors()),
                HasSubstr("got the path '/UMTS/BLER/Transport Channels/0/CRC Received', wanted"));
    EXPECT_THAT(ownMessages(process.errors()), HasSubstr("; the rule is left out\n"));
}

TEST_F(RulesCommandTest, AnotherActionIsAUsageError) {
    ToolProcess process(shipped({"rules", "list"}));
    EXPECT_EQ(process.exitStatus(), 2);
    EXPECT_THAT(ownMessages(process.errors()), HasSubstr("ACTION: got list, wanted check or test\n"));
}

} // namespace
} // namespace velmora
