// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemFollower.h"

#include "Platform/SystemLog.h"
#include "Telephony/ModemManager/Bus/BusValue.h"
#include "Telephony/ModemManager/Bus/ModemManagerNames.h"

#include <utility>

namespace velmora {
namespace {

constexpr std::string_view presenceSubject =
    "presence"; ///< of bus, ModemManager and modem: one fault at a time

std::string textOf(const Modem& modem, std::string_view property) {
    const std::string* text = modem[mm::modem][property].asString();
    return text && !text->empty() ? ' ' + printableForLog(*text) : std::string();
}

Presence presenceOf(const BusReply& reply) {
    const auto state = reply.isAbsent()   ? ModemPresence::NoManager
                       : reply.isDenied() ? ModemPresence::NoPermission
                                          : ModemPresence::NoAnswer;
    return {state, reply.reason()};
}

std::string absence(const Presence& presence) {
    const std::string end = " (" + presence.reason + ')';
    switch (presence.state) {
    case ModemPresence::NoBus: return "no system bus" + end;
    case ModemPresence::NoManager: return "ModemManager is not there" + end;
    case ModemPresence::NoPermission: return "no permission to ask ModemManager for its modems" + end;
    default: return "ModemManager does not say which modems there are" + end;
    }
}

} // namespace

ModemFollower::ModemFollower(MainQueue& queue, Options options, Observer& observer)
    : _queue(queue), _options(std::move(options)), _observer(observer), _bus(_options.busAddress, *this) {
    // At the start ModemManager may be activated, since this service may be its first user; later it may have
    // been stopped on purpose, and is not.
    open(true);
    _isMade = true;
}

void ModemFollower::open(bool startsService) {
    if (const auto opened = _bus.open(); !opened) {
        const Presence why{ModemPresence::NoBus, opened.reason()};
        _faults.report(presenceSubject, absence(why));
        setPresence(why);
        retryLater();
        return;
    }
    list(startsService);
}

void ModemFollower::list(bool startsService) {
    _bus.call({.path = std::string(mm::rootPath),
               .interface = mm::objectManager,
               .method = "GetManagedObjects",
               .arguments = {},
               .startsService = startsService},
              [this](const BusReply& reply) { listed(reply); });
}

void ModemFollower::listed(const BusReply& reply) {
    if (reply.failed()) {
        const Presence why = presenceOf(reply);
        _faults.report(presenceSubject, absence(why));
        setPresence(why);
        retryLater();
        return;
    }
    _owner = reply.sender;
    _listed = true;
    _objects.reset(reply.value);
    choose();
}

void ModemFollower::retryLater() {
    if (std::exchange(_retrying, true))
        return;
    _queue.after(retryInterval, [this, weak = std::weak_ptr<bool>(_alive)] {
        if (weak.expired())
            return;
        _retrying = false;
        if (!_bus.isOpen())
            open(false);
        else if (!_listed)
            list(false);
        else
            askForICCIDs();
    });
}

void ModemFollower::serviceAppeared() {
    list(false);
}

void ModemFollower::serviceVanished() {
    _faults.report(presenceSubject, "ModemManager has gone");
    forgetModems({ModemPresence::NoManager, {}});
    retryLater();
}

void ModemFollower::busLost() {
    _faults.report(presenceSubject, "the system bus has gone");
    // Deferred: this is called by the bus itself.
    _queue.async([this, weak = std::weak_ptr<bool>(_alive)] {
        if (weak.expired())
            return;
        _bus.close();
        forgetModems({ModemPresence::NoBus, {}});
        retryLater();
    });
}

void ModemFollower::forgetModems(const Presence& why) {
    _listed = false;
    _owner.clear();
    _objects.clear();
    _iccids.clear();
    const bool hadModem = !std::exchange(_chosen, {}).empty();
    if (hadModem)
        _presence.reset(); // so that it is reported
    setPresence(why);
}

void ModemFollower::setPresence(const Presence& presence) {
    if (_presence == presence)
        return;
    _presence = presence;
    if (_isMade)
        _observer.modemChosen();
}

void ModemFollower::signalArrived(const std::string& path, std::string_view member, const Array& arguments) {
    // What comes before the list is in it.
    if (!_listed)
        return;
    if (member == "InterfacesAdded")
        _objects.add(arguments);
    else if (member == "InterfacesRemoved")
        _objects.remove(arguments);
    else if (_objects.find(path))
        _objects.change(path, arguments);
    else {
        // A SIM may say who it is only once it is unlocked.
        if (const auto known = _iccids.find(path); known != _iccids.end() && known->second.empty()) {
            _iccids.erase(known);
            askForICCIDs();
        }
        return _observer.objectChanged(path, arguments);
    }
    choose();
}

std::string ModemFollower::iccidOf(const Modem& modem) const {
    const std::string* sim = modem[mm::modem]["Sim"].asString();
    const auto known = sim ? _iccids.find(*sim) : _iccids.end();
    return known == _iccids.end() ? std::string() : known->second;
}

void ModemFollower::askForICCIDs() {
    if (!_options.choice.needsICCID())
        return;
    for (const auto& [index, modem] : _objects.all()) {
        const std::string* sim = modem.hasSIM() ? modem[mm::modem]["Sim"].asString() : nullptr;
        if (!sim || !_iccids.try_emplace(*sim).second)
            continue;
        _bus.call({.path = *sim,
                   .interface = mm::properties,
                   .method = "GetAll",
                   .arguments = {QString::fromUtf8(mm::sim.data(), static_cast<qsizetype>(mm::sim.size()))}},
                  [this, path = *sim](const BusReply& reply) {
                      const Dictionary* properties = reply.value.asDictionary();
                      const std::string* iccid =
                          properties ? (*properties)["SimIdentifier"].asString() : nullptr;
                      const auto known = _iccids.find(path);
                      if (known == _iccids.end())
                          return;
                      if (reply.failed()) {
                          _iccids.erase(known);
                          return retryLater();
                      }
                      known->second = iccid ? *iccid : std::string();
                      choose();
                  });
    }
}

const Modem* ModemFollower::chosenOne() const {
    if (_options.choice.isAny())
        return _objects.preferred(_chosen);
    for (const auto& [index, modem] : _objects.all())
        if (fits(_options.choice, modem, _identity, iccidOf(modem)))
            return &modem;
    return nullptr;
}

void ModemFollower::choose() {
    askForICCIDs();
    const Modem* modem = chosenOne();
    const std::string path = modem ? modem->path : std::string();
    if (modem && _options.choice.index && _identity.empty())
        _identity = identityOf(*modem);
    if (modem && path == _chosen)
        return _observer.modemChanged();
    const bool hadModem = !std::exchange(_chosen, path).empty();
    if (modem) {
        _faults.clear(presenceSubject);
        logFormat(LogPriority::Notice, "modemmanager: following modem %u%s%s", modem->index,
                  textOf(*modem, "Manufacturer").c_str(), textOf(*modem, "Model").c_str());
        _presence = Presence{ModemPresence::Present, {}};
        return _observer.modemChosen();
    }
    const std::string others = _objects.indices();
    const bool isNotTheOne = !_options.choice.isAny() && !others.empty();
    _faults.report(presenceSubject, isNotTheOne
                                        ? "no " + _options.choice.description() + " is there, only: " + others
                                        : "no modem is there");
    if (hadModem)
        _presence.reset(); // so that it is reported
    setPresence({isNotTheOne ? ModemPresence::NotTheOne : ModemPresence::NoModem, {}});
}

} // namespace velmora
