// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <fstream>
#include <set>
#include <sstream>
#include <string>
#include <vector>

// velmora-log fields as a process.

namespace velmora {
namespace {

using testing::HasSubstr;

class FieldsCommandTest : public ToolTest {
protected:
    /// With the display templates that are shipped.
    [[nodiscard]] ToolProcess::Setup shipped(std::vector<std::string> arguments) const {
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
        return setup;
    }
};

TEST_F(FieldsCommandTest, ListsTheFieldsOfARoleOfATechnology) {
    ToolProcess process(shipped({"fields", "--technology", "Ostrel_GSM", "--role", "radio"}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), "Ostrel_GSM\n"
                                "  /GSM/GSM RR Info/RR State     enumeration  radio.state  0x512C\n"
                                "  /UMTS/UMTS RR Info/RRC State  enumeration  radio.state  0x4125\n");
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(FieldsCommandTest, FollowsTheUsersTemplate) {
    // The fixture's template has these sections at the root, and no group around them.
    ToolProcess process(
        tool({"fields", "--technology", "Ostrel_GSM", "--role", "radio.state", "--format", "text"}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), "Ostrel_GSM\n"
                                "  /GSM RR Info/RR State    enumeration  radio.state  0x512C\n"
                                "  /UMTS RR Info/RRC State  enumeration  radio.state  0x4125\n");
}

TEST_F(FieldsCommandTest, TakesTheServicesConstantOfATechnology) {
    ToolProcess process(
        shipped({"fields", "--technology", "kVoxLogChannelTechnology_IFX", "--role=serving.level"}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), "IFX\n  /Serving Cell/RxLev  number dBm  serving.level\n");
}

TEST_F(FieldsCommandTest, JSONHasAllTechnologiesInTheServicesOrder) {
    ToolProcess process(shipped({"fields", "--format", "json"}));
    EXPECT_EQ(process.exitStatus(), 0);
    const nlohmann::json document = nlohmann::json::parse(process.output());
    std::vector<std::string> technologies;
    std::set<std::string> paths;
    for (const nlohmann::json& row : document.at("fields")) {
        const std::string technology = row.at("technology");
        if (technologies.empty() || technologies.back() != technology)
            technologies.push_back(technology);
        EXPECT_TRUE(paths.insert(technology + row.at("path").get<std::string>()).second) << row;
    }
    EXPECT_THAT(technologies, testing::ElementsAre("IFX", "Ostrel_GSM", "Ostrel_CDMA", "Ostrel_LTE",
                                                   "Ostrel_UTRAN2", "Modem"));
}

TEST_F(FieldsCommandTest, CSVHasTheSameRowsAsJSON) {
    ToolProcess csv(shipped({"fields", "--role", "neighbour", "--format", "csv"}));
    ToolProcess json(shipped({"fields", "--role", "neighbour", "--format", "json"}));
    EXPECT_EQ(csv.exitStatus(), 0);
    EXPECT_EQ(json.exitStatus(), 0);
    const nlohmann::json document = nlohmann::json::parse(json.output());
    std::string expected;
    for (const nlohmann::json& row : document.at("fields"))
        expected += row.at("technology").get<std::string>() + "," + row.at("path").get<std::string>() + "\n";
    std::istringstream lines(csv.output());
    std::string rows;
    std::string line;
    std::getline(lines, line); // the header
    while (std::getline(lines, line))
        rows += line.substr(0, line.find(',', line.find(',') + 1)) + "\n";
    EXPECT_EQ(rows, expected);
    EXPECT_THAT(rows, HasSubstr("\nOstrel_GSM,/GSM/Neighboring Cells/*/RSSI\n"));
}

TEST_F(FieldsCommandTest, TechnologyWithoutTemplateIsReportedAndTheOthersAreListed) {
    std::ofstream(path("resources/LTE.plist")) << "no property list";
    ToolProcess process(tool({"fields", "--role", "serving.level"}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_THAT(
        ownMessages(process.errors()),
        HasSubstr("velmora-log: Ostrel_LTE has no fields, since its display template cannot be read\n"));
    EXPECT_THAT(process.output(), HasSubstr("IFX\n  /Serving Cell/RxLev"));
    EXPECT_THAT(process.output(), testing::Not(HasSubstr("Ostrel_LTE")));
}

TEST_F(FieldsCommandTest, FullDiskIsReported) {
    ToolProcess::Setup setup = shipped({"fields", "--format", "csv"});
    setup.outputFile = "/dev/full";
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: cannot write standard output: No space left on device\n");
}

} // namespace
} // namespace velmora
