// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/Programs/EventPrograms.h"

#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Tools/Events/ExampleEvent.h"

#include <gmock/gmock.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <thread>

#include <unistd.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::HasSubstr;

class EventProgramsTest : public testing::Test {
protected:
    /// Programs of a shell that the test itself names as one.
    EventPrograms& run(const std::string& script, std::chrono::nanoseconds limit = 30s, bool waits = true) {
        EventPrograms::Setup setup;
        setup.arguments = {"sh", "-c", script, "sh", _directory.path().string()};
        setup.limit = limit;
        setup.waits = waits;
        setup.isInterrupted = [this] { return _isInterrupted; };
        return _programs.emplace(std::move(setup), _names);
    }

    [[nodiscard]] std::string contentOf(const std::string& name) const {
        std::ostringstream text;
        text << std::ifstream(_directory / name).rdbuf();
        return text.str();
    }

    [[nodiscard]] bool comesToBe(const std::string& name) const {
        for (int tries = 0; tries < 4000; ++tries, std::this_thread::sleep_for(10ms))
            if (!contentOf(name).empty())
                return true;
        return false;
    }

    /// Whether the process of the number in the file has ended, or does so soon.
    [[nodiscard]] bool ends(const std::string& name) const {
        const pid_t id = std::stoi(contentOf(name));
        for (int tries = 0; tries < 4000; ++tries, std::this_thread::sleep_for(10ms))
            if (::kill(id, 0) != 0 || contentOfState(id) == "Z")
                return true;
        return false;
    }

    [[nodiscard]] static std::string contentOfState(pid_t id) {
        std::ifstream file("/proc/" + std::to_string(id) + "/stat");
        std::string number;
        std::string name;
        std::string state;
        file >> number >> name >> state;
        return state;
    }

    TemporaryDirectory _directory;
    EvidenceNames _names;
    bool _isInterrupted = false;
    std::optional<EventPrograms> _programs;
};

TEST_F(EventProgramsTest, ProgramGetsTheEventInItsEnvironment) {
    Event event = eventAt(0);
    event.text = "'; touch $1/bad; echo '$(touch $1/bad)";
    EventPrograms& programs = run("printf %s \"$VELMORA_EVENT_KIND:$VELMORA_EVENT_TEXT\" > $1/out");
    programs.run(event, EventState::Complete);
    programs.finish();
    EXPECT_EQ(contentOf("out"), "handover:'; touch $1/bad; echo '$(touch $1/bad)");
    EXPECT_FALSE(std::filesystem::exists(_directory / "bad"));
    EXPECT_FALSE(programs.hasFailed());
}

TEST_F(EventProgramsTest, VariablesOfTheSamePrefixAreNotInherited) {
    ::setenv("VELMORA_EVENT_OTHER", "1", 1);
    EventPrograms& programs = run("env > $1/out");
    programs.run(eventAt(0), EventState::Complete);
    programs.finish();
    ::unsetenv("VELMORA_EVENT_OTHER");
    EXPECT_THAT(contentOf("out"), HasSubstr("VELMORA_EVENT_KIND=handover\n"));
    EXPECT_THAT(contentOf("out"), HasSubstr("PATH="));
    EXPECT_THAT(contentOf("out"), testing::Not(HasSubstr("VELMORA_EVENT_OTHER")));
}

TEST_F(EventProgramsTest, ProgramHasNoInputAndNoOtherDescriptors) {
    EventPrograms& programs = run("cat > $1/in; ls /proc/self/fd > $1/out");
    programs.run(eventAt(0), EventState::Complete);
    programs.finish();
    EXPECT_EQ(contentOf("in"), "");
    EXPECT_EQ(contentOf("out"), "0\n1\n2\n3\n"); // 3 is the directory that ls reads
}

