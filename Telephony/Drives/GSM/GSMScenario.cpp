// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMScenario.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/GSM/GSMTruth.h"
#include "Telephony/Drives/ServingMeasurement.h"

namespace velmora {
namespace {

constexpr int reselectionMargin_dB = 6;
constexpr double reselectionTime_s = 5;

} // namespace

/// The round.
const DriveScenario::Phase GSMScenario::phases[] = {
    {9, &GSMScenario::begin<&GSMProcedures::powerOn>},
    {7, &GSMScenario::begin<&GSMProcedures::attach>},
    {45, nullptr}, // idle on GSM
    {40, &GSMScenario::begin<&GSMProcedures::startSession>},
    {30, &GSMScenario::begin<&GSMProcedures::endSession>},
    {25, &GSMScenario::begin<&GSMProcedures::startCall>},
    {20, &GSMScenario::begin<&GSMProcedures::handOverToUMTS>},
    {30, &GSMScenario::begin<&GSMProcedures::endCall>},
    {65, &GSMScenario::begin<&GSMProcedures::startSession>},
    {20, &GSMScenario::begin<&GSMProcedures::endSession>},
    {20, &GSMScenario::begin<&GSMProcedures::reselectToGSM>},
    {20, &GSMScenario::begin<&GSMProcedures::reselectToUMTS>},
    {20, &GSMScenario::begin<&GSMProcedures::reselectToGSM>},
    {6, &GSMScenario::begin<&GSMProcedures::powerOff>},
};

const DriveScenario::Phase GSMScenario::incidents[] = {
    {9, &GSMScenario::begin<&GSMProcedures::powerOn>},
    {7, &GSMScenario::begin<&GSMProcedures::attach>},
    {5, nullptr},
    {12, &GSMScenario::begin<&GSMProcedures::startCall>},
    {12, &GSMScenario::begin<&GSMProcedures::reestablishCall>},
    {8, &GSMScenario::begin<&GSMProcedures::endCall>},
    {12, &GSMScenario::begin<&GSMProcedures::startCall>},
    {15, &GSMScenario::begin<&GSMProcedures::loseCall>},
    {60, &GSMScenario::holdOn},
    {15, &GSMScenario::letGo},
    {12, &GSMScenario::reselectEarly},
    {12, &GSMScenario::reselectEarly},
    {60, &GSMScenario::holdOn},
    {15, &GSMScenario::letGo},
    {12, &GSMScenario::reselectEarly},
    {6, &GSMScenario::begin<&GSMProcedures::powerOff>},
};

GSMScenario::GSMScenario(std::uint64_t seed)
    : DriveScenario(seed ^ 0x5EED, phases), _network(seed),
      _procedures(_phone, _network, script()), _context{_phone, _network, random()} {}

void GSMScenario::addIncidents() {
    setRound(incidents);
}

std::string_view GSMScenario::technology() const {
    return kVoxLogChannelTechnology_Ostrel_GSM;
}

void GSMScenario::drive(double seconds) {
    _network.drive(seconds);
    if (_phone.gsm.cell)
        _phone.gsm = updatedMeasurement(_phone.gsm, _network.gsm());
    if (_phone.umts.cell)
        _phone.umts = updatedMeasurement(_phone.umts, _network.umts());
}

void GSMScenario::reselectEarly() {
    constexpr int margin_dB = 4;
    for (const GSMMeasurement& each : _network.gsm())
        if (_phone.gsm.cell && each.cell != _phone.gsm.cell &&
            each.rssi_dBm <= _phone.gsm.rssi_dBm - margin_dB) {
            _procedures.reselectWithinGSM(now(), each);
            return;
        }
}

void GSMScenario::react() {
    if (!script().empty())
        return;
    const bool gsm = _phone.radio == GSMPhone::Radio::GSM && _phone.gsm.cell && !_network.gsm().empty();
    const bool umts = _phone.radio == GSMPhone::Radio::UMTS && _phone.umts.cell && !_network.umts().empty();
    const bool better =
        (gsm && _network.gsm().front().rssi_dBm >= _phone.gsm.rssi_dBm + reselectionMargin_dB) ||
        (umts && _network.umts().front().rscp_dBm >= _phone.umts.rscp_dBm + reselectionMargin_dB);
    if (timeToReselect(better && !_isHoldingOn, reselectionTime_s)) {
        if (gsm)
            _procedures.reselectWithinGSM(now(), _network.gsm().front());
        else
            _procedures.reselectWithinUMTS(now(), _network.umts().front());
        return;
    }
    const bool moved = _phone.area() != _phone.registeredArea || _phone.registeredRadio != _phone.radio;
    if (_phone.registered && moved && _phone.connection == GSMPhone::Connection::None)
        _procedures.updateArea(now());
}

void GSMScenario::addReports(DriveScript& due) {
    schedule(reportsOf(_phone), _context, 0.137, due);
}

UnusualMessageParts GSMScenario::unusualMessageParts(std::size_t number) {
    UnusualMessageParts material{
        *registrationReport(_context),
        records::servingNetwork(0, records::ServiceType::CSAndPS, _phone.area()).cutTo(31),
        gsmMeasurementReport(_context)};
    // The count of a measurement record says two more than there are.
    if (material.overrun)
        material.overrun->u8(28, static_cast<std::int64_t>((material.overrun->size() - 29) / 14) + 2);
    if (allUnusualMessages[number % allUnusualMessages.size()] == UnusualMessage::UnknownCode)
        material.noise = random().between(0, 1 << 20);
    return material;
}

std::unique_ptr<DriveTruth> GSMScenario::makeTruth(TruthSink& sink) const {
    return std::make_unique<GSMTruth>(_context, sink);
}

} // namespace velmora
