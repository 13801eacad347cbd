// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/SocketWatch.h"

#include <QSocketNotifier>

#include <utility>

namespace velmora {

class SocketWatch::Impl : public QSocketNotifier {
public:
    Impl(int descriptor, Type type, std::function<void()> action)
        : QSocketNotifier(descriptor, type), _action(std::move(action)) {
        // As with timers: an uncaught exception ends the program here.
        connect(this, &QSocketNotifier::activated, this, [this]() noexcept { run(); });
    }

    void release() {
        setEnabled(false);
        if (_depth > 0)
            deleteLater();
        else
            delete this;
    }

private:
    void run() {
        ++_depth;
        _action();
        --_depth;
    }

    std::function<void()> _action;
    int _depth = 0; ///< actions that are running; the object outlives them
};

SocketWatch::SocketWatch(int descriptor, For what, std::function<void()> action)
    : _impl(new Impl(descriptor, what == For::Reading ? QSocketNotifier::Read : QSocketNotifier::Write,
                     std::move(action))) {}

SocketWatch::~SocketWatch() {
    _impl->release();
}

void SocketWatch::setEnabled(bool enabled) {
    _impl->setEnabled(enabled);
}

} // namespace velmora
