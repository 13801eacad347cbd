// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Service/LogChannel.h"

#include "Platform/TelephonyService.h"

#include <utility>

namespace velmora {

LogChannel::LogChannel(MainQueue& queue, std::shared_ptr<LocalPort> commands,
                       std::shared_ptr<RemotePort> application)
    : _queue(queue), _commands(std::move(commands)), _application(std::move(application)) {}

void LogChannel::stream(LogFilter filter) {
    _filter = std::move(filter);
    _streaming = true;
}

void LogChannel::send(const Data& message) {
    if (!isStreaming() || !_filter.passes(message.bytes()))
        return;
    _application->post(0, message);
}

void LogChannel::sendEnd() {
    if (isStreaming())
        _application->post(vox::sourceEndedMessage, Data());
}

bool LogChannel::hasRoom() {
    if (!isStreaming() || _application->waitingMessages() < maximumQueued) {
        _full = false;
        _isSlow = false;
        return true;
    }
    if (!_full) {
        _full = true;
        _queue.after(slowClientTimeout, [weak = weak_from_this(), time = ++_fullTimes] {
            const auto self = weak.lock();
            if (self && self->_full && self->_fullTimes == time)
                self->_isSlow = true;
        });
    }
    return _isSlow;
}

void LogChannel::close() {
    _open = false;
    _commands->setInvalidationCallback(nullptr);
    _application->setInvalidationCallback(nullptr);
    _commands->invalidate();
    _application->invalidate();
}

} // namespace velmora
