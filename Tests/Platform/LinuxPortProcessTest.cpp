#include "Tests/Platform/LinuxPortFixture.h"

#include <gmock/gmock.h>

#include <csignal>

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
