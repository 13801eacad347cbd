// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemCellReports.h"
#include "Telephony/Drives/Modem/ModemReports.h"
#include "Telephony/Drives/Modem/ModemScenario.h"

namespace velmora {

namespace {

using Radio = ModemCell::Radio;

constexpr double messageSpacing_s = 0.002;

} // namespace

void ModemScenario::addChange(double delay, const std::function<void()>& change) {
    const auto all = allModemReports();
    for (std::size_t i = 0; i < all.size(); ++i)
        addStep(delay + static_cast<double>(i) * messageSpacing_s, [this, i, change] {
            if (i == 0)
                change();
            return allModemReports()[i].make(_context);
        });
}

void ModemScenario::addAbsence(ModemPresence presence, const char* reason) {
    addChange(0.1, [this, presence, reason] {
        const int index = _phone.index;
        restart(_phone);
        _phone.index = index;
        _phone.presence = presence;
        _phone.reason = reason;
        _isLimited = false;
    });
}

void ModemScenario::addRegistration(double delay, Radio radio) {
    addChange(delay, [this] {
        _phone.state = MM::State::Disabled;
        _phone.serving.reset();
        _phone.secondary.reset();
    });
    addChange(delay + 0.5, [this] { _phone.state = MM::State::Enabling; });
    addChange(delay + 1.5, [this] { updateRegistration(); });
    addChange(delay + 3.5, [this, radio] { camp(radio, 0); });
}

void ModemScenario::connect(int number, bool isIPv6) {
    if (!_phone.isRegistered())
        return;
    const auto sameNumber = [number](const ModemBearer& each) { return each.number == number; };
    std::erase_if(_phone.bearers, sameNumber);
    ModemBearer& bearer = _phone.bearers.emplace_back();
    bearer.number = number;
    bearer.isIPv6 = isIPv6;
    bearer.isConnected = true;
    bearer.start_s = _context.now_s;
    updateRegistration();
}

void ModemScenario::loseManager() {
    addAbsence(ModemPresence::NoManager, "org.freedesktop.DBus.Error.ServiceUnknown");
}

void ModemScenario::losePermission() {
    addAbsence(ModemPresence::NoPermission, "org.freedesktop.DBus.Error.AccessDenied");
}

void ModemScenario::findNoModem() {
    addAbsence(ModemPresence::NoModem, "");
}

void ModemScenario::plugInLocked() {
    addChange(0.1, [this] {
        restart(_phone);
        _phone.presence = ModemPresence::Present;
        _phone.cellReport = ModemCellReport::NotYet;
    });
    addChange(1.5, [this] {
        _phone.state = MM::State::Locked;
        _phone.isLocked = true;
    });
}

void ModemScenario::unlock() {
    addChange(0.1, [this] {
        _phone.isLocked = false;
        _phone.state = MM::State::Initializing;
        _phone.cellReport = ModemCellReport::Reported;
    });
    addRegistration(0.2, Radio::GSM);
}

void ModemScenario::startSession() {
    addChange(0.3, [this] { connect(1, false); });
}

void ModemScenario::changeToUMTS() {
    // The place is known at once from the registration, the measurement follows.
    addChange(0.3, [this] {
        camp(Radio::UMTS, 0);
        _phone.cellReport = ModemCellReport::Failing;
        _phone.reason = "org.freedesktop.ModemManager1.Error.Core.InProgress";
        _phone.isPlaceOnly = true;
    });
    addChange(5, [this] {
        _phone.cellReport = ModemCellReport::Reported;
        _phone.reason.clear();
        _phone.isPlaceOnly = false;
    });
}

void ModemScenario::changeToLTE() {
    addChange(0.3, [this] { camp(Radio::LTE, 0); });
    addChange(5, [this] { connect(2, true); });
}

void ModemScenario::changeLTECarrier() {
    addChange(0.3, [this] { camp(Radio::LTE, 2); });
}

void ModemScenario::addSecondary() {
    addChange(0.3, [this] {
        _phone.hasSecondary = true;
        camp(Radio::LTE, 0);
    });
}

void ModemScenario::changeToNR() {
    addChange(0.3, [this] {
        _phone.hasSecondary = false;
        _phone.bearers.clear();
        camp(Radio::NR, 0);
    });
    addChange(2, [this] { connect(1, false); });
}

void ModemScenario::changeNRCarrier() {
    addChange(0.3, [this] { camp(Radio::NR, 1); });
}

void ModemScenario::loseCoverage() {
    addChange(0.3, [this] {
        _phone.serving.reset();
        updateRegistration();
        for (ModemBearer& each : _phone.bearers)
            each.isSuspended = true;
    });
    addChange(6, [this] {
        _phone.bearers.clear();
        updateRegistration();
    });
}

void ModemScenario::findLimitedService() {
    addChange(0.3, [this] {
        _isLimited = true;
        camp(Radio::LTE, 0);
    });
}

void ModemScenario::changeSIM() {
    addChange(0.3, [this] {
        _isLimited = false;
        _phone.slot = 2;
        _phone.serving.reset();
        _phone.registration = MM::Registration::Idle;
        _phone.state = MM::State::Initializing;
        _phone.neighborReport = ModemCellReport::Unsupported;
    });
    addRegistration(1, Radio::LTE);
    addChange(6, [this] {
        ModemBearer& bearer = _phone.bearers.emplace_back();
        bearer.number = 3;
        bearer.error = "org.freedesktop.ModemManager1.Error.MobileEquipment.GprsServiceOptionNotSubscribed";
    });
    addChange(10, [this] { connect(3, false); });
}

void ModemScenario::unplug() {
    addAbsence(ModemPresence::NoModem, "");
}

void ModemScenario::returnWithoutSIM() {
    addChange(0.1, [this] {
        const int index = _phone.index + 1;
        restart(_phone);
        _phone.index = index;
        _phone.presence = ModemPresence::Present;
        _phone.state = MM::State::Failed;
        _phone.isSIMMissing = true;
        _phone.cellReport = ModemCellReport::NotYet;
    });
}

void ModemScenario::returnWithSIM() {
    addChange(0.1, [this] {
        _phone.isSIMMissing = false;
        _phone.state = MM::State::Initializing;
        _phone.cellReport = ModemCellReport::NoPermission;
        _phone.reason = "org.freedesktop.ModemManager1.Error.Core.Unauthorized";
    });
    addRegistration(0.2, Radio::LTE);
    addChange(8, [this] {
        _phone.cellReport = ModemCellReport::Reported;
        _phone.reason.clear();
    });
}

void ModemScenario::stopAnswering() {
    addAbsence(ModemPresence::NoAnswer, "org.freedesktop.DBus.Error.NoReply");
}

} // namespace velmora
