// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Events/EventsFixture.h"
#include "Tests/Tools/FakeLogService.h"

#include <csignal>
#include <optional>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::StartsWith;

/// Events of what a service sends.
class EventsLiveTest : public EventsTest {
protected:
    void startService() { _service.emplace(_directory / "ports", "Ostrel_GSM"); }
    [[nodiscard]] bool isStreaming() {
        return eventually([&] { return _service->streaming() == 1; });
    }

    std::optional<FakeLogService> _service;
};

const std::string camped = "info      radio-state         RR: RR_PLMN_LIST_CONSTRUCTION to RR_IDLE\n";
const std::string lost = "info      radio-state         RR: RR_IDLE to RR_PLMN_LIST_CONSTRUCTION\n";

TEST_F(EventsLiveTest, EventsAreListedAsTheyHappen) {
    startService();
    ToolProcess process(shipped({"events"}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4));
    _service->send(rrState(5));
    EXPECT_TRUE(process.waitFor(camped));
    _service->send(rrState(4));
    EXPECT_TRUE(process.waitFor(lost));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), "");
    EXPECT_THAT(portFiles(), testing::Each(testing::Not(HasSubstr("velmora.log."))));
}

TEST_F(EventsLiveTest, WhatLastsIsListedAtItsBeginAndAtItsEnd) {
    const std::string rules = withRules("[[rule]]\nname = \"searching\"\nwhen = \"radio.state == 4\"\n"
                                        "severity = \"critical\"\ntext = \"searches\"\n");
    startService();
    ToolProcess process(shipped({"events", "--format", "jsonl", "--kind", "searching", "--rules", rules,
                                 "--fail-on", "critical", "--count", "2"}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4));
    ASSERT_TRUE(process.waitFor("\n"));
    _service->send(rrState(5));
    EXPECT_EQ(process.exitStatus(), 3);
    const std::vector<nlohmann::json> events = linesOf(process.output());
    ASSERT_EQ(events.size(), 2U);
    EXPECT_EQ(events[0].at("state"), "begins");
    EXPECT_EQ(events[0].at("end"), nullptr);
    EXPECT_EQ(events[0].at("evidence"), nlohmann::json::parse(R"([{"record":1}])"));
    EXPECT_EQ(events[1].at("state"), "complete");
    EXPECT_EQ(events[1].at("time"), events[0].at("time"));
    EXPECT_GT(events[1].at("end"), events[0].at("time"));
}

TEST_F(EventsLiveTest, NothingIsClaimedAcrossALostConnection) {
    startService();
    ToolProcess process(shipped({"events"}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4));
    _service->send(rrState(5));
    ASSERT_TRUE(process.waitFor(camped));
    _service.reset();
    ASSERT_TRUE(process.waitForError("velmora-log: the telephony service is gone; waiting for it\n"));
    startService();
    ASSERT_TRUE(process.waitForError("velmora-log: the telephony service is back\n"));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4)); // not a change: what was before is not known any more
    _service->send(rrState(5));
    ASSERT_TRUE(process.waitFor(camped, process.output().find('\n')));
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), testing::Not(HasSubstr(lost)));
}

TEST_F(EventsLiveTest, EndsAfterItsTimeOrWithoutAService) {
    ToolProcess none(shipped({"events", "--timeout", "0.5"}));
    EXPECT_EQ(none.exitStatus(), 1);
    EXPECT_THAT(ownMessages(none.errors()), HasSubstr("no telephony service answers after 0.5 s; start one"));
    startService();
    ToolProcess process(shipped({"events", "--duration", "0.5"}));
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(EventsLiveTest, EndsWithItsReader) {
    startService();
    ToolProcess process(shipped({"events"}));
    ASSERT_TRUE(isStreaming());
    process.stopReading();
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(EventsLiveTest, AProgramRunsAtTheBeginOfWhatLastsAndEndsWithTheCommand) {
    const std::string rules = withRules("[[rule]]\nname = \"searching\"\nwhen = \"radio.state == 4\"\n"
                                        "text = \"searches\"\n");
    startService();
    ToolProcess process(
        shipped({"events", "--kind", "searching", "--rules", rules, "--exec",
                 "sh -c 'echo $VELMORA_EVENT_STATE $$ >> \"$0\"; sleep 1000' " + path("notes")}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4));
    ASSERT_TRUE(eventually([this] { return contentOf("notes").ends_with("\n"); }));
    ASSERT_THAT(contentOf("notes"), StartsWith("begins "));
    _service->send(rrState(5));
    _service->send(rrState(4)); // while the program runs
    ASSERT_TRUE(eventually([&] {
        const std::string& lines = process.output();
        return std::count(lines.begin(), lines.end(), '\n') == 3;
    }));
    const pid_t id = std::stoi(contentOf("notes").substr(std::string("begins ").size()));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_NE(::kill(id, 0), 0);
    EXPECT_THAT(process.errors(), HasSubstr("--exec: searching: 1 event came while the program ran\n"));
}

/// The telephony service replays a recording of each technology as fast as it is taken.
class ReplayedEventsTest : public EventsLiveTest, public testing::WithParamInterface<const char*> {};

TEST_P(ReplayedEventsTest, LiveAndFromTheFileAreTheSame) {
    const std::string file = recordings + GetParam();
    ToolProcess info(tool({"info", "--format", "json", file}));
    ASSERT_EQ(info.exitStatus(), 0);
    const nlohmann::json summary = nlohmann::json::parse(info.output());
    const std::uint64_t count = summary.at("technologies").at(0).at("messages");
    ToolProcess service(tool({"--source", "replay:" + file + ",speed=max"}),
                        VELMORA_BUILD_DIR "/velmora-telephonyd");
    std::vector<nlohmann::json> live =
        listed({"--clock", "modem", "--count", std::to_string(count), "--timeout", "30"});
    std::vector<nlohmann::json> offline = listed({"--clock", "modem", "--live", file});
    for (nlohmann::json& event : offline)
        for (nlohmann::json& record : event.at("evidence"))
            record.erase("file");
    // A message without a time stamp has one by its arrival, which was another.
    for (std::vector<nlohmann::json>* const events : {&live, &offline})
        for (nlohmann::json& event : *events)
            if (event.at("kind") == "malformed")
                event.erase("time");
    EXPECT_EQ(live, offline);
    EXPECT_GT(offline.size(), 10U);
}

// Those whose messages have time stamps: arrival is not what it was when they were recorded.
INSTANTIATE_TEST_SUITE_P(Technologies, ReplayedEventsTest,
                         testing::Values("gsm.pcapng", "lte.pcapng", "utran.pcapng", "c2k.pcapng"),
                         [](const auto& info) {
                             const std::string name = info.param;
                             return name.substr(0, name.find('.'));
                         });

} // namespace
} // namespace velmora
