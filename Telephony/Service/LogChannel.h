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
    /// The queue length above which the client has no room.
    static constexpr std::size_t maximumQueued = 2000;
    /// How long a source waits for a client without room.
    static constexpr std::chrono::seconds slowClientTimeout{1};

    LogChannel(MainQueue& queue, std::shared_ptr<LocalPort> commands,
               std::shared_ptr<RemotePort> application);
    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    [[nodiscard]] const std::string& name() const { return _commands->name(); }
    [[nodiscard]] const std::string& applicationName() const { return _application->name(); }
    [[nodiscard]] bool isOpen() const { return _open; }
    [[nodiscard]] bool isStreaming() const { return _open && _streaming; }

    /// Streams the messages that the filter passes; a channel that already streams changes its filter.
    void stream(LogFilter filter);
    /// Sends the message where the channel streams and the filter passes it. Never blocks: if the client is
    /// slow its connection drops the oldest messages and logs how many.
    void send(const Data& message);
    /// Tells a client that streams that the source has ended.
    void sendEnd();
    /// Whether the client's queue has room; true for a client that is not waited for any more.
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
    bool _full = false;   ///< it had no room at the last check
    bool _isSlow = false; ///< it has been full for longer than `slowClientTimeout`
    std::uint64_t _fullTimes = 0;
};

} // namespace velmora
