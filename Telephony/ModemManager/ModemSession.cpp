// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemSession.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"

#include <QString>

#include <algorithm>
#include <utility>

namespace velmora {
namespace {

QVariantList interfaceArgument(std::string_view interface) {
    return {QString::fromUtf8(interface.data(), static_cast<qsizetype>(interface.size()))};
}

void addPath(std::vector<std::string>& paths, const Value& path) {
    const std::string* text = path.asString();
    if (text && mm::isObject(*text) && paths.size() < maximumBearers &&
        std::find(paths.begin(), paths.end(), *text) == paths.end())
        paths.push_back(*text);
}

Value valueOf(const Dictionaries& dictionaries) {
    const ArrayRef array = makeArray();
    for (const DictionaryRef& each : dictionaries)
        array->append(Value(each));
    return array;
}

} // namespace

ModemSession::ModemSession(MainQueue& queue, ModemFollower& follower, Reports reports)
    : _queue(queue), _follower(follower), _reports(std::move(reports)), _path(follower.modem()->path),
      _name("modem " + std::to_string(follower.modem()->index)) {
    after(std::chrono::nanoseconds::zero(), [this] {
        modemChanged();
        poll();
    });
}

ModemSession::~ModemSession() {
    restoreSignalRate();
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

void ModemSession::poll() {
    if (_partPolls > 0 && --_partPolls == 0)
        for (const auto& [path, part] : _parts)
            if (!part.properties)
                readPart(path);
    requestCells();
}

void ModemSession::requestCells() {
    if (_cellQuery.pollsToSkip > 0) {
        --_cellQuery.pollsToSkip;
        return askLocation({});
    }
    call({.path = _path,
          .interface = mm::modem,
          .method = "GetCellInfo",
          .arguments = {},
          .timeout = cellTimeout},
         [this](const BusReply& reply) {
             if (reply.failed()) {
                 refused(_cellQuery, reply, "cell information");
                 return askLocation({});
             }
             _follower.faults().clear(_cellQuery.subject);
             const Modem* modem = _follower.modem();
             Dictionaries cells = modem ? cellsOf(reply.value, *modem) : Dictionaries();
             if (hasServingCell(cells))
                 return endPoll(cells);
             askLocation(std::move(cells));
         });
}

void ModemSession::askLocation(Dictionaries cells) {
    const Modem* modem = _follower.modem();
    if (_locationQuery.pollsToSkip > 0)
        --_locationQuery.pollsToSkip;
    else if (modem && modem->has(mm::location))
        return call({.path = _path, .interface = mm::location, .method = "GetLocation", .arguments = {}},
                    [this, known = std::move(cells)](const BusReply& reply) mutable {
                        const Modem* followed = _follower.modem();
                        if (reply.failed())
                            refused(_locationQuery, reply, "its place in the network");
                        else
                            _follower.faults().clear(_locationQuery.subject);
                        if (const DictionaryRef place =
                                followed ? servingCellFromLocation(reply.value, *followed) : nullptr)
                            known.insert(known.begin(), place);
                        endPoll(known);
                    });
    endPoll(cells);
}

void ModemSession::endPoll(const Dictionaries& cells) {
    after(cellInterval, [this] { poll(); });
    // An empty list is reported once: it clears the display.
    if (std::exchange(_hadCells, !cells.empty()) || !cells.empty())
        _reports.cells(cells);
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
        faults.report(subject, "no permission to ask " + _name + " for " + end);
    else
        faults.report(subject, _name + " does not give " + end);
}

void ModemSession::setSignalRate() {
    const Modem* modem = _follower.modem();
    const bool has = modem && modem->has(mm::signal);
    if (std::exchange(_hadSignal, has) == has || !has)
        return;
    const std::int64_t* rate = (*modem)[mm::signal]["Rate"].asInteger();
    const std::uint32_t earlier =
        rate && *rate > 0 && *rate <= 0xFFFF ? static_cast<std::uint32_t>(*rate) : 0;
    // Somebody has it poll as often already.
    if (earlier != 0 && earlier <= signalRate)
        return;
    _earlierRate = earlier;
    call({.path = _path, .interface = mm::signal, .method = "Setup", .arguments = {signalRate}},
         [this](const BusReply& reply) {
             if (!reply.failed())
                 return _follower.faults().clear("levels");
             _earlierRate.reset();
             reportFault("levels", reply, "its levels");
         });
}

void ModemSession::restoreSignalRate() {
    if (const auto rate = std::exchange(_earlierRate, std::nullopt))
        _follower.bus().send(
            {.path = _path, .interface = mm::signal, .method = "Setup", .arguments = {*rate}});
}

void ModemSession::modemChanged() {
    const Modem* modem = _follower.modem();
    if (!modem)
        return;
    const Value& state = (*modem)[mm::modem]["State"];
    if (!(state == _state)) {
        // What was refused in the one state may be granted in the next.
        _state = state;
        _cellQuery.pollsToSkip = 0;
        _locationQuery.pollsToSkip = 0;
        if (!_earlierRate)
            _hadSignal = false;
    }
    setSignalRate();
    followParts();
    reportLater();
}

void ModemSession::followParts() {
    const Modem& modem = *_follower.modem();
    const std::string* sim = modem[mm::modem]["Sim"].asString();
    _sim = modem.hasSIM() ? *sim : std::string();
    _bearers.clear();
    if (const Array* paths = modem[mm::modem]["Bearers"].asArray())
        for (const Value& path : *paths)
            addPath(_bearers, path);
    addPath(_bearers, modem[mm::modem3gpp]["InitialEpsBearer"]);

    std::map<std::string, Part> parts;
    for (const std::string& path : _bearers)
        parts[path].interface = mm::bearer;
    if (!_sim.empty())
        parts[_sim].interface = mm::sim;
    for (auto& [path, part] : parts)
        if (const auto known = _parts.find(path); known != _parts.end())
            part = known->second;
    _parts.swap(parts);
    for (const auto& [path, part] : _parts)
        if (!parts.contains(path))
            readPart(path);
}

void ModemSession::readPart(const std::string& path) {
    call({.path = path,
          .interface = mm::properties,
          .method = "GetAll",
          .arguments = interfaceArgument(_parts[path].interface)},
         [this, path](const BusReply& reply) {
             const auto part = _parts.find(path);
             if (part == _parts.end())
                 return;
             const bool isSIM = part->second.interface == mm::sim;
             part->second.answered = true;
             reportLater();
             if (reply.failed()) {
                 _partPolls = pollsAfterRefusal;
                 return reportFault(isSIM ? "SIM" : "bearer", reply, isSIM ? "its SIM" : "a bearer");
             }
             _follower.faults().clear(isSIM ? "SIM" : "bearer");
             const DictionaryRef properties = reply.value.dictionaryRef();
             part->second.properties = properties ? properties : makeDictionary();
         });
}

void ModemSession::objectChanged(const std::string& path, const Array& arguments) {
    const auto part = _parts.find(path);
    const std::string* interface = arguments.empty() ? nullptr : arguments[0].asString();
    if (part == _parts.end() || !part->second.properties || !interface ||
        *interface != part->second.interface)
        return;
    applyChange(*part->second.properties, arguments);
    reportLater();
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
    // Whoever takes a report may end the session.
    const std::weak_ptr<bool> alive = _alive;
    reportFiles(*modem);
    if (!alive.expired())
        reportContexts(*modem);
}

// Parts that wait for an answer are reported together.

void ModemSession::reportFiles(const Modem& modem) {
    static const Dictionary unread;
    const auto sim = _parts.find(_sim);
    if (sim != _parts.end() && !sim->second.answered)
        return;
    const bool read = sim != _parts.end() && sim->second.properties;
    const DictionaryRef files = simFilesOf(modem, read ? *sim->second.properties : unread);
    if (files->empty() || Value(files) == _reportedFiles)
        return;
    _reportedFiles = files;
    _reports.simFiles(files);
}

void ModemSession::reportContexts(const Modem& modem) {
    std::vector<ModemBearer> bearers;
    for (const std::string& path : _bearers) {
        const Part& part = _parts[path];
        if (!part.answered)
            return;
        if (part.properties)
            bearers.push_back({path, part.properties});
    }
    const Dictionaries contexts = contextsOf(modem, bearers);
    Value now = valueOf(contexts);
    if (now == _reportedContexts)
        return;
    _reportedContexts = std::move(now);
    _reports.contexts(contexts);
}

} // namespace velmora
