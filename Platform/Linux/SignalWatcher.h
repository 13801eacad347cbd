// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/Ports/SocketWatch.h"

#include <csignal>
#include <functional>
#include <memory>

namespace velmora {

/// Turns SIGINT, SIGTERM and SIGHUP into a call on the main thread, so that a program stops cleanly, and lets
/// SIGPIPE be ignored, so that writing to a closed pipe is an error like any other. A SIGHUP that is ignored,
/// as nohup(1) has it, stays ignored. One a process at a time; destroying it restores the earlier signal
/// handlers. Main thread only, on its event loop.
class SignalWatcher {
public:
    using Callback = std::function<void(int signalNumber)>;

    /// The callback runs on the event loop for every signal that arrives, and may destroy the watcher. Throws
    /// std::system_error when the process is out of file descriptors, std::logic_error when there is a
    /// watcher already.
    explicit SignalWatcher(Callback callback);
    ~SignalWatcher();
    SignalWatcher(const SignalWatcher&) = delete;
    SignalWatcher& operator=(const SignalWatcher&) = delete;

    /// Whether a signal has arrived that the callback has not been called for: for work that takes long.
    [[nodiscard]] static bool hasSignal();

private:
    void takeSignals();

    std::shared_ptr<const Callback> _callback;
    FileDescriptor _readEnd;
    FileDescriptor _writeEnd;
    std::unique_ptr<SocketWatch> _watch;
    struct sigaction _earlierInterrupt = {};
    struct sigaction _earlierTerminate = {};
    struct sigaction _earlierHangUp = {};
    struct sigaction _earlierPipe = {};
};

} // namespace velmora
