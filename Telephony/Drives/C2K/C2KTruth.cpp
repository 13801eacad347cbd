// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/C2K/C2KTruth.h"

#include <string>

namespace velmora {
namespace {

using namespace records;

/// The codes of C2KRecords.h whose records state the phone.
enum Code : std::uint32_t { oneXStates = 0x119C, evdoStates = 0x1183, systems = 0x134F };

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
    _oneXCell.update(at, oneXServing(code));
    _evdoCell.update(at, evdoServing(code));
}

void C2KTruth::followCall(TruthTime at) {
    const bool isInTraffic = _context.phone.inTraffic();
    if (isInTraffic != _wasInTraffic)
        tell(at, isInTraffic ? "call-setup" : "call-end", "state", std::string(nameOf(_context.receiver)));
    _wasInTraffic = isInTraffic;
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
