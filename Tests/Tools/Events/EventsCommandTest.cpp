// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Events/EventsFixture.h"

#include <algorithm>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <sstream>

#include <fcntl.h>
#include <sys/stat.h>

namespace velmora {
namespace {

using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

class EventsCommandTest : public EventsTest {};

const std::string camped = "2026-11-16T05:00:10.000Z              info      radio-state         RR: "
                           "RR_PLMN_LIST_CONSTRUCTION to RR_IDLE";
const std::string lost = "2026-11-16T05:00:20.000Z              info      radio-state         RR: RR_IDLE to "
                         "RR_PLMN_LIST_CONSTRUCTION";

TEST_F(EventsCommandTest, ListsWhatHappenedInColumns) {
    ToolProcess process(shipped({"events", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), camped + "\n" + lost + "\n");
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(EventsCommandTest, NamesTheRecordsWhereAskedFor) {
    ToolProcess process(shipped({"events", "--records", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), HasSubstr(camped + "  ["));
    EXPECT_THAT(process.output(), HasSubstr("2]\n"));
}

TEST_F(EventsCommandTest, StandardInputIsAFileLikeOthers) {
    ToolProcess::Setup setup = shipped({"events", "-"});
    setup.input = contentOf("drive.pcapng");
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), camped + "\n" + lost + "\n");
}

TEST_F(EventsCommandTest, RangeListsWhatLiesInItAndKnowsWhatWasBefore) {
    ToolProcess later(shipped({"events", "--from", "+15", path("drive.pcapng")}));
    EXPECT_EQ(later.exitStatus(), 0);
    EXPECT_EQ(later.output(), lost + "\n");
    ToolProcess earlier(shipped({"events", "--to", "+20", path("drive.pcapng")}));
    EXPECT_EQ(earlier.exitStatus(), 0);
    EXPECT_EQ(earlier.output(), camped + "\n");
}

TEST_F(EventsCommandTest, KindsAndSeveritiesAreSelected) {
    const std::vector<nlohmann::json> all = listed({recordings + "gsm.pcapng"});
    for (const auto& [option, value, member] :
         {std::tuple{"--kind", "radio-state", "kind"}, {"--severity", "critical", "severity"}}) {
        std::vector<nlohmann::json> expected;
        std::copy_if(
            all.begin(), all.end(), std::back_inserter(expected),
            [&, name = member, text = value](const nlohmann::json& event) { return event.at(name) == text; });
        EXPECT_EQ(listed({option, value, recordings + "gsm.pcapng"}), expected) << option;
        EXPECT_LT(expected.size(), all.size());
    }
    EXPECT_EQ(listed({"--kind", "radio-state,mobility-state", recordings + "gsm.pcapng"}).size(),
              listed({"--kind", "radio-state", recordings + "gsm.pcapng"}).size() +
                  listed({"--kind", "mobility-state", recordings + "gsm.pcapng"}).size());
}

TEST_F(EventsCommandTest, AnUnknownKindIsAUsageErrorThatNamesTheNearest) {
    ToolProcess process(shipped({"events", "--kind", "radio-state,handovr", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 2);
    EXPECT_THAT(process.errors(),
                StartsWith("velmora-log: --kind: got handovr, wanted a kind of event; the nearest are "
                           "handover, "));
    EXPECT_EQ(process.output(), "");
}

TEST_F(EventsCommandTest, OptionsThatMakeNoSenseTogetherAreRefused) {
    const std::string file = path("drive.pcapng");
    for (const auto& [arguments, message] : {
             std::pair{std::vector<std::string>{"--safe", file}, "--safe: got another format"},
             {{"--records", "--format", "csv", file}, "--records: got another format"},
             {{"--count", "1", file}, "--count: got a FILE too"},
             {{"--duration", "1", file}, "--duration: got a FILE too"},
             {{"--timeout", "1", file}, "--timeout: got a FILE too"},
             {{"--technology", "LTE"}, "--technology: got no FILE"},
             {{"--exec", "'a", file}, "--exec: got a ' without its end"},
             {{"--exec-timeout", "1", file}, "--exec"},
             {{"--fail-on", "bad", file}, "got bad, wanted info or warning or critical"},
         }) {
        std::vector<std::string> all{"events"};
        all.insert(all.end(), arguments.begin(), arguments.end());
        ToolProcess process(shipped(all));
        EXPECT_EQ(process.exitStatus(), 2) << message;
        EXPECT_THAT(process.errors(), HasSubstr(message));
    }
}

TEST_F(EventsCommandTest, EventsOfAllTechnologiesAreSortedByBegin) {
    std::vector<std::string> files;
    for (const char* const name : {"lte", "gsm", "utran", "c2k", "ifx", "modem"})
        files.push_back(recordings + name + ".pcapng");
    const std::vector<nlohmann::json> events = listed(files);
    EXPECT_TRUE(std::is_sorted(events.begin(), events.end(),
                               [](const auto& a, const auto& b) { return a.at("time") < b.at("time"); }));
    std::vector<std::string> technologies;
    for (const nlohmann::json& event : events)
        technologies.push_back(event.at("technology"));
    std::sort(technologies.begin(), technologies.end());
    technologies.erase(std::unique(technologies.begin(), technologies.end()), technologies.end());
    EXPECT_EQ(technologies.size(), 6U);
}

TEST_F(EventsCommandTest, SeverityOfEventsIsTheStatusWhereAskedFor) {
    const std::string file = path("drive.pcapng");
    for (const auto& [arguments, status] : {
             std::pair{std::vector<std::string>{"--fail-on", "info", file}, 3},
             {{"--fail-on", "warning", file}, 0},
             {{"--fail-on", "critical", recordings + "modem.pcapng"}, 3},
             {{"--fail-on", "critical", "--kind", "context-up", recordings + "modem.pcapng"}, 0},
         }) {
        std::vector<std::string> all{"events"};
        all.insert(all.end(), arguments.begin(), arguments.end());
        ToolProcess process(shipped(all));
        EXPECT_EQ(process.exitStatus(), status) << testing::PrintToString(arguments);
    }
}

TEST_F(EventsCommandTest, ADamagedFileIsBadInputWhateverHappened) {
    std::ofstream(path("cut.pcapng"), std::ios::binary)
        << contentOf("drive.pcapng").substr(0, contentOf("drive.pcapng").size() - 10);
    ToolProcess process(shipped({"events", "--fail-on", "info", path("cut.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_THAT(process.output(), AllOf(HasSubstr(camped + "\n"), HasSubstr("  malformed  ")));
    EXPECT_THAT(process.errors(), HasSubstr("cut.pcapng: record 3 at offset"));
}

TEST_F(EventsCommandTest, RulesOfAFileFindEventsToo) {
    const std::string rules =
        withRules("[[rule]]\nname = \"searching\"\nwhen = \"'/GSM/GSM RR Info/RR State' == 4\"\n"
                  "severity = \"critical\"\ntext = \"searches\"\n");
    const std::vector<nlohmann::json> events =
        listed({"--rules", rules, "--kind", "searching", "--fail-on", "critical", path("drive.pcapng")}, 3);
    ASSERT_THAT(events, testing::SizeIs(2));
    EXPECT_EQ(events[0].at("time"), "2026-11-16T05:00:00.000000000Z");
    EXPECT_EQ(events[0].at("end"), "2026-11-16T05:00:10.000000000Z");
    EXPECT_EQ(events[0].at("text"), "searches");
    EXPECT_EQ(events[1].at("time"), "2026-11-16T05:00:20.000000000Z");
    EXPECT_EQ(events[1].at("end"), nullptr);
}

TEST_F(EventsCommandTest, MistakesInTheUsersRulesAreReportedAndThoseAskedForEndIt) {
    const std::string bad = "[[rule]]\nname = \"a\"\nwhen = \"serving.\"\ntext = \"\"\n";
    ToolProcess given(shipped({"events", "--rules", withRules(bad), path("drive.pcapng")}));
    EXPECT_EQ(given.exitStatus(), 1);
    EXPECT_EQ(given.output(), "");
    EXPECT_THAT(given.errors(), HasSubstr("my.toml:3:"));

    std::filesystem::create_directories(path("config/velmora/rules"));
    std::ofstream(path("config/velmora/rules/own.toml")) << bad;
    ToolProcess own(shipped({"events", path("drive.pcapng")}));
    EXPECT_EQ(own.exitStatus(), 0);
    EXPECT_EQ(own.output(), camped + "\n" + lost + "\n");
    EXPECT_THAT(own.errors(), HasSubstr("own.toml:3:"));

    ToolProcess without(shipped({"events", "--no-rules", path("drive.pcapng")}));
    EXPECT_EQ(without.exitStatus(), 0);
    EXPECT_EQ(ownMessages(without.errors()), "");
}

TEST_F(EventsCommandTest, ALiveListOfAPipeComesAsItBecomesKnown) {
    const std::string pipe = path("pipe");
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    ToolProcess process(shipped({"events", "--live", pipe}));
    const FileDescriptor end(::open(pipe.c_str(), O_WRONLY | O_CLOEXEC));
    const std::string content = contentOf("drive.pcapng");
    // All but the last message's block, which is as long as the others.
    const std::size_t first = content.size() - 48;
    ASSERT_EQ(::write(end.get(), content.data(), first), static_cast<ssize_t>(first));
    EXPECT_TRUE(process.waitFor(camped + "\n"));
    EXPECT_EQ(process.output().find(lost), std::string::npos);
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 128 + SIGTERM);
}

TEST_F(EventsCommandTest, ProgramRunsForEachEvent) {
    std::ofstream(path("note"))
        << "#!/bin/sh\necho \"$1 $VELMORA_EVENT_KIND $VELMORA_EVENT_TIME $VELMORA_EVENT_TO\" >> '"
        << path("notes") << "'\n";
    std::filesystem::permissions(path("note"), std::filesystem::perms::owner_all);
    ToolProcess process(
        shipped({"events", "--exec", "'" + path("note") + "' \"two words\"", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(contentOf("notes"),
              "two words radio-state 2026-11-16T05:00:10.000000000Z RR_IDLE\n"
              "two words radio-state 2026-11-16T05:00:20.000000000Z RR_PLMN_LIST_CONSTRUCTION\n");
    EXPECT_EQ(process.output(), camped + "\n" + lost + "\n");
}

TEST_F(EventsCommandTest, ProgramThatCannotBeStartedIsBadInput) {
    ToolProcess process(shipped({"events", "--exec", path("none"), path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: --exec: radio-state: cannot run " + path("none") +
                                                 ": No such file or directory\n");
    EXPECT_EQ(process.output(), camped + "\n" + lost + "\n");
}

TEST_F(EventsCommandTest, ASignalEndsTheProgramsAndThenTheCommand) {
    ToolProcess process(shipped(
        {"events", "--exec", "sh -c 'echo $$ > \"$0\"; sleep 1000' " + path("id"), path("drive.pcapng")}));
    ASSERT_TRUE(comesToBe([this] { return contentOf("id").ends_with("\n"); }));
    const pid_t id = std::stoi(contentOf("id"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 128 + SIGINT);
    EXPECT_NE(::kill(id, 0), 0);
}

TEST_F(EventsCommandTest, ASignalIsNoticedWhileItWaitsForAPipe) {
    const std::string pipe = path("pipe");
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    ToolProcess process(shipped({"events", "--live", "--exec", "true", pipe}));
    const FileDescriptor end(::open(pipe.c_str(), O_WRONLY | O_CLOEXEC));
    const std::string content = contentOf("drive.pcapng");
    const std::size_t first = content.size() - 48;
    ASSERT_EQ(::write(end.get(), content.data(), first), static_cast<ssize_t>(first));
    ASSERT_TRUE(process.waitFor(camped + "\n"));
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 128 + SIGTERM);
}

} // namespace
} // namespace velmora
