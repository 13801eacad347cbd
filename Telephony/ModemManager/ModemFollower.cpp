// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemFollower.h"

#include "Platform/SystemLog.h"
#include "Telephony/ModemManager/Bus/BusValue.h"
#include "Telephony/ModemManager/Bus/ModemManagerNames.h"

#include <utility>

namespace velmora {
namespace {

constexpr std::string_view presence = "presence"; ///< of bus, ModemManager and modem: one fault at a time

std::string textOf(const Modem& modem, std::string_view property) {
    const std::string* text = modem[mm::modem][property].asString();
    return text && !text->empty() ? ' ' + printableForLog(*text) : std::string();
}

std::string absence(const BusReply& reply) {
    if (reply.isAbsent())
        return "ModemManager is not there (" + reply.reason() + ')';
    if (reply.isDenied())
        return "no permission to ask ModemManager for its modems (" + reply.reason() + ')';
    return "ModemManager does not say which modems there are (" + reply.reason() + ')';
}

} // namespace

ModemFollower::ModemFollower(MainQueue& queue, Options options, Observer& observer)
    : _queue(queue), _options(std::move(options)), _observer(observer), _bus(_options.busAddress, *this) {
    // At the start ModemManager may be activated, since this service may be its first user; later it may have
    // been stopped on purpose, and is not.
    open(true);
}

void ModemFollower::open(bool startsService) {
    if (const auto opened = _bus.open(); !opened) {
        _faults.report(presence, "no system bus (" + opened.reason() + ')');
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
              [this](const BusReply& reply) {
                  if (reply.failed()) {
                      _faults.report(presence, absence(reply));
                      retryLater();
                      return;
                  }
                  _listed = true;
                  _objects.reset(reply.value);
                  choose();
              });
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
    });
}

void ModemFollower::serviceAppeared() {
    list(false);
}

void ModemFollower::serviceVanished() {
    _faults.report(presence, "ModemManager has gone");
    forgetModems();
    retryLater();
}

void ModemFollower::busLost() {
    _faults.report(presence, "the system bus has gone");
    // Deferred: this is called by the bus itself.
    _queue.async([this, weak = std::weak_ptr<bool>(_alive)] {
        if (weak.expired())
            return;
        _bus.close();
        forgetModems();
        retryLater();
    });
}

void ModemFollower::forgetModems() {
    _listed = false;
    _objects.clear();
    if (!std::exchange(_chosen, {}).empty())
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
    else
        return _observer.objectChanged(path, arguments);
    choose();
}

void ModemFollower::choose() {
    const Modem* modem = _objects.choose(_options.modem, _chosen);
    const std::string path = modem ? modem->path : std::string();
    if (modem)
        _faults.clear(presence);
    else if (_options.modem && !_objects.indices().empty())
        _faults.report(presence, "no modem " + std::to_string(*_options.modem) +
                                     " is there, only: " + _objects.indices());
    else
        _faults.report(presence, "no modem is there");
    if (path == _chosen)
        return _observer.modemChanged();
    _chosen = path;
    if (modem)
        logFormat(LogPriority::Notice, "modemmanager: following modem %u%s%s", modem->index,
                  textOf(*modem, "Manufacturer").c_str(), textOf(*modem, "Model").c_str());
    _observer.modemChosen();
}

} // namespace velmora
