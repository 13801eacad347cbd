// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/CellPoller.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/Reports/PositionReport.h"

#include <utility>

namespace velmora {

CellPoller::CellPoller(ModemCalls& calls, ModemFollower& follower, Report report, Located located)
    : _calls(calls), _follower(follower), _report(std::move(report)), _located(std::move(located)) {}

void CellPoller::poll() {
    if (_locationQuery.pollsToSkip > 0)
        --_locationQuery.pollsToSkip;
    if (_cellQuery.pollsToSkip > 0) {
        --_cellQuery.pollsToSkip;
        return cellsKnown();
    }
    _calls.call({.path = _calls.path(),
                 .interface = mm::modem,
                 .method = "GetCellInfo",
                 .arguments = {},
                 .timeout = cellTimeout},
                [this](const BusReply& reply) { cellsAnswered(reply); });
}

void CellPoller::cellsAnswered(const BusReply& reply) {
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

void CellPoller::cellsKnown() {
    _calls.after(cellInterval, [this] { poll(); });
    const Modem* modem = _follower.modem();
    if (!modem || !modem->has(mm::location) || hasServingCell(_cells.cells) ||
        _locationQuery.pollsToSkip > 0) {
        _cells.location = {};
        return report();
    }
    _awaitsPlace = true;
    _calls.after(placePatience, [this] {
        if (std::exchange(_awaitsPlace, false))
            report();
    });
    requestLocation();
}

void CellPoller::report() {
    const Modem* modem = _follower.modem();
    if (!modem)
        return;
    _isDue = false;
    _report(cellReportOf(_cells, *modem));
}

void CellPoller::reportIfDue() {
    if (_isDue && !_awaitsPlace)
        report();
}

void CellPoller::satellitesChanged() {
    const Modem* modem = _follower.modem();
    if (!_positionRuns && modem && hasPosition(*modem))
        pollPosition();
}

void CellPoller::pollPosition() {
    const Modem* modem = _follower.modem();
    _positionRuns = modem && hasPosition(*modem);
    if (!_positionRuns)
        return;
    if (_locationQuery.pollsToSkip == 0)
        requestLocation();
    _calls.after(cellInterval, [this] { pollPosition(); });
}

void CellPoller::requestLocation() {
    if (std::exchange(_locationQuery.isPending, true))
        return;
    _calls.call({.path = _calls.path(),
                 .interface = mm::location,
                 .method = "GetLocation",
                 .arguments = {},
                 .timeout = locationTimeout},
                [this](const BusReply& reply) { locationAnswered(reply); });
}

void CellPoller::locationAnswered(const BusReply& reply) {
    _locationQuery.isPending = false;
    _location = reply.value;
    _locationReason = reply.failed() ? reply.reason() : std::string();
    if (reply.failed())
        refused(_locationQuery, reply, "its place in the network");
    else
        _follower.faults().clear(_locationQuery.subject);
    _located();
    // A late one counts too, until the next.
    const bool isAwaited = std::exchange(_awaitsPlace, false);
    if (hasServingCell(_cells.cells) || (!isAwaited && _location == _cells.location))
        return;
    _cells.location = _location;
    report();
}

void CellPoller::refused(Query& query, const BusReply& reply, std::string_view what) {
    _calls.reportFault(query.subject, reply, what);
    // Others may be over at the next poll: a modem that is not enabled yet, one that was busy.
    if (reply.isUnsupported() || reply.isDenied())
        query.pollsToSkip = pollsAfterRefusal - 1;
}

void CellPoller::stateChanged() {
    // What was refused in the one state may be granted in the next.
    _cellQuery.pollsToSkip = 0;
    _locationQuery.pollsToSkip = 0;
    _isDue = true;
}

void CellPoller::clear() {
    _cells = {};
    _location = {};
    _isDue = true;
}

} // namespace velmora
