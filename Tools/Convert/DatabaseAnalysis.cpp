// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/DatabaseAnalysis.h"

#include "LogGenerator/Observations/Damage.h"
#include "LogMessages/RecordTime.h"

#include <algorithm>

namespace velmora {

DatabaseAnalysis::DatabaseAnalysis(const Catalogue& catalogue, const RuleSet& rules, DatabaseChoice& choice,
                                   RecordingDatabase& database)
    : _technology(catalogue.technology()), _choice(choice), _database(database), _events(catalogue, *this) {
    _events.add(makeRuleDetector(rules, catalogue));
}

void DatabaseAnalysis::report(const MessageReport& report) {
    const ObservedMessage& observed = report.observed;
    if (!_choice.first)
        _choice.first = report.time;
    for (const Observation& observation : observed.observations)
        noteServing(observation);
    _events.report(report);
    const std::vector<std::uint32_t>& codes = _choice.messages.codes;
    if (!_choice.isIn(report.time) ||
        (!codes.empty() &&
         (!observed.code || std::find(codes.begin(), codes.end(), *observed.code) == codes.end())))
        return;
    const std::uint64_t number = report.message.number;
    const std::optional<Time> modemTime =
        observed.timestamp ? timeOfRecord(*observed.timestamp) : std::nullopt;
    _database.add({number, report.time, modemTime, _technology, observed.code, nameOf(observed.damage),
                   _channel, _cell});
    for (const Observation& observation : observed.observations)
        if (isWanted(observation))
            _database.add(number, _technology, observation);
}

void DatabaseAnalysis::reportUndecoded(const UndecodedReport& report) {
    if (!_choice.first)
        _choice.first = report.time;
    _events.reportUndecoded(report);
    if (_choice.isIn(report.time) && _choice.messages.codes.empty())
        _database.add({report.message.number, report.time, std::nullopt, _technology, std::nullopt,
                       report.reason, _channel, _cell});
}

void DatabaseAnalysis::happened(const Event& event) {
    if (_choice.isIn(event.time, event.lasts ? event.end.value_or(event.time) : event.time))
        _database.add(event);
}

bool DatabaseAnalysis::isWanted(const Observation& observation) {
    const CatalogueField& leaf = *observation.leaf;
    if (leaf.index >= _wanted.size())
        _wanted.resize(leaf.index + 1);
    Wanted& wanted = _wanted[leaf.index];
    if (!wanted.isKnown)
        wanted = {true, _choice.leaves.choose(leaf)};
    if (!wanted.leaf)
        return false;
    const auto& rows = wanted.leaf->rows;
    return rows.empty() || std::any_of(rows.begin(), rows.end(),
                                       [&](const auto& each) { return isInRows(observation, each); });
}

void DatabaseAnalysis::noteServing(const Observation& observation) {
    const Role role = observation.leaf->role;
    if (observation.kind == ObservedKind::Absent)
        return;
    if (role == Role::ServingChannel)
        _channel = _texts.of(observation);
    else if (role == Role::ServingPhysicalCell)
        _cell = _texts.of(observation);
}

} // namespace velmora
