// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Tools/Decode/DecodeLinesFixture.h"

#include <gmock/gmock.h>

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

// `decode --warm`, and `--from` and `--code` without it.

namespace velmora {
namespace {

class DecodeWarmTest : public DecodeLinesTest {
protected:
    /// The lines of the text from the one with this beginning on.
    static std::string linesFrom(const std::string& text, const std::string& beginning) {
        const std::size_t at = text.find("\n" + beginning);
        return at == std::string::npos ? std::string() : text.substr(at + 1);
    }
};

TEST_F(DecodeWarmTest, ColdDecodingLacksWhatEarlierMessagesAndOtherCodesLeave) {
    writeDrive("a.pcapng");
    const std::vector<std::string> csv = {
        "--format", "csv", "--every", "message", "--select", "/GSM RR Info/RR State", path("a.pcapng")};
    const auto with = [&](std::vector<std::string> options) {
        options.insert(options.end(), csv.begin(), csv.end());
        return decode(options);
    };
    const std::string header = "time,/GSM RR Info/RR State\r\n";
    EXPECT_EQ(with({"--from", "+1.5"}), header + "2026-11-16T05:00:01.500000000Z,\r\n"
                                                 "2026-11-16T05:00:02.000000000Z,RR_IDLE\r\n");
    EXPECT_EQ(with({"--warm", "--from", "+1.5"}),
              header + "2026-11-16T05:00:01.500000000Z,RR_PLMN_LIST_CONSTRUCTION\r\n"
                       "2026-11-16T05:00:02.000000000Z,RR_IDLE\r\n");
    EXPECT_EQ(with({"--code", "0x1234"}), header + "2026-11-16T05:00:01.500000000Z,\r\n");
    EXPECT_EQ(with({"--code", "0x512C"}), header +
                                              "2026-11-16T05:00:00.000000000Z,RR_PLMN_LIST_CONSTRUCTION\r\n"
                                              "2026-11-16T05:00:02.000000000Z,RR_IDLE\r\n");
}

TEST_F(DecodeWarmTest, FinalDisplayIsThatOfTheWholeFile) {
    writeDrive("a.pcapng");
    for (const char* from : {"+1.5", "+100"})
        for (const char* format : {"text", "json"})
            EXPECT_EQ(decode({"--warm", "--from", from, "--format", format, path("a.pcapng")}),
                      decode({"--format", format, path("a.pcapng")}));
    EXPECT_EQ(decode({"--warm", "--from", "+1.5", "--to", "+2", "--format", "json", path("a.pcapng")}),
              decode({"--to", "+2", "--format", "json", path("a.pcapng")}));
}

TEST_F(DecodeWarmTest, LinesOfADriveAreThoseOfTheWholeFromThenOn) {
    for (const ScenarioKind& kind : scenarioKinds()) {
        const std::unique_ptr<Scenario> scenario = kind.make(1);
        std::vector<TimedMessage> messages;
        while (messages.empty() || messages.back().time < at(30'000)) {
            const ScenarioEvent event = scenario->next();
            messages.push_back({at(0) + event.offset, event.message});
        }
        const std::string file = std::string(kind.name) + ".pcapng";
        writeRecording(file, std::string(shortTechnologyName(scenario->technology())), messages);
        const std::vector<std::vector<std::string>> formats = {
            {"--format", "jsonl"},
            {"--format", "jsonl", "--every", "message"},
            {"--format", "csv", "--select", "/"},
            {"--format", "csv", "--select", "/", "--every", "message"}};
        for (const std::vector<std::string>& format : formats) {
            const auto linesWith = [&](std::vector<std::string> options) {
                options.insert(options.begin(), {"decode", "--log-level", "0"});
                options.insert(options.end(), format.begin(), format.end());
                options.push_back(path(file));
                ToolProcess::Setup setup = tool(options);
                setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
                ToolProcess process(setup);
                EXPECT_EQ(process.exitStatus(), 0) << process.errors();
                return process.output();
            };
            const bool isCsv = format[1] == "csv";
            const std::string all = linesWith({});
            // What the first line from 20 s on begins with.
            const std::string beginning = std::string(isCsv ? "" : "{\"time\":\"") + "2026-11-16T05:00:2";
            const std::string expected = linesFrom(all, beginning);
            ASSERT_NE(expected, "") << kind.name;
            const std::string header = isCsv ? all.substr(0, all.find('\n') + 1) : std::string();
            EXPECT_TRUE(linesWith({"--warm", "--from", "2026-11-16T05:00:20Z"}) == header + expected)
                << kind.name << testing::PrintToString(format);
        }
    }
}

} // namespace
} // namespace velmora
