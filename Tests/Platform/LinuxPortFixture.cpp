// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Platform/LinuxPortFixture.h"

#include "Platform/Linux/LoopTimer.h"
#include "Tests/Support/OwnProgram.h"

#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <sys/wait.h>

#include <algorithm>
#include <csignal>
#include <cstring>
#include <stdexcept>

namespace velmora {

bool eventually(const std::function<bool()>& condition) {
    // The condition may change in another thread or process, which does not wake this one.
    LoopTimer look([] {});
    look.startRepeating(std::chrono::milliseconds(1));
    return testLoop().runUntil(condition, std::chrono::seconds(10));
}

void turnLoop() {
    int turns = 0;
    EXPECT_FALSE(testLoop().runUntil([&turns] { return ++turns > 1000; }, std::chrono::milliseconds(20)));
}

Data dataOf(std::string_view text) {
    return Data(std::vector<std::uint8_t>(text.begin(), text.end()));
}

std::string textOf(const Data& data) {
    return {data.bytes().begin(), data.bytes().end()};
}

EchoProcess::EchoProcess(const std::string& directory, const std::string& name) {
    int ends[2];
    if (::pipe(ends) != 0)
        throw std::runtime_error("no pipe");
    _id = ::fork();
    if (_id == 0) {
        ::dup2(ends[1], STDOUT_FILENO);
        ::close(ends[0]);
        ::execl(ownProgram(), "echo-process", "--echo", directory.c_str(), name.c_str(), nullptr);
        ::_exit(127);
    }
    ::close(ends[1]);
    char ready = 0;
    const auto count = ::read(ends[0], &ready, 1);
    ::close(ends[0]);
    if (count != 1)
        throw std::runtime_error("the echo process did not start");
}

EchoProcess::~EchoProcess() {
    kill();
}

void EchoProcess::kill(int signalNumber) {
    if (_id < 0)
        return;
    ::kill(_id, signalNumber);
    if (signalNumber == SIGKILL)
        (void)waitForExit();
}

int EchoProcess::waitForExit() {
    int status = 0;
    ::waitpid(std::exchange(_id, -1), &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

LinuxPortTest::LinuxPortTest() {
    _options.directory = _directory.path();
}

std::vector<std::string> LinuxPortTest::files() const {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(_directory.path()))
        names.push_back(entry.path().filename().string());
    std::sort(names.begin(), names.end());
    return names;
}

std::shared_ptr<LocalPort> LinuxPortTest::listening(const std::string& name) {
    auto created = LinuxMessagePorts(_options).createLocal(
        name, [this](LocalPort&, std::int32_t id, const Data& payload) {
            _messages.push_back({id, textOf(payload)});
            return std::nullopt;
        });
    EXPECT_TRUE(created.port);
    EXPECT_FALSE(created.alreadyExisted);
    created.port->attachToMainQueue();
    return created.port;
}

FileDescriptor LinuxPortTest::rawClient(const std::string& name) const {
    FileDescriptor socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
    sockaddr_un address = {};
    address.sun_family = AF_UNIX;
    std::strncpy(address.sun_path, path(name).c_str(), sizeof address.sun_path - 1);
    EXPECT_EQ(::connect(socket.get(), reinterpret_cast<sockaddr*>(&address), sizeof address), 0);
    return socket;
}

FileDescriptor LinuxPortTest::rawServer(const std::string& name) const {
    FileDescriptor socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
    sockaddr_un address = {};
    address.sun_family = AF_UNIX;
    std::strncpy(address.sun_path, path(name).c_str(), sizeof address.sun_path - 1);
    EXPECT_EQ(::bind(socket.get(), reinterpret_cast<sockaddr*>(&address), sizeof address), 0);
    EXPECT_EQ(::listen(socket.get(), 8), 0);
    return socket;
}

Data LinuxPortTest::receive(const FileDescriptor& socket, std::size_t count) const {
    std::vector<std::uint8_t> received;
    EXPECT_TRUE(eventually([&] {
        std::uint8_t bytes[65536];
        while (received.size() < count) {
            const auto wanted = std::min(count - received.size(), sizeof bytes);
            const auto some = ::recv(socket.get(), bytes, wanted, MSG_DONTWAIT);
            if (some <= 0)
                return some == 0;
            received.insert(received.end(), bytes, bytes + some);
        }
        return true;
    }));
    return Data(std::move(received));
}

bool LinuxPortTest::isClosedByPeer(const FileDescriptor& socket) const {
    return eventually([&] {
        pollfd poll = {socket.get(), POLLRDHUP, 0};
        return ::poll(&poll, 1, 0) == 1 && (poll.revents & (POLLHUP | POLLRDHUP)) != 0;
    });
}

void sendAll(const FileDescriptor& socket, const Data& bytes) {
    EXPECT_EQ(::send(socket.get(), bytes.bytes().data(), bytes.size(), MSG_NOSIGNAL),
              static_cast<ssize_t>(bytes.size()));
}

} // namespace velmora
