// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/ServiceManager.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/NotifySocket.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <cstdlib>
#include <string>
#include <unistd.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class ServiceManagerTest : public testing::Test {
protected:
    ~ServiceManagerTest() override { ::unsetenv("NOTIFY_SOCKET"); }

    [[nodiscard]] std::string path(const char* name) const { return (_directory / name).string(); }

    TemporaryDirectory _directory;
    CapturedLog _log;
};

TEST_F(ServiceManagerTest, HearsHowFarTheServiceHasCome) {
    for (const std::string& address : {path("notify"), "@velmora-test-" + std::to_string(::getpid())}) {
        NotifySocket socket(address);
        ::setenv("NOTIFY_SOCKET", address.c_str(), 1);
        const ServiceManager manager;
        EXPECT_THAT(socket.take(), IsEmpty());
        manager.ready("serving scenario:gsm");
        EXPECT_THAT(socket.take(), ElementsAre("READY=1\nSTATUS=serving scenario:gsm"));
        manager.stopping();
        EXPECT_THAT(socket.take(), ElementsAre("STOPPING=1"));
    }
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(ServiceManagerTest, AStatusIsOneLine) {
    NotifySocket socket(path("notify"));
    ServiceManager(socket.address()).ready("serving replay:a\nREADY=0");
    EXPECT_THAT(socket.take(), ElementsAre("READY=1\nSTATUS=serving replay:a READY=0"));
}

TEST_F(ServiceManagerTest, WithoutOneNothingIsSaid) {
    ::unsetenv("NOTIFY_SOCKET");
    const ServiceManager manager;
    manager.ready("serving");
    manager.stopping();
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(ServiceManagerTest, OneThatIsNotThereIsAnErrorLine) {
    ServiceManager(path("gone")).stopping();
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{3, "service manager at " + path("gone") +
                                                                   ": No such file or directory"}));
}

TEST_F(ServiceManagerTest, OneThatDoesNotReadIsNotWaitedFor) {
    NotifySocket socket(path("notify"));
    const ServiceManager manager(socket.address());
    while (_log.lines().empty())
        manager.stopping();
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{3, "service manager at " + path("notify") +
                                                                   ": Resource temporarily unavailable"}));
}

TEST_F(ServiceManagerTest, ANameThatNamesNoSocketIsAnErrorLineAndNotUsed) {
    struct Row {
        std::string address;
        std::string reason;
    };
    for (const Row& row : {Row{"notify", "no socket's name, wanted an absolute path or '@' and a name"},
                           Row{"vsock:2:1", "no socket's name, wanted an absolute path or '@' and a name"},
                           Row{"/" + std::string(107, 'n'), "a name of 108 bytes, wanted at most 107"}}) {
        _log.clear();
        const ServiceManager manager(row.address);
        manager.ready("serving");
        manager.stopping();
        EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{3, "service manager at " + row.address +
                                                                       ": " + row.reason}));
    }
}

} // namespace

} // namespace velmora
