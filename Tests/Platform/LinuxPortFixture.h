// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <functional>
#include <optional>
#include <string>
#include <sys/types.h>
#include <utility>
#include <vector>

/// What the tests of the Linux platform share. The test program runs one event loop, made in its `main`.

namespace velmora {

/// The program's event loop.
[[nodiscard]] MainLoop& testLoop();

/// Serves events until the condition holds; false after ten seconds, which no working test comes near.
[[nodiscard]] bool eventually(const std::function<bool()>& condition);

/// Lets the event loop go round, so that what was to happen has happened.
void turnLoop();

[[nodiscard]] Data dataOf(std::string_view text);
[[nodiscard]] std::string textOf(const Data& data);

/// Another process of this test program that owns the port `name` in `directory` and answers every request
/// with the same bytes; killed at the end.
class EchoProcess {
public:
    EchoProcess(const std::string& directory, const std::string& name);
    ~EchoProcess();
    EchoProcess(const EchoProcess&) = delete;
    EchoProcess& operator=(const EchoProcess&) = delete;

    void kill(int signalNumber = 9);
    [[nodiscard]] pid_t id() const { return _id; }
    /// Its exit status; -1 when it ended by a signal.
    [[nodiscard]] int waitForExit();

private:
    pid_t _id = -1;
};

/// A directory of its own, a captured log, and peers that speak bytes rather than messages.
class LinuxPortTest : public testing::Test {
protected:
    struct Message {
        std::int32_t id = 0;
        std::string payload;
        friend bool operator==(const Message&, const Message&) = default;
    };

    LinuxPortTest();

    [[nodiscard]] std::string path(const std::string& file) const { return (_directory / file).string(); }
    [[nodiscard]] std::vector<std::string> files() const;

    /// A local port that keeps its messages in `_messages` and answers nothing, attached.
    [[nodiscard]] std::shared_ptr<LocalPort> listening(const std::string& name);
    /// A plain blocking client socket of the port.
    [[nodiscard]] FileDescriptor rawClient(const std::string& name) const;
    /// A plain blocking listening socket under the name.
    [[nodiscard]] FileDescriptor rawServer(const std::string& name) const;
    /// What arrives until `count` bytes are there or the connection ends, the event loop running meanwhile.
    [[nodiscard]] Data receive(const FileDescriptor& socket, std::size_t count) const;
    /// The event loop runs until the peer has closed the connection.
    [[nodiscard]] bool isClosedByPeer(const FileDescriptor& socket) const;

    TemporaryDirectory _directory;
    CapturedLog _log;
    PortOptions _options;
    std::vector<Message> _messages;
};

/// Writes all of it; the peer has to read or have room.
void sendAll(const FileDescriptor& socket, const Data& bytes);

} // namespace velmora
