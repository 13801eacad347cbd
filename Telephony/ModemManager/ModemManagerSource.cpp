// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemManagerSource.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"
#include "Telephony/Drives/ServiceRecords.h"
#include "Telephony/ModemManager/Reports/ModemReport.h"

#include <string>
#include <utility>

namespace velmora {
namespace {

/// The binary form: the cells of a city fit the record's length field then.
constexpr bool binary = true;

} // namespace

ModemManagerSource::ModemManagerSource(MainQueue& queue, const Clock& clock, ModemFollower::Options options)
    : _queue(queue), _clock(clock), _follower(queue, std::move(options), *this) {}

void ModemManagerSource::start(LogSink& sink) {
    _sink = &sink;
    beginSession();
}

void ModemManagerSource::stop() {
    _session.reset();
    _sink = nullptr;
}

void ModemManagerSource::beginSession() {
    if (!_sink || !_follower.modem())
        return;
    _session = std::make_unique<ModemSession>(
        _queue, _follower,
        ModemSession::Reports{
            [this](const Dictionaries& cells) { send(records::cellInformation(cells, binary)); },
            [this](const DictionaryRef& files) { send(records::simFiles(*files, binary)); },
            [this](const Dictionaries& contexts) { send(records::packetContexts(contexts, binary)); }});
}

void ModemManagerSource::send(const RecordBuilder& record) {
    if (_sink)
        _sink->receive(record.message(_clock.now()));
}

void ModemManagerSource::modemChosen() {
    const bool hadModem = std::exchange(_session, nullptr) != nullptr;
    if (hadModem) {
        // A removed modem's measurements must not stay on the screen. Its SIM's files do, since the display
        // never removes any.
        send(records::cellInformation({}, binary));
        send(records::packetContexts({}, binary));
    }
    updateTechnology(true);
    beginSession();
}

void ModemManagerSource::modemChanged() {
    updateTechnology(false);
    if (_session)
        _session->modemChanged();
}

void ModemManagerSource::objectChanged(const std::string& path, const Array& arguments) {
    if (_session)
        _session->objectChanged(path, arguments);
}

void ModemManagerSource::updateTechnology(bool newModem) {
    const Modem* modem = _follower.modem();
    if (!modem)
        return;
    // Between two networks a modem is on none; what it could do says nothing then.
    const std::string_view technology =
        newModem || _technology.empty() ? technologyOf(*modem) : accessTechnologyOf(*modem);
    if (technology.empty() || technology == _technology)
        return;
    _technology = technology;
    logFormat(LogPriority::Notice, "modemmanager: the technology is %s now",
              std::string(shortTechnologyName(technology)).c_str());
    if (_changed)
        _changed();
}

} // namespace velmora
