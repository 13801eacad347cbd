// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/CheckedJSON.h"
#include "Tests/Tools/Events/EventsFixture.h"

#include <algorithm>

// The JSON lines of velmora-log events against the schema that is published.

namespace velmora {
namespace {

constexpr const char* schemaFile = "velmora-log-events.schema.json";

class EventsSchemaTest : public EventsTest {};

TEST_F(EventsSchemaTest, EventsOfEachTechnologyConform) {
    std::vector<std::string> arguments{"events", "--format", "jsonl", "--live"};
    for (const char* const name : {"gsm", "lte", "utran", "c2k", "ifx", "modem"})
        arguments.push_back(recordings + name + ".pcapng");
    ToolProcess process(shipped(arguments));
    EXPECT_EQ(process.exitStatus(), 0);
    const auto lines = std::count(process.output().begin(), process.output().end(), '\n');
    EXPECT_GT(lines, 100);
    EXPECT_EQ(checkJSON(schemaFile, process.output()), std::to_string(lines) + "\n");
    EXPECT_NE(process.output().find("\"state\":\"begins\""), std::string::npos);
}

TEST_F(EventsSchemaTest, CheckerFindsWhatIsWrong) {
    // So that the test above can fail.
    const std::string good =
        R"({"time":"2026-11-16T05:00:00.000000000Z","state":"complete","kind":"gap","severity":"info",)"
        R"("technology":"IFX","text":"","fields":{"value":1},"units":{"value":"dB"},"evidence":[{"record":1}]})";
    EXPECT_EQ(checkJSON(schemaFile, good + "\n"), "1\n");
    const std::string placed = R"({"latitude":-59.5,"longitude":-180,)" + good.substr(1);
    EXPECT_EQ(checkJSON(schemaFile, placed + "\n"), "1\n");
    for (const auto& [part, bad] : {
             std::pair{"05:00:00.000000000Z", "05:00:00Z"},
             {"\"complete\"", "\"ended\""},
             {"\"gap\"", "\"\""},
             {"\"info\"", "\"bad\""},
             {"\"IFX\"", "\"GSM\""},
             {"\"text\":\"\",", ""},
             {"\"value\":1", "\"value\":[]"},
             {"\"dB\"", "\"db\""},
             {"{\"record\":1}", "{\"record\":0}"},
             {"{\"record\":1}", "{\"file\":\"a\"}"},
             {"\"kind\"", "\"more\":1,\"kind\""},
             {"\"kind\"", "\"latitude\":59.5,\"kind\""}, // without the other
             {"\"kind\"", "\"latitude\":90.5,\"longitude\":18,\"kind\""},
             {"\"kind\"", "\"latitude\":59.5,\"longitude\":180,\"kind\""},
         }) {
        std::string text = good;
        text.replace(text.find(part), std::string(part).size(), bad);
        EXPECT_THAT(checkJSON(schemaFile, text + "\n"), testing::StartsWith("status")) << text;
    }
}

} // namespace
} // namespace velmora
