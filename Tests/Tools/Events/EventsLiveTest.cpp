// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Events/EventsFixture.h"
#include "Tests/Tools/FakeLogService.h"

#include <algorithm>
#include <csignal>
#include <memory>
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
    const std::string rules =
        withRules("[[rule]]\nname = \"searching\"\nwhen = \"'/GSM/GSM RR Info/RR State' == 4\"\n"
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
    const std::string rules =
        withRules("[[rule]]\nname = \"searching\"\nwhen = \"'/GSM/GSM RR Info/RR State' == 4\"\n"
                  "text = \"searches\"\n");
    startService();
    ToolProcess process(
        shipped({"events", "--kind", "searching", "--rules", rules, "--exec",
                 "sh -c 'echo $VELMORA_EVENT_STATE $$ >> \"$0\"; sleep 1000' " + path("notes")}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4));
    ASSERT_TRUE(comesToBe([this] { return contentOf("notes").ends_with("\n"); }));
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
class ReplayedEventsTest : public EventsLiveTest, public testing::WithParamInterface<const char*> {
protected:
    [[nodiscard]] std::unique_ptr<ToolProcess> replay() const {
        auto service = std::make_unique<ToolProcess>(
            tool({"--source", "replay:" + recordings + GetParam() + ",speed=max"}),
            VELMORA_BUILD_DIR "/velmora-telephonyd");
        // A client that comes before it would wait for its next attempt.
        EXPECT_TRUE(comesToBe([this] { return portFiles().size() > 1; })); // the lock and the socket
        return service;
    }
    /// Messages of these have no time stamp of the modem.
    [[nodiscard]] static bool hasArrivalAlone() {
        const std::string name = GetParam();
        return name == "ifx.pcapng" || name == "modem.pcapng";
    }
    /// Leaves out what depends on the time of arrival, which is another each time.
    static void normalise(std::vector<nlohmann::json>& events) {
        for (nlohmann::json& event : events) {
            for (nlohmann::json& record : event.at("evidence"))
                record.erase("file");
            if (hasArrivalAlone()) {
                event.erase("end");
                event.at("fields").erase("duration");
            }
            if (hasArrivalAlone() || event.at("kind") == "malformed")
                event.erase("time");
        }
    }
};

TEST_P(ReplayedEventsTest, LiveAndFromARecordingAreTheSame) {
    // More than there are: both end with the source.
    const std::string count = "100000";
    {
        const auto service = replay();
        ToolProcess recorder(tool({"record", "--count", count, path("copy.pcapng")}));
        ASSERT_EQ(recorder.exitStatus(), 1) << recorder.errors();
    }
    std::vector<nlohmann::json> recorded = listed({"--clock", "modem", "--live", path("copy.pcapng")});
    const auto service = replay();
    std::vector<nlohmann::json> live = listed({"--clock", "modem", "--count", count, "--timeout", "30"}, 1);
    normalise(recorded);
    normalise(live);
    EXPECT_EQ(live, recorded);
    EXPECT_GT(recorded.size(), 10U);
}

INSTANTIATE_TEST_SUITE_P(Technologies, ReplayedEventsTest,
                         testing::Values("gsm.pcapng", "lte.pcapng", "utran.pcapng", "c2k.pcapng",
                                         "ifx.pcapng", "modem.pcapng"),
                         [](const auto& each) {
                             const std::string name = each.param;
                             return name.substr(0, name.find('.'));
                         });

} // namespace
} // namespace velmora
