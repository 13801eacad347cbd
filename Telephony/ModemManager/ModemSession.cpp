// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemSession.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/Reports/PositionReport.h"

#include <algorithm>
#include <utility>

namespace velmora {
namespace {

/// The paths in an array, an empty one for each slash that stands for no object.
std::vector<std::string> pathsOf(const Value& member, std::size_t maximum) {
    std::vector<std::string> paths;
    const Array* array = member.asArray();
    for (std::size_t i = 0; array && i < std::min(array->size(), maximum); ++i) {
        const std::string* path = (*array)[i].asString();
        paths.push_back(path && mm::isObject(*path) ? *path : std::string());
    }
    return paths;
}

void addPath(std::vector<std::string>& paths, const std::string& path) {
    if (!path.empty() && paths.size() < maximumBearers &&
        std::find(paths.begin(), paths.end(), path) == paths.end())
        paths.push_back(path);
}

std::vector<std::string> bearersOf(const Modem& modem) {
    std::vector<std::string> bearers;
    for (const std::string& path : pathsOf(modem[mm::modem]["Bearers"], maximumBearers))
        addPath(bearers, path);
    const std::string* initial = modem[mm::modem3gpp]["InitialEpsBearer"].asString();
    if (initial && mm::isObject(*initial))
        addPath(bearers, *initial);
    return bearers;
}

std::string_view subjectOf(const ModemParts::Part& part) {
    return part.interface == mm::sim ? "SIM" : "bearer";
}

} // namespace

ModemSession::ModemSession(MainQueue& queue, const Clock& clock, ModemFollower& follower,
                           const RateMemory& memory, Report report)
    : _clock(clock), _follower(follower), _report(std::move(report)), _calls(queue, follower),
      _cells(
          _calls, follower, [this](const DictionaryRef& root) { cellsMeasured(root); },
          [this] { reportLater(); }),
      _parts(
          queue, follower,
          [this](const std::string& path, const ModemParts::Part& part, const Dictionary* changed) {
              partChanged(path, part, changed);
          },
          [this](const ModemParts::Part& part, const BusReply& reply) {
              reportLater();
              if (part.interface != mm::manager)
                  _calls.reportFault(subjectOf(part), reply,
                                     part.interface == mm::sim ? "its SIM" : "a bearer");
          }),
      _rate(queue, follower, memory, _calls.path(),
            [this](const BusReply& reply) { _calls.reportFault("levels", reply, "its levels"); }) {
    _calls.after(std::chrono::nanoseconds::zero(), [this] {
        modemChanged();
        _cells.poll();
    });
}

void ModemSession::modemChanged() {
    const Modem* modem = _follower.modem();
    if (!modem)
        return;
    const Dictionary& properties = (*modem)[mm::modem];
    const bool hasNewState = !(properties["State"] == _state);
    if (hasNewState) {
        _state = properties["State"];
        _cells.stateChanged();
    }
    if (!(properties["AccessTechnologies"] == _access)) {
        _access = properties["AccessTechnologies"];
        _cells.accessChanged();
    }
    followParts(*modem);
    _rate.modemChanged(hasNewState);
    _cells.satellitesChanged();
    reportLater();
}

void ModemSession::simChanged() {
    // Another subscriber, maybe in another network: nothing of the earlier one stays.
    _cells.clear();
    _traffic.clear();
}

void ModemSession::followParts(const Modem& modem) {
    const std::string* sim = modem[mm::modem]["Sim"].asString();
    const std::string active = modem.hasSIM() ? *sim : std::string();
    if (std::exchange(_sim, active) != active)
        simChanged();
    _slots = pathsOf(modem[mm::modem]["SimSlots"], maximumSlots);
    const std::vector<std::string> earlier = std::exchange(_bearers, bearersOf(modem));
    for (const std::string& path : earlier)
        if (std::find(_bearers.begin(), _bearers.end(), path) == _bearers.end())
            _traffic.forget(path);

    std::map<std::string, std::string_view> wanted;
    wanted.emplace(mm::rootPath, mm::manager);
    for (const std::string& path : _bearers)
        wanted.emplace(path, mm::bearer);
    for (const std::string& path : _slots)
        if (!path.empty())
            wanted.emplace(path, mm::sim);
    if (!_sim.empty())
        wanted.emplace(_sim, mm::sim);
    _parts.follow(wanted);
}

void ModemSession::objectChanged(const std::string& path, const Array& arguments) {
    _parts.objectChanged(path, arguments);
}

void ModemSession::partChanged(const std::string& path, const ModemParts::Part& part,
                               const Dictionary* changed) {
    reportLater();
    if (!changed && part.interface != mm::manager)
        _follower.faults().clear(subjectOf(part));
    if (part.interface != mm::bearer)
        return;
    // The counters of another connection are no measure of this one.
    if (!changed || changed->contains("Connected"))
        _traffic.forget(path);
    if (!changed || changed->contains("Connected") || changed->contains("Stats"))
        _traffic.answer(path, *part.properties, _clock.now());
}

ModemPart ModemSession::partAt(const std::string& path) const {
    const ModemParts::Part* part = _parts.find(path);
    return {path, part ? part->properties : nullptr};
}

std::string ModemSession::reasonFor(const std::vector<std::string>& paths) const {
    for (const std::string& path : paths)
        if (const ModemParts::Part* part = _parts.find(path); part && !part->reason.empty())
            return part->reason;
    return {};
}

void ModemSession::reportLater() {
    if (std::exchange(_reporting, true))
        return;
    _calls.after(reportDelay, [this] {
        _reporting = false;
        report();
    });
}

void ModemSession::report() {
    const Modem* modem = _follower.modem();
    if (!modem)
        return;
    std::vector<ModemPart> bearers;
    for (const std::string& path : _bearers)
        bearers.push_back(partAt(path));
    std::vector<ModemPart> inSlots;
    for (const std::string& path : _slots)
        inSlots.push_back(partAt(path));
    const ModemPart sim = partAt(_sim);
    const Value manager(partAt(std::string(mm::rootPath)).properties);
    const std::pair<std::uint32_t, DictionaryRef> roots[] = {
        {LiveModemCode::registration, registrationReportOf(*modem)},
        {LiveModemCode::link, linkReportOf(*modem)},
        {LiveModemCode::contexts, contextReportOf(*modem, bearers, reasonFor(_bearers))},
        {LiveModemCode::traffic, _traffic.report(*modem, _bearers)},
        {LiveModemCode::sim, simReportOf(*modem, sim, inSlots, reasonFor({_sim}))},
        {LiveModemCode::modem, modemReportOf(*modem, manager)},
        {LiveModemCode::position,
         positionReportOf(_cells.location(), *modem,
                          hasPosition(*modem) ? _cells.locationReason() : std::string())},
    };
    // The receiver of a report may end the session.
    const std::weak_ptr<bool> alive = _alive;
    _cells.reportIfDue();
    for (const auto& [code, root] : roots) {
        if (alive.expired())
            return;
        send(code, root);
    }
}

void ModemSession::cellsMeasured(const DictionaryRef& root) {
    // Without cells, once is enough.
    if (!(*root)[kVoxCellMonitorCells].asArray()->empty())
        _sent.erase(LiveModemCode::cells);
    send(LiveModemCode::cells, root);
}

void ModemSession::send(std::uint32_t code, const DictionaryRef& root) {
    Value content(root);
    if (_sent[code] == content)
        return;
    _sent[code] = std::move(content);
    _report(code, *root);
}

} // namespace velmora
