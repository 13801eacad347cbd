// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Decode/Samples/SamplesFixture.h"

#include <gmock/gmock.h>

// `decode --format jsonl --every message --select`: what of the selection each message changed.

namespace velmora {
namespace {

using testing::ElementsAre;

class SelectedMessagesTest : public SamplesTest {
protected:
    std::vector<std::string> selected(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"decode", "--format", "jsonl", "--every", "message"});
        return lines(run(std::move(arguments)));
    }
};

TEST_F(SelectedMessagesTest, MessagesThatChangeNothingOfItHaveNoLine) {
    writeDrive("a.pcapng");
    EXPECT_THAT(selected({"--select", "state=/GSM RR Info/RR State", path("a.pcapng")}),
                ElementsAre(R"({"time":"2026-11-16T05:00:00.000000000Z","code":20780,"sections":)"
                            R"({"GSM RR Info":{"RR State":"RR_PLMN_LIST_CONSTRUCTION"}}})",
                            R"({"time":"2026-11-16T05:00:02.000000000Z","code":20780,"sections":)"
                            R"({"GSM RR Info":{"RR State":"RR_IDLE"}}})"));
    EXPECT_THAT(selected({"--select", "/SIM Info", path("a.pcapng")}), ElementsAre());
}

TEST_F(SelectedMessagesTest, ValuesAreThoseThatAreShownThere) {
    writeRecording("c.pcapng", "Ostrel_CDMA",
                   {{at(0), record(0x108A, "00 00 00 00 00 00 00 00 00 00")}, {at(1), hex("01")}});
    const auto with = [this](const std::string& select) {
        ToolProcess::Setup setup = tool({"decode", "--format", "jsonl", "--every", "message", "--select",
                                         select, path("c.pcapng"), "--log-level", "0"});
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 0) << process.errors();
        return process.output();
    };
    const std::string fingers =
        R"-({"time":"2026-11-16T05:00:00.000000000Z","code":4234,"values":{"kFingerC2I":"(none)"}})-"
        "\n";
    EXPECT_EQ(with("/EV-DO/Fingers"), fingers);
    EXPECT_EQ(with("/EV-DO"), fingers);
    EXPECT_EQ(with("/*/Fingers"), fingers);
    EXPECT_EQ(with("/Overview"), "");
}

TEST_F(SelectedMessagesTest, DisplaysAreRestricted) {
    write("both.pcapng", both());
    EXPECT_THAT(selected({"--select", "/Band", path("both.pcapng")}),
                ElementsAre(R"({"time":"2026-11-16T05:00:00.500000000Z","technology":"IFX",)"
                            R"("display":{"Band":"GSM 900"}})",
                            R"({"time":"2026-11-16T05:00:07.000000000Z","technology":"IFX",)"
                            R"("display":{"Band":"GSM 1800"}})"));
}

} // namespace
} // namespace velmora
