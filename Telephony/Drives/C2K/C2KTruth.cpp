// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/C2K/C2KTruth.h"

#include <algorithm>
#include <string>

namespace velmora {
namespace {

using namespace records;

/// The codes of C2KRecords.h whose records state the phone.
enum Code : std::uint32_t {
    oneXStates = 0x119C,
    evdoStates = 0x1183,
    systems = 0x134F,
    frames = 0x119D,
    forwardLink = 0x1192,
    reverseLink = 0x127E
};

/// How much of a new frame goes into the average of their errors.
constexpr double averaging = 1.0 / 64;

// The names of 3GPP2 C.S0005 and C.S0024, where they are theirs.

std::string_view nameOf(OneXState state) {
    switch (state) {
    case OneXState::Inactive: return "Inactive";
    case OneXState::Initial: return "Initial state";
    case OneXState::Acquisition: return "Acquisition";
    case OneXState::Sync: return "Sync";
    case OneXState::Paging: return "Paging";
    case OneXState::SlottedSleep: return "Slotted mode sleep state";
    case OneXState::Traffic: return "Traffic";
    case OneXState::PowerUp: return "Powerup state";
    }
    return "";
}

std::string_view nameOf(EVDOState state) {
    switch (state) {
    case EVDOState::Inactive: return "Inactive";
    case EVDOState::Acquisition: return "Acquisition";
    case EVDOState::Sync: return "Sync";
    case EVDOState::Idle: return "Idle";
    case EVDOState::Access: return "Access";
    case EVDOState::Connected: return "Connected";
    }
    return "";
}

std::string_view nameOf(EVDOSession session) {
    switch (session) {
    case EVDOSession::Closed: return "Closed";
    case EVDOSession::AMPSetup: return "AMP setup";
    case EVDOSession::ATInitiated: return "AT-initiated";
    case EVDOSession::Initiated: return "Initiated";
    case EVDOSession::Open: return "Open";
    }
    return "";
}

} // namespace

void C2KTruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    const C2KPhone& phone = _context.phone;
    if (code == oneXStates) {
        // The receiver's sleep between two pages is no state of the phone's procedures.
        _oneX.update(at, nameOf(_context.receiver), true);
        followCall(at);
    }
    _evdo.update(at, nameOf(phone.evdo), code == evdoStates);
    _session.update(at, nameOf(phone.session), code == evdoStates);
    followMeasurements(at, code);
    followTraffic(at, code);
    _oneXCell.update(at, oneXServing(code));
    _evdoCell.update(at, evdoServing(code));
}

void C2KTruth::followCall(TruthTime at) {
    const bool isInTraffic = _context.phone.inTraffic();
    if (isInTraffic != _wasInTraffic)
        tell(at, isInTraffic ? "call-setup" : "call-end", "state", std::string(nameOf(_context.receiver)));
    _wasInTraffic = isInTraffic;
}

void C2KTruth::followMeasurements(TruthTime at, std::uint32_t code) {
    const std::size_t limit = _context.phone.inTraffic() ? 3 : 1;
    if (!_context.phone.serving)
        _conditions.lose(at);
    if (code == oneXStates && _context.phone.serving) {
        double best_dB = -31;
        for (const C2KPilot& pilot : _context.activeSet(limit))
            best_dB = std::max(best_dB, pilot.ecio_dB);
        _conditions.measureQuality(at, "CDMA2000 1x", best_dB);
    }
    if (code == frames) {
        _errorRate += averaging * ((_context.isFrameErased ? 1 : 0) - _errorRate);
        _errors.measure(at, _errorRate > 0.05, _errorRate <= 0.03);
    } else if (code == oneXStates && !_context.phone.inTraffic()) {
        _errorRate = 0;
        _errors.lose(at);
    }
    if (code != 0) {
        _conditions.confirm(at);
        _errors.confirm(at);
    }
}

void C2KTruth::followTraffic(TruthTime at, std::uint32_t code) {
    const auto count = [](std::optional<std::int64_t>& last, std::optional<bool>& isMoving,
                          std::int64_t bits) {
        if (last)
            isMoving = bits != *last;
        last = bits;
    };
    const ForwardPackets& forward = _context.forward;
    const ReversePackets& reverse = _context.reverse;
    if (code == forwardLink)
        count(_received, _isReceiving, 1024 * forward.of1024 + 2048 * forward.of2048 + 4096 * forward.of4096);
    else if (code == reverseLink)
        count(_sent, _isSending, 256 * reverse.of256 + 1024 * reverse.of1024 + 4096 * reverse.of4096);
    const bool isStalled = _isReceiving == false && _isSending == true;
    _stall.measure(at, isStalled, !isStalled);
    if (code != 0)
        _stall.confirm(at);
}

void C2KTruth::finish() {
    _stall.finish();
    _conditions.finish();
    _errors.finish();
}

TruthServing C2KTruth::oneXServing(std::uint32_t code) const {
    const C2KPhone& phone = _context.phone;
    TruthServing serving;
    serving.mode = serving.shown = phone.inTraffic() ? TruthMode::Connected : TruthMode::Idle;
    serving.isStated = code == systems || code == oneXStates;
    const bool hasCell = phone.oneX == OneXState::Paging || phone.inTraffic();
    if (!hasCell || !phone.serving)
        return serving;
    const C2KSector& sector = phone.serving->sector;
    serving.cell = {"CDMA2000 1x", sector.channel, sector.pnOffset, sector.baseId};
    return serving;
}

TruthServing C2KTruth::evdoServing(std::uint32_t code) const {
    const C2KPhone& phone = _context.phone;
    TruthServing serving;
    serving.mode = serving.shown = phone.onPacketData() ? TruthMode::Connected : TruthMode::Idle;
    serving.isStated = code == evdoStates;
    if (phone.evdo < EVDOState::Idle || !phone.serving)
        return serving;
    const C2KSector& sector = phone.serving->sector;
    serving.cell = {"EV-DO", sector.packetChannel, sector.pnOffset, sector.baseId};
    return serving;
}

} // namespace velmora
