// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemManagerSource.h"

#include "Telephony/ModemManager/ModemMessage.h"

#include <string>
#include <utility>

namespace velmora {

ModemManagerSource::ModemManagerSource(MainQueue& queue, const Clock& clock, const Options& options)
    : _queue(queue), _clock(clock), _memory(options.directory), _follower(queue, options.follower, *this) {}

void ModemManagerSource::start(LogSink& sink) {
    _sink = &sink;
    _started = std::make_shared<bool>(true);
    const std::weak_ptr<bool> started = _started;
    _queue.async([this, started] {
        if (!started.expired())
            begin();
    });
    _queue.after(patience, [this, started] {
        if (!started.expired() && !_follower.presence())
            reportAbsence({});
    });
}

void ModemManagerSource::stop() {
    _session.reset();
    _started.reset();
    _sink = nullptr;
}

void ModemManagerSource::begin() {
    _session.reset();
    if (_follower.modem())
        _session = std::make_unique<ModemSession>(
            _queue, _clock, _follower, _memory,
            [this](std::uint32_t code, const Dictionary& root) { send(code, root); });
    else if (_follower.presence())
        reportAbsence(*_follower.presence());
}

void ModemManagerSource::reportAbsence(const Presence& presence) {
    // The receiver may stop the source.
    const std::weak_ptr<bool> started = _started;
    const DictionaryRef root = rootWithoutModem(presence);
    for (const std::uint32_t code : liveModemCodes())
        if (!started.expired())
            send(code, *root);
}

void ModemManagerSource::reportObstacle() {
    const Modem* modem = _follower.modem();
    const std::string obstacle = modem ? obstacleOf(*modem) : std::string();
    if (obstacle.empty())
        _follower.faults().clear("obstacle");
    else
        _follower.faults().report("obstacle", "modem " + std::to_string(modem->index) + ' ' + obstacle);
}

void ModemManagerSource::send(std::uint32_t code, const Dictionary& root) {
    if (_sink)
        _sink->receive(liveModemRecord(code, root).message(_clock.now()));
}

void ModemManagerSource::modemChosen() {
    // Deferred: the sink is called by the queue alone.
    _session.reset();
    _queue.async([this, weak = std::weak_ptr<bool>(_alive)] {
        if (weak.expired())
            return;
        reportObstacle();
        if (!_follower.owner().empty() && !std::exchange(_hasRestored, true))
            SignalRate::restoreRemembered(_follower, _memory);
        if (_sink)
            begin();
    });
}

void ModemManagerSource::modemChanged() {
    reportObstacle();
    if (_session)
        _session->modemChanged();
}

void ModemManagerSource::objectChanged(const std::string& path, const Array& arguments) {
    if (_session)
        _session->objectChanged(path, arguments);
}

} // namespace velmora
