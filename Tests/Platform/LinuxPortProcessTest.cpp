// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Platform/LinuxPortFixture.h"

#include <gmock/gmock.h>
#include <grp.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <thread>

/// Ports between processes, and what is left when one of them crashes.

namespace velmora {

namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr auto noAnswer = [](LocalPort&, std::int32_t, const Data&) -> std::optional<Data> {
    return std::nullopt;
};

TEST_F(LinuxPortTest, ProcessesTalkToEachOther) {
    EchoProcess echo(_directory.path().string(), "echo");
    const auto port = LinuxMessagePorts(_options).createRemote("echo");
    ASSERT_TRUE(port);
    for (const std::size_t size :
         {std::size_t{0}, std::size_t{1}, std::size_t{1} << 20, std::size_t{16} << 20}) {
        const Data payload(std::vector<std::uint8_t>(size, 0xA5));
        const auto answer = port->sendRequest(0, payload, 5s, 5s, true);
        EXPECT_EQ(answer.status, 0);
        ASSERT_TRUE(answer.reply);
        EXPECT_TRUE(*answer.reply == payload);
    }
    echo.kill();
    EXPECT_FALSE(port->isValid());
}

TEST_F(LinuxPortTest, AnotherUsersProcessIsRefused) {
    constexpr uid_t nobody = 65534;
    if (::geteuid() != 0)
        GTEST_SKIP() << "only root can run a process as another user";
    // As open as a port directory can be, so that it is not the directory that keeps him out.
    ASSERT_EQ(::chmod(_directory.path().c_str(), 0755), 0);
    const auto port = listening("in");
    ASSERT_EQ(::chmod(path("in").c_str(), 0777), 0);

    const pid_t stranger = ::fork();
    ASSERT_GE(stranger, 0);
    if (stranger == 0) {
        // Ends with 0 when he has been turned away: connected, but the other end is closed unread.
        if (::setgroups(0, nullptr) != 0 || ::setgid(nobody) != 0 || ::setuid(nobody) != 0)
            ::_exit(1);
        const FileDescriptor socket = rawClient("in");
        char byte = 0;
        const auto got = ::recv(socket.get(), &byte, 1, 0);
        ::_exit(got == 0 || (got < 0 && errno == ECONNRESET) ? 0 : 2);
    }
    EXPECT_TRUE(eventually([&] { return !_log.lines().empty(); }));
    int status = 0;
    ASSERT_EQ(::waitpid(stranger, &status, 0), stranger);
    EXPECT_TRUE(WIFEXITED(status));
    EXPECT_EQ(WEXITSTATUS(status), 0);
    EXPECT_THAT(_messages, IsEmpty());
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{
                                  3, "Message port in: refused a peer of user 65534, wanted user 0"}));
}

TEST_F(LinuxPortTest, AnotherUsersPortIsRefused) {
    constexpr uid_t nobody = 65534;
    if (::geteuid() != 0)
        GTEST_SKIP() << "only root can run a process as another user";
    int ready[2];
    ASSERT_EQ(::pipe(ready), 0);
    const pid_t stranger = ::fork();
    ASSERT_GE(stranger, 0);
    if (stranger == 0) {
        // The directory keeps him out, so that the name is made before he is a stranger. The connection
        // belongs to who listens.
        const FileDescriptor socket = rawServer("out");
        if (::setgroups(0, nullptr) != 0 || ::setgid(nobody) != 0 || ::setuid(nobody) != 0 ||
            ::listen(socket.get(), 8) != 0 || ::write(ready[1], "", 1) != 1)
            ::_exit(1);
        // Ends with 0 when the client has turned away without a word.
        const FileDescriptor client(::accept(socket.get(), nullptr, nullptr));
        char byte = 0;
        ::_exit(::recv(client.get(), &byte, 1, 0) == 0 ? 0 : 2);
    }
    ::close(ready[1]);
    char byte = 0;
    ASSERT_EQ(::read(ready[0], &byte, 1), 1);
    ::close(ready[0]);
    EXPECT_EQ(LinuxMessagePorts(_options).createRemote("out"), nullptr);
    int status = 0;
    ASSERT_EQ(::waitpid(stranger, &status, 0), stranger);
    EXPECT_TRUE(WIFEXITED(status));
    EXPECT_EQ(WEXITSTATUS(status), 0);
    EXPECT_THAT(_log.lines(),
                ElementsAre(CapturedLog::Line{3, "Message port out: a peer of user 65534, wanted user 0"}));
}

TEST_F(LinuxPortTest, AnOwnerThatIsStartedAgainAfterACrashIsWaitedFor) {
    EchoProcess crashed(_directory.path().string(), "echo");
    crashed.kill();
    EXPECT_FALSE(LinuxMessagePorts(_options).createRemote("echo")) << "not unless it is asked for";
    _options.restartTimeout = 10s;
    std::optional<EchoProcess> again;
    std::thread starter([&] {
        std::this_thread::sleep_for(30ms); // by then it is waited for, most likely
        again.emplace(_directory.path().string(), "echo");
    });
    const auto port = LinuxMessagePorts(_options).createRemote("echo");
    starter.join();
    ASSERT_TRUE(port);
    EXPECT_EQ(port->sendRequest(0, dataOf("one"), 5s, 5s, true).status, 0);
}

TEST_F(LinuxPortTest, AnOwnerThatHasEndedOrStaysAwayIsNotWaitedForLonger) {
    _options.restartTimeout = 1h;
    EXPECT_FALSE(LinuxMessagePorts(_options).createRemote("never")) << "no crash";
    EchoProcess crashed(_directory.path().string(), "echo");
    crashed.kill();
    _options.restartTimeout = 50ms;
    EXPECT_FALSE(LinuxMessagePorts(_options).createRemote("echo"));
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(LinuxPortTest, AStoppedProcessRunsIntoTheTimeOutAndItsAnswerIsLate) {
    EchoProcess echo(_directory.path().string(), "echo");
    const auto port = LinuxMessagePorts(_options).createRemote("echo");
    ASSERT_TRUE(port);
    ASSERT_EQ(port->sendRequest(0, dataOf("one"), 5s, 5s, true).status, 0);
    echo.kill(SIGSTOP);
    EXPECT_EQ(port->sendRequest(0, dataOf("two"), 5s, 50ms, true).status, -2);
    echo.kill(SIGCONT);
    const auto answer = port->sendRequest(0, dataOf("three"), 5s, 5s, true);
    ASSERT_TRUE(answer.reply);
    EXPECT_EQ(textOf(*answer.reply), "three");
}

TEST_F(LinuxPortTest, ANameIsTakenWhileAnotherProcessLivesAndTakenOverWhenItWasKilled) {
    EchoProcess owner(_directory.path().string(), "one");
    EXPECT_TRUE(LinuxMessagePorts(_options).createLocal("one", noAnswer).alreadyExisted);
    owner.kill();
    EXPECT_THAT(files(), ElementsAre("one", "one.lock")); // as the crash has left them
    EXPECT_FALSE(LinuxMessagePorts(_options).createRemote("one"));
    const auto port = listening("one");
    sendAll(rawClient("one"), hex("00 00 00 00  01 00 00 00  04 00 00 00  00 00 00 00"));
    ASSERT_TRUE(eventually([&] { return !_messages.empty(); }));
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(LinuxPortTest, AProcessThatIsTerminatedCleansUp) {
    EchoProcess owner(_directory.path().string(), "one");
    owner.kill(SIGTERM);
    EXPECT_EQ(owner.waitForExit(), 7);
    EXPECT_THAT(files(), IsEmpty());
}

} // namespace

} // namespace velmora
