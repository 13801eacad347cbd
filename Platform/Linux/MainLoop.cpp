// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/MainLoop.h"

#include "Platform/Linux/LoopTimer.h"

#include <QCoreApplication>

#include <optional>

namespace velmora {

class MainLoop::Impl {
public:
    // The program parses its own arguments; QCoreApplication requires some that outlive it.
    char _name[8] = "velmora";
    char* _arguments[2] = {_name, nullptr};
    int _count = 1;
    QCoreApplication _application{_count, _arguments};
    std::optional<int> _status;
};

MainLoop::MainLoop() : _impl(std::make_unique<Impl>()) {}

MainLoop::~MainLoop() = default;

int MainLoop::run() {
    if (!_impl->_status) {
        const int status = QCoreApplication::exec();
        if (!_impl->_status)
            _impl->_status = status;
    }
    const int status = *_impl->_status;
    _impl->_status.reset();
    return status;
}

void MainLoop::quit(int status) {
    if (_impl->_status)
        return;
    _impl->_status = status;
    QCoreApplication::exit(status);
}

bool MainLoop::runUntil(const std::function<bool()>& done, std::chrono::nanoseconds limit) {
    bool late = false;
    LoopTimer timer([&late] { late = true; });
    timer.startOnce(limit);
    while (!done()) {
        if (late)
            return false;
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }
    return true;
}

} // namespace velmora