TEST_F(EventProgramsTest, EventsOfAKindWaitForEachOther) {
    EventPrograms& programs = run("echo begin >> $1/out; sleep 0.1; echo end >> $1/out");
    for (int i = 0; i < 3; ++i)
        programs.run(eventAt(i), EventState::Complete);
    programs.finish();
    EXPECT_EQ(contentOf("out"), "begin\nend\nbegin\nend\nbegin\nend\n");
}

TEST_F(EventProgramsTest, EventsThatComeMeanwhileAreCountedWhereNoneWaits) {
    EventPrograms& programs = run("echo >> $1/out; while test ! -e $1/go; do sleep 0.01; done", 30s, false);
    testing::internal::CaptureStderr();
    for (int i = 0; i < 3; ++i)
        programs.run(eventAt(i), EventState::Complete);
    programs.run(eventAt(3, "gap"), EventState::Complete); // of its own kind
    std::ofstream(_directory / "go") << "\n";
    programs.finish();
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              "velmora-log: --exec: handover: 2 events came while the program ran\n");
    EXPECT_EQ(contentOf("out"), "\n\n");
}

TEST_F(EventProgramsTest, ProgramIsEndedWithItsChildrenAfterItsTimeLimit) {
    // Neither ends at a SIGTERM.
    EventPrograms& programs = run("trap '' TERM; sh -c 'trap \"\" TERM; while :; do sleep 0.05; done' & "
                                  "echo $! > $1/child; echo $$ > $1/own; wait; while :; do sleep 0.05; done",
                                  300ms);
    testing::internal::CaptureStderr();
    const auto begin = std::chrono::steady_clock::now();
    programs.run(eventAt(0), EventState::Complete);
    programs.finish();
    const auto duration = std::chrono::steady_clock::now() - begin;
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              "velmora-log: --exec: handover: sh was ended after its time limit; the next time is not "
              "reported\n");
    EXPECT_GE(duration, 300ms + ProgramRun::grace);
    ASSERT_TRUE(comesToBe("child"));
    EXPECT_TRUE(ends("child"));
    EXPECT_TRUE(ends("own"));
}

TEST_F(EventProgramsTest, ChildrenAreKilledAlsoWhereTheProgramItselfEndsAtOnce) {
    EventPrograms& programs =
        run("sh -c 'trap \"\" TERM; echo $$ > $1/child; while :; do sleep 0.05; done' sh $1 & wait", 500ms);
    testing::internal::CaptureStderr();
    programs.run(eventAt(0), EventState::Complete);
    ASSERT_TRUE(comesToBe("child"));
    programs.finish();
    testing::internal::GetCapturedStderr();
    EXPECT_TRUE(ends("child"));
}

TEST_F(EventProgramsTest, FailuresAreReportedOnce) {
    testing::internal::CaptureStderr();
    EventPrograms& programs = run("exit 7");
    programs.run(eventAt(0), EventState::Complete);
    programs.run(eventAt(1), EventState::Complete);
    programs.finish();
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              "velmora-log: --exec: handover: sh ended with status 7; the next time is not reported\n");
    EXPECT_FALSE(programs.hasFailed()); // the program's own affair
}

TEST_F(EventProgramsTest, AProgramThatIsNotThereIsAFailure) {
    EventPrograms programs({{"/nowhere/program"}}, _names);
    testing::internal::CaptureStderr();
    programs.run(eventAt(0), EventState::Complete);
    programs.run(eventAt(1), EventState::Complete);
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              "velmora-log: --exec: handover: cannot run /nowhere/program: No such file or directory\n");
    EXPECT_TRUE(programs.hasFailed());
}

TEST_F(EventProgramsTest, AnInterruptionEndsThoseThatRun) {
    EventPrograms& programs = run("echo $$ > $1/own; sleep 1000");
    testing::internal::CaptureStderr();
    programs.run(eventAt(0), EventState::Complete);
    ASSERT_TRUE(comesToBe("own"));
    _isInterrupted = true;
    programs.finish();
    EXPECT_FALSE(programs.isRunning());
    EXPECT_TRUE(ends("own"));
    testing::internal::GetCapturedStderr();
}

} // namespace
} // namespace velmora
