// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/Reselections.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <utility>

namespace velmora {

namespace {

CellIdentity identityOf(const Neighbour& neighbour) {
    CellIdentity cell;
    cell.technology = neighbour.technology;
    cell.channel = neighbour.channel;
    cell.physicalCell = neighbour.physicalCell;
    return cell;
}

/// Some reports of GSM cells have no BSIC: of those that a phone hears the channel alone distinguishes them.
bool isCell(const Neighbour& neighbour, const CellIdentity& cell) {
    const bool isOnChannel = neighbour.channel && neighbour.channel == cell.channel;
    return areSameCell(identityOf(neighbour), cell)
        .value_or(isOnChannel && neighbour.technology == RadioTechnology::GSM);
}

bool areComparable(const Neighbour& neighbour, const CellIdentity& serving) {
    if (!neighbour.level_dBm || neighbour.technology != serving.technology)
        return false;
    return serving.technology == RadioTechnology::GSM ||
           (neighbour.channel && neighbour.channel == serving.channel);
}

} // namespace

void ReselectionsDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    if (picture.servingChange()) {
        _early.reset();
        judge(report, picture, sink);
        _seen.clear();
    }
    if (_early)
        confirm(report, picture, sink);
    if (picture.servingChange())
        return;
    if (picture.neighbours().empty())
        _seen.clear();
    else
        compare(report, picture);
}

void ReselectionsDetector::compare(const MessageReport& report, const RadioPicture& picture) {
    const Reading* const level = picture.find(Role::ServingLevel);
    // What is compared with the serving cell's level is of the same message, or nearly so.
    const auto isReported = [&report](const Neighbour& each) { return each.message == report.message; };
    if (level && level->message != report.message &&
        std::none_of(picture.neighbours().begin(), picture.neighbours().end(), isReported))
        return;
    _next.clear();
    if (level) {
        const CellIdentity serving = picture.servingCell();
        for (const Neighbour& neighbour : picture.neighbours()) {
            if (!areComparable(neighbour, serving) || report.time - neighbour.time > oldest ||
                report.time - level->time > oldest)
                continue;
            Seen seen{neighbour, *neighbour.level_dBm - level->number, std::nullopt, {}};
            if (seen.margin_dB >= lateMargin_dB) {
                const auto known = std::find_if(_seen.begin(), _seen.end(), [&neighbour](const Seen& each) {
                    return isCell(each.cell, identityOf(neighbour));
                });
                const bool wasBetter = known != _seen.end() && known->betterSince;
                seen.betterSince = wasBetter ? known->betterSince : report.time;
                seen.firstBetter = wasBetter ? known->firstBetter : report.message;
            }
            _next.push_back(seen);
        }
    }
    std::swap(_seen, _next);
}

void ReselectionsDetector::confirm(const MessageReport& report, const RadioPicture& picture,
                                   EventSink& sink) {
    const Time changed = _early->event.time;
    const Reading* const level = picture.find(Role::ServingLevel);
    for (const Neighbour& each : picture.neighbours()) {
        if (!level || level->time < changed || each.time < changed || !each.level_dBm ||
            !isCell(each, _early->from))
            continue;
        if (*each.level_dBm >= level->number) {
            addEvidence(_early->event, each.message);
            sink.happened(_early->event);
        }
        _early.reset();
        return;
    }
    if (report.time - changed > oldest)
        _early.reset();
}

void ReselectionsDetector::judge(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    const ServingChange& change = *picture.servingChange();
    if (change.isMovedByNetwork != false || change.from.technology != change.to.technology)
        return;
    for (const Seen& each : _seen) {
        if (!isCell(each.cell, change.to) || report.time - each.cell.time > oldest)
            continue;
        const bool isLate = each.betterSince && report.time - *each.betterSince > lateTime;
        if (!isLate && each.margin_dB > 0)
            return;
        Event event =
            newEvent(isLate ? EventKind::LateReselection : EventKind::EarlyReselection, report, picture);
        std::array<char, 64> margin{};
        std::snprintf(margin.data(), margin.size(), "%.1f dB", std::fabs(each.margin_dB));
        event.text = nameOf(change.from) + " to " + nameOf(change.to) + ", " + margin.data() +
                     (each.margin_dB > 0 ? " stronger" : " weaker");
        addField(event, "from", change.from);
        addField(event, "to", change.to);
        addField(event, "margin", each.margin_dB, Unit::DB);
        if (isLate) {
            addDuration(event, *each.betterSince, report.time);
            addEvidence(event, each.firstBetter);
        }
        addEvidence(event, each.cell.message);
        if (isLate)
            sink.happened(event);
        else
            _early = Early{std::move(event), change.from};
        return;
    }
}

} // namespace velmora
