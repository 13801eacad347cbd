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
    virtual void take(const Data& message) = 0;
    /// False while a client that is worth waiting for still has much to take. A source that keeps a pace of
    /// its own sends on regardless; one that runs as fast as it can waits.
    [[nodiscard]] virtual bool hasRoom() const = 0;
};

/// Something that speaks as a modem does: a synthetic drive, a recording, a modem. Runs on the main queue; in
/// one wake-up it sends a bounded number of messages. Main thread only.
class LogSource {
public:
    virtual ~LogSource() = default;
    /// The constant of the log technology that the source speaks; empty while it does not know yet.
    [[nodiscard]] virtual std::string_view technology() const = 0;
    /// `changed` is called whenever the technology has become another one, started or not; an empty function
    /// takes it back. What is sent from then on is of the new technology. A source that speaks one technology
    /// for all its life need not override it.
    // NOLINTNEXTLINE(performance-unnecessary-value-param) those that override it keep the function
    virtual void whenTechnologyChanges(std::function<void()> /*changed*/) {}
    /// Begins to send from the very beginning, never from inside this call. Precondition: not started. The
    /// sink must live until `stop`.
    virtual void start(LogSink& sink) = 0;
    /// Sends nothing more. Allowed at any time, also from inside the sink.
    virtual void stop() = 0;
};

} // namespace velmora
