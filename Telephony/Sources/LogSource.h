// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <functional>
#include <string_view>

namespace velmora {

/// Where a source's log messages go: the log server, or a test's list.
class LogSink {
public:
    virtual ~LogSink() = default;
    /// One log message, exactly as it is to arrive at the application's port.
    virtual void receive(const Data& message) = 0;
    /// False while the queue of a client that still reads is full. A source with a pace of its own ignores
    /// it; one that runs as fast as possible waits.
    [[nodiscard]] virtual bool hasRoom() const = 0;
    /// The source has sent its last message, and sends no more unless it is started again.
    virtual void sourceEnded() {}
};

/// A source of log messages: a synthetic drive, a recording, a modem. Runs on the main queue; sends a bounded
/// number of messages per wake-up. Main thread only.
class LogSource {
public:
    virtual ~LogSource() = default;
    /// The constant of the source's log technology; empty while it is unknown.
    [[nodiscard]] virtual std::string_view technology() const = 0;
    /// `changed` is called whenever the technology has become another one, started or not; an empty function
    /// removes it. Later messages are of the new technology. A source whose technology never changes need not
    /// override it.
    // NOLINTNEXTLINE(performance-unnecessary-value-param) those that override it keep the function
    virtual void setTechnologyCallback(std::function<void()> /*changed*/) {}
    /// Starts sending from the first message, never inside this call. Precondition: not started. The sink
    /// must live until `stop`.
    virtual void start(LogSink& sink) = 0;
    /// Stops sending. Allowed at any time, also from inside the sink.
    virtual void stop() = 0;
};

} // namespace velmora
