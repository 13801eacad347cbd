// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Platform/MessagePort.h"
#include "Telephony/Service/LogFilter.h"

#include <cstdint>
#include <memory>
#include <string>

namespace velmora {

/// One client's log channel: the port that takes its commands and the connection to its own port, on which
/// the messages go. The log server owns it, answers its commands and closes it. Main thread only.
class LogChannel : public std::enable_shared_from_this<LogChannel> {
public:
    /// More than this many messages that wait for the client to take them is no room.
    static constexpr std::size_t roomyQueue = 2000;
    /// A client that has had no room for so long is not waited for until it has some.
    static constexpr std::chrono::seconds patience{1};

    LogChannel(MainQueue& queue, std::shared_ptr<LocalPort> commands,
               std::shared_ptr<RemotePort> application);
    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    [[nodiscard]] const std::string& name() const { return _commands->name(); }
    [[nodiscard]] const std::string& applicationName() const { return _application->name(); }
    [[nodiscard]] bool isOpen() const { return _open; }
    [[nodiscard]] bool isStreaming() const { return _open && _streaming; }

    /// Streams from now on what the filter passes; a channel that streams already changes its filter.
    void stream(LogFilter filter);
    /// Sends the message where the channel streams and the filter passes it. Never blocks: where the client
    /// is slow its connection drops the oldest messages and says how many.
    void send(const Data& message);
    /// Whether the client can take more; true for one that is not worth waiting for.
    [[nodiscard]] bool hasRoom();

    /// Closes both ports, without a call of their invalidation callbacks.
    void close();

private:
    MainQueue& _queue;
    std::shared_ptr<LocalPort> _commands;
    std::shared_ptr<RemotePort> _application;
    bool _open = true;
    bool _streaming = false;
    LogFilter _filter;
    bool _full = false;    ///< it had no room when it was last looked at
    bool _givenUp = false; ///< it has been full for longer than the patience
    std::uint64_t _fullTimes = 0;
};

} // namespace velmora
