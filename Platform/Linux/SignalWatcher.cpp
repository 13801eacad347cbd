// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/SignalWatcher.h"

#include <fcntl.h>

#include <atomic>
#include <cerrno>
#include <stdexcept>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

// A handler has no other way to find the pipe.
std::atomic<int> signalPipe = -1;
std::atomic<int> waitingSignals = 0; ///< in the pipe
static_assert(std::atomic<int>::is_always_lock_free, "a signal handler may use nothing else");

extern "C" void velmoraForwardSignal(int signalNumber) {
    const int error = errno;
    const auto byte = static_cast<unsigned char>(signalNumber);
    // A full pipe already holds more signals than are needed.
    if (::write(signalPipe.load(), &byte, 1) == 1)
        ++waitingSignals;
    errno = error;
}

void setHandler(int signalNumber, void (*handler)(int), struct sigaction* earlier) {
    struct sigaction action = {};
    action.sa_handler = handler;
    action.sa_flags = SA_RESTART;
    sigemptyset(&action.sa_mask);
    ::sigaction(signalNumber, &action, earlier);
}

} // namespace

SignalWatcher::SignalWatcher(Callback callback)
    : _callback(std::make_shared<const Callback>(std::move(callback))) {
    if (signalPipe.load() >= 0)
        throw std::logic_error("there is a signal watcher already");
    int ends[2];
    if (::pipe2(ends, O_CLOEXEC | O_NONBLOCK) != 0)
        throw std::system_error(errno, std::generic_category(), "cannot make a pipe for signals");
    _readEnd = FileDescriptor(ends[0]);
    _writeEnd = FileDescriptor(ends[1]);
    _watch = std::make_unique<SocketWatch>(ends[0], SocketWatch::For::Reading, [this] { takeSignals(); });
    signalPipe = ends[1];
    setHandler(SIGINT, velmoraForwardSignal, &_earlierInterrupt);
    setHandler(SIGTERM, velmoraForwardSignal, &_earlierTerminate);
    ::sigaction(SIGHUP, nullptr, &_earlierHangUp);
    if (_earlierHangUp.sa_handler != SIG_IGN)
        setHandler(SIGHUP, velmoraForwardSignal, &_earlierHangUp);
    setHandler(SIGPIPE, SIG_IGN, &_earlierPipe);
}

SignalWatcher::~SignalWatcher() {
    ::sigaction(SIGINT, &_earlierInterrupt, nullptr);
    ::sigaction(SIGTERM, &_earlierTerminate, nullptr);
    ::sigaction(SIGHUP, &_earlierHangUp, nullptr);
    ::sigaction(SIGPIPE, &_earlierPipe, nullptr);
    signalPipe = -1;
    waitingSignals = 0;
}

bool SignalWatcher::hasSignal() {
    return waitingSignals.load() > 0;
}

void SignalWatcher::takeSignals() {
    // One signal a turn: the callback may destroy the watcher, and the watch fires again while bytes are
    // left.
    unsigned char signalNumber = 0;
    if (::read(_readEnd.get(), &signalNumber, 1) != 1)
        return;
    --waitingSignals;
    const auto callback = _callback;
    (*callback)(signalNumber);
}

} // namespace velmora
