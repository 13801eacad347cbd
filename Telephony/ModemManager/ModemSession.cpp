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
    : _queue(queue), _clock(clock), _follower(follower), _report(std::move(report)),
      _path(follower.modem()->path), _name("modem " + std::to_string(follower.modem()->index)),
      _parts(
          queue, follower,
          [this](const std::string& path, const ModemParts::Part& part, const Dictionary* changed) {
              partChanged(path, part, changed);
          },
          [this](const ModemParts::Part& part, const BusReply& reply) {
              reportLater();
              if (part.interface != mm::manager)
                  reportFault(subjectOf(part), reply, part.interface == mm::sim ? "its SIM" : "a bearer");
          }),
      _rate(queue, follower, memory, _path,
            [this](const BusReply& reply) { reportFault("levels", reply, "its levels"); }) {
    after(std::chrono::nanoseconds::zero(), [this] {
        modemChanged();
        poll();
    });
}

void ModemSession::after(std::chrono::nanoseconds delay, std::function<void()> task) {
    _queue.after(delay, [weak = std::weak_ptr<bool>(_alive), action = std::move(task)] {
        if (!weak.expired())
            action();
    });
}

void ModemSession::call(const BusCall& call, std::function<void(const BusReply&)> answered) {
    _follower.bus().call(
        call, [weak = std::weak_ptr<bool>(_alive), action = std::move(answered)](const BusReply& reply) {
            if (!weak.expired())
                action(reply);
        });
}

// The cells, and the place that replaces a missing serving cell.

void ModemSession::poll() {
    if (_locationQuery.pollsToSkip > 0)
        --_locationQuery.pollsToSkip;
    if (_cellQuery.pollsToSkip > 0) {
        --_cellQuery.pollsToSkip;
        return cellsKnown();
    }
    call({.path = _path,
          .interface = mm::modem,
          .method = "GetCellInfo",
          .arguments = {},
          .timeout = cellTimeout},
         [this](const BusReply& reply) { cellsAnswered(reply); });
}

void ModemSession::cellsAnswered(const BusReply& reply) {
    _cells.cells = cellsOf(reply.value);
    _cells.reason = reply.failed() ? reply.reason() : std::string();
    _cells.hasSeenNeighbors |= hasNeighbor(_cells.cells);
    if (reply.failed()) {
        _cells.report = reply.isUnsupported() ? ModemCellReport::Unsupported
                        : reply.isDenied()    ? ModemCellReport::NoPermission
                                              : ModemCellReport::Failing;
        refused(_cellQuery, reply, "cell information");
    } else {
        _cells.report = ModemCellReport::Reported;
        _follower.faults().clear(_cellQuery.subject);
    }
    cellsKnown();
}

void ModemSession::cellsKnown() {
    after(cellInterval, [this] { poll(); });
    const Modem* modem = _follower.modem();
    if (!modem || !modem->has(mm::location) || hasServingCell(_cells.cells) ||
        _locationQuery.pollsToSkip > 0) {
        _cells.location = {};
        return reportCells();
    }
    _awaitsPlace = true;
    after(placePatience, [this] {
        if (std::exchange(_awaitsPlace, false))
            reportCells();
    });
    requestLocation();
}

void ModemSession::reportCells() {
    const Modem* modem = _follower.modem();
    if (!modem)
        return;
    _cellsDue = false;
    const DictionaryRef root = cellReportOf(_cells, *modem);
    // Without cells, once is enough.
    if (!(*root)[kVoxCellMonitorCells].asArray()->empty())
        _sent.erase(LiveModemCode::cells);
    send(LiveModemCode::cells, root);
}

void ModemSession::pollPosition() {
    const Modem* modem = _follower.modem();
    _positionRuns = modem && hasPosition(*modem);
    if (!_positionRuns)
        return;
    if (_locationQuery.pollsToSkip == 0)
        requestLocation();
    after(cellInterval, [this] { pollPosition(); });
}

void ModemSession::requestLocation() {
    if (std::exchange(_locationQuery.isPending, true))
        return;
    call({.path = _path,
          .interface = mm::location,
          .method = "GetLocation",
          .arguments = {},
          .timeout = locationTimeout},
         [this](const BusReply& reply) { locationAnswered(reply); });
}

void ModemSession::locationAnswered(const BusReply& reply) {
    _locationQuery.isPending = false;
    _location = reply.value;
    _locationReason = reply.failed() ? reply.reason() : std::string();
    if (reply.failed())
        refused(_locationQuery, reply, "its place in the network");
    else
        _follower.faults().clear(_locationQuery.subject);
    reportLater();
    // A late one counts too, until the next.
    const bool isAwaited = std::exchange(_awaitsPlace, false);
    if (hasServingCell(_cells.cells) || (!isAwaited && _location == _cells.location))
        return;
    _cells.location = _location;
    reportCells();
}

void ModemSession::refused(Query& query, const BusReply& reply, std::string_view what) {
    reportFault(query.subject, reply, what);
    // Others may be over at the next poll: a modem that is not enabled yet, one that was busy.
    if (reply.isUnsupported() || reply.isDenied())
        query.pollsToSkip = pollsAfterRefusal - 1;
}

void ModemSession::reportFault(std::string_view subject, const BusReply& reply, std::string_view what) {
    const std::string end = std::string(what) + " (" + reply.reason() + ')';
    FaultLog& faults = _follower.faults();
    if (reply.isUnsupported())
        faults.report(subject, _name + " does not support " + end);
    else if (reply.isDenied())
        faults.report(subject, "no permission to ask " + _name + " for " + end +
                                   (subject == _cellQuery.subject
                                        ? "; velmora-modemmanager.conf allows it, see velmora-telephonyd(1)"
                                        : ""));
    else
        faults.report(subject, _name + " does not give " + end);
}

// What ModemManager publishes.

void ModemSession::modemChanged() {
    const Modem* modem = _follower.modem();
    if (!modem)
        return;
    const Dictionary& properties = (*modem)[mm::modem];
    const bool hasNewState = !(properties["State"] == _state);
    if (hasNewState)
        stateChanged(*modem);
    if (!(properties["AccessTechnologies"] == _access)) {
        // The place was named on the earlier technology.
        _access = properties["AccessTechnologies"];
        _cells.location = {};
    }
    followParts(*modem);
    _rate.modemChanged(hasNewState);
    if (!_positionRuns && hasPosition(*modem))
        pollPosition();
    reportLater();
}

void ModemSession::stateChanged(const Modem& modem) {
    // What was refused in the one state may be granted in the next.
    _state = modem[mm::modem]["State"];
    _cellQuery.pollsToSkip = 0;
    _locationQuery.pollsToSkip = 0;
    _cellsDue = true;
}

void ModemSession::simChanged() {
    // Another subscriber, maybe in another network: nothing of the earlier one stays.
    _cells = {};
    _location = {};
    _traffic.clear();
    _cellsDue = true;
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
    after(reportDelay, [this] {
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
         positionReportOf(_location, *modem, hasPosition(*modem) ? _locationReason : std::string())},
    };
    // The receiver of a report may end the session.
    const std::weak_ptr<bool> alive = _alive;
    if (_cellsDue && !_awaitsPlace)
        reportCells();
    for (const auto& [code, root] : roots) {
        if (alive.expired())
            return;
        send(code, root);
    }
}

void ModemSession::send(std::uint32_t code, const DictionaryRef& root) {
    Value content(root);
    if (_sent[code] == content)
        return;
    _sent[code] = std::move(content);
    _report(code, *root);
}

} // namespace velmora
