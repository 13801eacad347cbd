// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/VelmoraProcessFixture.h"

#include <csignal>
#include <cstdlib>
#include <string>

namespace velmora {
namespace {

using testing::HasSubstr;
using testing::Not;

class VelmoraSelfTest : public VelmoraProcessTest, public testing::WithParamInterface<const char*> {};

TEST_P(VelmoraSelfTest, OpensEveryScreenOnTheServicesData) {
    const auto service = startService(GetParam());
    const auto app = start("velmora", {"--self-test", "--log", "stderr", "--log-level", "5"});
    EXPECT_EQ(exitStatus(*app), 0) << text("velmora.err");
    EXPECT_THAT(text("velmora.err"),
                testing::ContainsRegex("<5>Self-test: opened [0-9]+ panes and the save screen"));
    // The sockets are gone with it, the standard directory for snapshots is there.
    EXPECT_FALSE(exists("ports/com.velmora.BasebandStateReport.LogChannel"));
    EXPECT_TRUE(exists("state/velmora"));
    end(*service);
}

INSTANTIATE_TEST_SUITE_P(Technologies, VelmoraSelfTest,
                         testing::Values("gsm", "lte", "utran", "c2k", "ifx", "modem"),
                         [](const auto& row) { return std::string(row.param); });

class VelmoraRecordingTest : public VelmoraProcessTest, public testing::WithParamInterface<const char*> {};

TEST_P(VelmoraRecordingTest, OpensEveryScreenOnAFile) {
    const QString file = QString(VELMORA_SOURCE_DIR "/Tests/Recordings/%1.pcapng").arg(GetParam());
    const auto app = start("velmora", {"--self-test", "--log", "stderr", "--log-level", "5", file});
    EXPECT_EQ(exitStatus(*app), 0) << text("velmora.err");
    EXPECT_THAT(text("velmora.err"),
                testing::ContainsRegex("<5>Self-test: opened [0-9]+ panes and the save screen"));
    EXPECT_FALSE(exists("ports/com.velmora.BasebandStateReport.LogChannel")) << "it has connected";
}

INSTANTIATE_TEST_SUITE_P(Technologies, VelmoraRecordingTest,
                         testing::Values("gsm", "lte", "utran", "c2k", "ifx", "modem"),
                         [](const auto& row) { return std::string(row.param); });

TEST_F(VelmoraProcessTest, AFileThatCannotBeOpenedIsBadInput) {
    const auto app = start("velmora", {path("missing.pcapng")});
    EXPECT_EQ(exitStatus(*app), 1);
    EXPECT_EQ(text("velmora.err"), "velmora: " + path("missing.pcapng").toStdString() +
                                       ": cannot open: No such file or directory\n");
    const auto wrong = start("velmora", {"--technology", "LTE", path("missing.pcapng")}, "wrong");
    EXPECT_EQ(exitStatus(*wrong), 2);
}

class VelmoraSignalTest : public VelmoraProcessTest, public testing::WithParamInterface<int> {};

TEST_P(VelmoraSignalTest, EndsItCleanly) {
    const auto service = startService();
    const auto app = start("velmora", {"--log", "stderr"});
    ASSERT_TRUE(eventually([&] { return exists("ports/com.velmora.BasebandStateReport.LogChannel"); }));
    ::kill(static_cast<pid_t>(app->processId()), GetParam());
    EXPECT_EQ(exitStatus(*app), 0) << text("velmora.err");
    EXPECT_FALSE(exists("ports/com.velmora.BasebandStateReport.LogChannel"));
    end(*service);
}

INSTANTIATE_TEST_SUITE_P(
    Signals, VelmoraSignalTest, testing::Values(SIGINT, SIGTERM, SIGHUP), [](const auto& row) {
        return std::string(row.param == SIGINT ? "Interrupt" : row.param == SIGTERM ? "Terminate" : "HangUp");
    });

TEST_F(VelmoraProcessTest, ClosedStandardDescriptorsAreDevNull) {
    const auto service = startService();
    QProcess app;
    app.setProcessEnvironment(environment);
    app.start("/bin/sh",
              {"-c", "exec \"$0\" --log stderr --log-level 7 <&- >&- 2>&-", VELMORA_BUILD_DIR "/velmora"});
    ASSERT_TRUE(eventually([&] { return exists("ports/com.velmora.BasebandStateReport.LogChannel"); }));
    for (const char* descriptor : {"0", "1", "2"})
        EXPECT_EQ(
            std::filesystem::read_symlink("/proc/" + std::to_string(app.processId()) + "/fd/" + descriptor),
            "/dev/null");
    end(app);
    end(*service);
}

TEST_F(VelmoraProcessTest, WithoutAServiceTheLogSaysHowToStartOne) {
    const auto app = start("velmora", {"--log", "stderr"});
    EXPECT_TRUE(eventually([&] {
        return text("velmora.err")
                   .find("<3>no telephony service answers; the installed one is started by: velmora "
                         "--start-service, one with a synthetic drive by: velmora-telephonyd --source "
                         "scenario:gsm,seed=1\n") != std::string::npos;
    })) << text("velmora.err");
    EXPECT_THAT(text("velmora.err"), HasSubstr("<3>Could not create the ports necessary\n"));
    end(*app);
}

/// The process that a line of the log names after `before`; 0 where there is none.
pid_t processIn(const std::string& log, const std::string& before) {
    const auto at = log.find(before);
    return at == log.npos ? 0 : static_cast<pid_t>(std::atoi(log.c_str() + at + before.size()));
}

TEST_F(VelmoraProcessTest, BringsUpTheServiceWhereNoneIsRunning) {
    environment.insert("VELMORA_SOURCE", "scenario:gsm,seed=1");
    const std::string started =
        "<5>started " VELMORA_BUILD_DIR "/velmora-telephonyd --source scenario:gsm,seed=1 as process ";
    for (const bool isFirst : {true, false}) {
        const auto app =
            start("velmora", {"--start-service", "--self-test", "--log", "stderr", "--log-level", "5"});
        EXPECT_EQ(exitStatus(*app), 0) << text("velmora.err");
        // The first attempt to connect succeeds.
        EXPECT_THAT(text("velmora.err"), Not(HasSubstr("Could not create the ports")));
        if (isFirst)
            EXPECT_THAT(text("velmora.err"), HasSubstr(started));
        else
            EXPECT_THAT(text("velmora.err"), Not(HasSubstr("started "))) << "it runs on";
        if (isFirst)
            startedService = processIn(text("velmora.err"), started);
    }
    ASSERT_GT(startedService, 0);
    ::kill(startedService, SIGTERM);
    EXPECT_TRUE(eventually([&] { return !exists("ports/com.velmora.vox.server"); }));
}

TEST_F(VelmoraProcessTest, LeavesTheServiceToTheServiceManagerWhereThereIsOne) {
    // A manager that keeps its arguments and starts the service as the unit would.
    put("bin/systemctl",
        "#!/bin/sh\n"
        "echo \"$*\" >>\"$HOME/asked\"\n" VELMORA_BUILD_DIR
        "/velmora-telephonyd --source scenario:gsm,seed=1 2>/dev/null &\n"
        "echo $! >\"$HOME/service\"\n"
        "until [ -S \"$XDG_RUNTIME_DIR/velmora/com.velmora.vox.server\" ]; do sleep 0.01; done\n");
    environment.remove("VELMORA_PORT_DIR");
    environment.insert("HOME", path("."));
    environment.insert("XDG_RUNTIME_DIR", path("."));
    environment.insert("PATH", path("bin") + ":/usr/bin:/bin");
    const auto app =
        start("velmora", {"--start-service", "--self-test", "--log", "stderr", "--log-level", "5"});
    EXPECT_EQ(exitStatus(*app), 0) << text("velmora.err");
    startedService = processIn(text("service"), "");
    EXPECT_EQ(text("asked"), "--user --quiet start velmora-telephonyd.service\n");
    EXPECT_THAT(text("velmora.err"), HasSubstr("<5>started velmora-telephonyd.service\n"));
    EXPECT_THAT(text("velmora.err"), Not(HasSubstr("as process")));
}

TEST_F(VelmoraProcessTest, AServiceThatDoesNotComeUpIsAnErrorLineAndTheScreenIsThere) {
    environment.insert("VELMORA_SOURCE", "scenario:none");
    const auto app = start("velmora", {"--start-service", "--log", "stderr"});
    EXPECT_TRUE(eventually([&] {
        return text("velmora.err").find("<3>Could not create the ports necessary\n") != std::string::npos;
    })) << text("velmora.err");
    EXPECT_THAT(
        text("velmora.err"),
        HasSubstr("<3>telephony service: " VELMORA_BUILD_DIR
                  "/velmora-telephonyd --source scenario:none has ended, wanted a service that answers\n"));
    end(*app);
}

TEST_F(VelmoraProcessTest, NamedLogDirectoryIsNotMade) {
    const auto app = start("velmora", {"--log", "stderr", "--log-directory", path("named")});
    ASSERT_TRUE(
        eventually([&] { return text("velmora.err").find("Could not create") != std::string::npos; }));
    end(*app);
    EXPECT_FALSE(exists("named"));
    EXPECT_FALSE(exists("state/velmora"));
}

TEST_F(VelmoraProcessTest, HelpShowsTheOptionsAndAnExample) {
    const auto app = start("velmora", {"--help"});
    EXPECT_EQ(exitStatus(*app), 0);
    const std::string help = text("velmora.out");
    for (const char* part : {"--sysroot", "VELMORA_SYSROOT", "--log-directory", "VELMORA_LOG_DIRECTORY",
                             "--log ", "--log-level", "--self-test", "--start-service", "--view ",
                             "--version", "velmora-telephonyd --source scenario:gsm,seed=1"})
        EXPECT_THAT(help, HasSubstr(part));
}

TEST_F(VelmoraProcessTest, VersionIsTheProjects) {
    const auto app = start("velmora", {"--version"});
    EXPECT_EQ(exitStatus(*app), 0);
    EXPECT_EQ(text("velmora.out"), "velmora " VELMORA_TEST_VERSION "\n");
}

struct UsageRow {
    const char* name;
    QStringList arguments;
    const char* message;
};

class VelmoraUsageTest : public VelmoraProcessTest, public testing::WithParamInterface<UsageRow> {};

TEST_P(VelmoraUsageTest, IsRefused) {
    const auto app = start("velmora", GetParam().arguments);
    EXPECT_EQ(exitStatus(*app), 2);
    EXPECT_EQ(text("velmora.err"),
              std::string(GetParam().message) + "\nRun with --help for more information.\n");
}

INSTANTIATE_TEST_SUITE_P(
    Wrong, VelmoraUsageTest,
    testing::Values(
        UsageRow{"UnknownOption", {"--speed"}, "The following argument was not expected: --speed"},
        UsageRow{"UnknownLog", {"--log", "paper"}, "--log: \"paper\", wanted syslog or stderr"},
        UsageRow{"LevelTooHigh", {"--log-level", "8"}, "--log-level: Value 8 not in range 0 to 7"}),
    [](const auto& row) { return std::string(row.param.name); });

} // namespace
} // namespace velmora
