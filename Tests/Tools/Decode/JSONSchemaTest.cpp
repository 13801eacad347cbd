// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Tools/CheckedJSON.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <fstream>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

// All JSON that velmora-log writes, of drives of all technologies, against the schema that is published.

namespace velmora {
namespace {

class JSONSchemaTest : public ToolTest {
protected:
    /// Enough of the drive for every code, with a few unusual messages.
    void writeDrive(const ScenarioKind& kind, std::size_t count) const {
        const std::unique_ptr<Scenario> scenario = kind.make(1);
        const bool binary = scenario->technology() != kVoxLogChannelTechnology_IFX;
        std::vector<TimedMessage> messages;
        for (std::size_t i = 0; i < count; ++i) {
            const ScenarioEvent event = scenario->next();
            messages.push_back({at(0) + event.offset, event.message});
            if (binary && i == 10)
                for (const Data& odd :
                     {hex("01"), record(0x1234, ""), record(0x1234, "", 7), record(3, "", 0xFF)})
                    messages.push_back({at(0) + event.offset, odd});
        }
        writeRecording(std::string(kind.name) + ".pcapng",
                       std::string(shortTechnologyName(scenario->technology())), messages);
    }

    [[nodiscard]] ToolProcess::Setup shipped(std::vector<std::string> arguments) const {
        arguments.insert(arguments.end(), {"--log-level", "0"});
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
        return setup;
    }

