// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemScenario.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/Modem/ModemCellReports.h"
#include "Telephony/Drives/Modem/ModemReports.h"
#include "Telephony/Drives/Modem/ModemTruth.h"

#include <algorithm>

namespace velmora {

namespace {

using Radio = ModemCell::Radio;

constexpr double reselectionMargin_dB = 4;
constexpr double reselectionTime_s = 2;

/// The most that flows down, in bit/s; up it is a fifth.
double capacityOf(const ModemCell& cell) {
    switch (cell.radio) {
    case Radio::GSM: return 180e3;
    case Radio::UMTS: return 7e6;
    case Radio::LTE: return 3e3 * cell.bandwidth_kHz;
    case Radio::NR: return 4e3 * cell.bandwidth_kHz;
    }
    return 0;
}

} // namespace

/// The round; the procedures are in ModemProcedures.cpp.
const DriveScenario::Phase ModemScenario::phases[] = {
    {2, &ModemScenario::loseManager},
    {2, &ModemScenario::losePermission},
    {2, &ModemScenario::findNoModem},
    {6, &ModemScenario::plugInLocked},
    {24, &ModemScenario::unlock}, // to GSM, idle
    {25, &ModemScenario::startSession},
    {25, &ModemScenario::changeToUMTS},
    {25, &ModemScenario::changeToLTE},
    {15, &ModemScenario::changeLTECarrier},
    {25, &ModemScenario::addSecondary},
    {25, &ModemScenario::changeToNR},
    {15, &ModemScenario::changeNRCarrier},
    {12, &ModemScenario::loseCoverage},
    {10, &ModemScenario::findLimitedService},
    {20, &ModemScenario::changeSIM},
    {6, &ModemScenario::unplug},
    {4, &ModemScenario::returnWithoutSIM},
    {12, &ModemScenario::returnWithSIM},
    {4, &ModemScenario::stopAnswering},
};

const DriveScenario::Phase ModemScenario::incidents[] = {
    {6, &ModemScenario::plugInLocked},  {20, &ModemScenario::unlock},
    {15, &ModemScenario::startSession}, {20, &ModemScenario::stall},
    {15, &ModemScenario::flow},         {5, &ModemScenario::stall}, // too short for an event
    {10, &ModemScenario::flow},         {15, &ModemScenario::changeToLTE},
    {25, &ModemScenario::stall},        {15, &ModemScenario::flow},
    {6, &ModemScenario::unplug},
};

ModemScenario::ModemScenario(std::uint64_t seed)
    : DriveScenario(seed ^ 0xA11, phases), _network(seed), _context{_phone, _network} {}

void ModemScenario::addIncidents() {
    setRound(incidents);
}

std::string_view ModemScenario::technology() const {
    return kVoxLogChannelTechnology_Modem;
}

void ModemScenario::camp(Radio radio, std::size_t carrier) {
    _phone.radio = radio;
    _phone.carrier = carrier;
    const std::vector<ModemCell> cells = cellsOf(_network, radio, carrier);
    _phone.serving = cells.empty() ? std::nullopt : std::optional(cells.front());
    updateSecondary();
    updateRegistration();
}

void ModemScenario::updateSecondary() {
    _phone.secondary.reset();
    if (!_phone.hasSecondary || !_phone.serving)
        return;
    if (const std::vector<ModemCell> cells = cellsOf(_network, Radio::NR, 0); !cells.empty())
        _phone.secondary = cells.front();
}

void ModemScenario::updateRegistration() {
    using MM::Registration;
    if (!_phone.serving)
        _phone.registration = Registration::Searching;
    else if (_isLimited)
        _phone.registration = Registration::Denied;
    else
        _phone.registration =
            _phone.serving->area.plmn.mnc == _phone.slot ? Registration::Home : Registration::Roaming;
    _phone.state = !_phone.isRegistered() ? MM::State::Searching
                   : _phone.isConnected() ? MM::State::Connected
                                          : MM::State::Registered;
}

void ModemScenario::drive(double seconds) {
    _network.drive(seconds);
    if (!_phone.serving)
        return;
    const std::vector<ModemCell> cells = cellsOf(_network, _phone.radio, _phone.carrier);
    const auto found = std::find_if(cells.begin(), cells.end(), [this](const ModemCell& each) {
        return each.isSameCellAs(*_phone.serving);
    });
    if (found != cells.end()) {
        _phone.serving = *found;
        updateSecondary();
    } else {
        camp(_phone.radio, _phone.carrier);
    }
    for (ModemBearer& each : _phone.bearers) {
        each.downlink_bps = _phone.serving ? capacityOf(*_phone.serving) * random().unit() : 0;
        each.uplink_bps = each.downlink_bps / 5;
        if (_isStalled)
            each.downlink_bps = 0;
    }
}

void ModemScenario::react() {
    const auto cells =
        _phone.serving ? cellsOf(_network, _phone.radio, _phone.carrier) : std::vector<ModemCell>();
    const bool better =
        !cells.empty() && cells.front().level_dBm >= _phone.serving->level_dBm + reselectionMargin_dB;
    if (!timeToReselect(better, reselectionTime_s))
        return;
    addStep(0, [this] {
        if (_phone.serving)
            camp(_phone.radio, _phone.carrier);
        return modemReports::cells(_context);
    });
    addStep(0.01, [this] { return modemReports::registration(_context); });
}

void ModemScenario::addReports(DriveScript& due) {
    schedule(reportsOf(_phone), _context, 0.037, due);
}

void ModemScenario::countUntil(double at) {
    _context.now_s = at;
    const double passed_s = at - _countedUntil;
    _countedUntil = at;
    for (ModemBearer& each : _phone.bearers) {
        if (!each.isConnected || each.isSuspended)
            continue;
        // The connection may have begun in the meantime.
        const double counted_s = std::min(passed_s, at - each.start_s);
        each.received += each.downlink_bps * counted_s / 8;
        each.sent += each.uplink_bps * counted_s / 8;
    }
}

UnusualMessageParts ModemScenario::unusualMessageParts(std::size_t number) {
    // Which message is cut changes from round to round of the kinds of damage.
    const std::size_t round = number / allUnusualMessages.size();
    const auto all = allModemReports();
    // A message that none receives is not the answer that the next rates count from.
    ModemPhone phone = _phone;
    ModemReportContext context{phone, _network, _context.now_s, _context.cellReports};
    RecordBuilder cut = *all[round % all.size()].make(context);
    cut.cutTo(cut.size() - 1);
    return {*modemReports::cells(context), cut, modemReports::unreasonableCells(_phone),
            static_cast<std::int64_t>(number)};
}

std::unique_ptr<DriveTruth> ModemScenario::makeTruth(TruthSink& sink) const {
    return std::make_unique<ModemTruth>(_phone, _network, sink);
}

} // namespace velmora