    /// How many objects the text holds; the checker's complaint where one is wrong.
    static std::string check(const std::string& text) { return checkJSON("velmora-log.schema.json", text); }
};

/// A part of the technology's displays that is in a list where it has one.
std::string_view partOf(const ScenarioKind& kind) {
    constexpr std::pair<std::string_view, std::string_view> parts[] = {
        {"gsm", "/GSM/Neighboring Cells/1"},
        {"lte", "/Idle Mode Neighbors/Neighbor Cells List/*/Measured RSRP"},
        {"utran", "/Neighbors/Neighbor Cell List/0"},
        {"c2k", "/EV-DO"},
        {"modem", "/Neighbor Cells/Cells/0"},
        {"ifx", "/Neighbor Cells/1"}};
    for (const auto& [name, path] : parts)
        if (name == kind.name)
            return path;
    throw std::logic_error("a drive of no technology");
}

/// The technology's place among the scenarios.
class TechnologyJSONTest : public JSONSchemaTest, public testing::WithParamInterface<std::size_t> {};

TEST_P(TechnologyJSONTest, AllOfItKeepsToTheSchema) {
    constexpr std::size_t count = 200;
    const ScenarioKind& kind = scenarioKinds()[GetParam()];
    writeDrive(kind, count);
    const std::string file = path(std::string(kind.name) + ".pcapng");
    const bool binary = kind.make(1)->technology() != kVoxLogChannelTechnology_IFX;
    const std::string messages = std::to_string(binary ? count + 4 : count) + "\n";
    struct Case {
        std::vector<std::string> arguments;
        std::string objects; ///< empty for any number above 1
    };
    const Case cases[] = {
        {{"decode", "--format", "json", file}, "1\n"},
        {{"decode", "--format", "json", file, file, file}, "3\n"},
        {{"decode", "--format", "json", "--to", "0", file}, "1\n"},
        {{"decode", "--format", "jsonl", file}, ""},
        {{"decode", "--format", "jsonl", file, file}, ""},
        {{"decode", "--format", "jsonl", "--select", std::string(partOf(kind)), file}, ""},
        {{"decode", "--format", "jsonl", "--every", "message", file}, messages},
        {{"decode", "--format", "jsonl", "--every", "message", "--jobs", "2", file, "/dev/null"}, messages},
        {{"decode", "--format", "jsonl", "--every", "message", "--select", std::string(partOf(kind)), file},
         ""},
        {{"decode", "--format", "jsonl", "--samples", "--to", "+10", file}, ""},
        {{"decode", "--format", "jsonl", "--samples", "--select", "a=" + std::string(partOf(kind)), file,
          "/dev/null"},
         ""},
        {{"decode", "--format", "jsonl", "--max-age", "1", file}, ""},
    };
    for (const Case& row : cases) {
        ToolProcess process(shipped(row.arguments));
        ASSERT_TRUE(process.exitStatus()) << kind.name;
        const std::string objects = check(process.output());
        if (row.objects.empty())
            EXPECT_GT(std::atoi(objects.c_str()), 1) << objects;
        else
            EXPECT_EQ(objects, row.objects) << kind.name << testing::PrintToString(row.arguments);
    }
}

TEST_F(JSONSchemaTest, FileOfAllTechnologiesKeepsToTheSchema) {
    std::string all;
    for (const ScenarioKind& kind : scenarioKinds()) {
        writeDrive(kind, 50);
        all += contentOf(std::string(kind.name) + ".pcapng"); // a section each
    }
    std::ofstream(path("all.pcapng"), std::ios::binary) << all;
    const std::string messages = std::to_string(6 * 50 + 5 * 4) + "\n";
    for (const auto& [arguments, objects] :
         {std::pair<std::vector<std::string>, std::string>{{"--format", "json"}, "6\n"},
          {{"--format", "jsonl", "--every", "message"}, messages},
          {{"--format", "jsonl", "--from", "+1"}, ""},
          {{"--format", "jsonl", "--samples", "--to", "+2"}, ""}}) {
        std::vector<std::string> words = {"decode", path("all.pcapng")};
        words.insert(words.end(), arguments.begin(), arguments.end());
        ToolProcess process(shipped(words));
        ASSERT_TRUE(process.exitStatus());
        const std::string checked = check(process.output());
        if (objects.empty())
            EXPECT_GT(std::atoi(checked.c_str()), 6) << checked;
        else
            EXPECT_EQ(checked, objects) << testing::PrintToString(arguments);
    }
}

TEST_F(JSONSchemaTest, TechnologiesAreSix) {
    EXPECT_EQ(scenarioKinds().size(), 6U); // as many as are tested above
}

INSTANTIATE_TEST_SUITE_P(, TechnologyJSONTest, testing::Range(std::size_t{0}, std::size_t{6}),
                         [](const auto& place) { return std::string(scenarioKinds()[place.param].name); });

TEST_F(JSONSchemaTest, CheckerFindsWhatIsWrong) {
    // So that the test above can fail.
    const std::string good = R"({"time":"2026-11-16T05:00:00.000000000Z","code":null,"sections":{}})";
    EXPECT_EQ(check(good + "\n"), "1\n");
    for (const std::string& bad :
         {good,               // no end of line
          good + good + "\n", // two on a line
          std::string(R"({"time":"2026-11-16T05:00:00Z","code":null,"sections":{}})") + "\n",  // other time
          std::string(R"({"time":"2026-11-16T05:00:00.000000000Z","sections":{}})") + "\n",    // no code
          std::string(R"({"time":"2026-11-16T05:00:00.000000000Z","code":1,"sections":{},)") + // a key twice
              R"("code":1})" + "\n",
          std::string(R"({"time":"2026-11-16T05:00:00.000000000Z","code":1,"sections":{"A":1}})") + "\n",
          std::string(
              R"({"time":"2026-11-16T05:00:00.000000000Z","path":"/A","value":{},"text":"","code":1,)") +
              R"("record":1})" + "\n", // no value
          std::string(R"({"time":"2026-11-16T05:00:00.000000000Z","path":"/A","value":1,"unit":"W",)") +
              R"("text":"","code":1,"record":1})" + "\n", // another unit
          good + "\n\xFF\n",                              // no UTF-8
          good + "\nNaN\n"})
        EXPECT_THAT(check(bad), testing::StartsWith("status")) << bad;
}

} // namespace
} // namespace velmora
