// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveModel.h"

#include "Analysis/Drive/DriveRules.h"

#include <algorithm>

namespace velmora {

DriveModel::DriveModel(DriveSamples& samples, const Clock& clock, RuleFiles rules, std::size_t mostEvents)
    : _samples(samples), _clock(clock), _rules(std::move(rules)), _events(mostEvents) {}

void DriveModel::setDecoder(LogGenerator* decoder) {
    if (_engine)
        interrupt();
    _engine.reset();
    for (PinnedRow& each : _pinned)
        each.lose();
    if (_decoder)
        _decoder->setObservationSink(nullptr);
    _decoder = decoder;
    if (!decoder)
        return;
    const Catalogue& catalogue = decoder->catalogue();
    _engine = std::make_unique<EventEngine>(catalogue, _events);
    addRules();
    for (PinnedRow& each : _pinned)
        each.find(catalogue);
    decoder->setObservationSink(this);
}

void DriveModel::addRules() {
    const std::vector<RuleFile> files = _rules ? _rules() : std::vector<RuleFile>();
    if (files.empty())
        return;
    DriveRules rules = driveRules(files, _decoder->catalogue(), _clock);
    _engine->add(std::move(rules.detector));
    _classes = std::move(rules.classes);
}

void DriveModel::interrupt() {
    if (_engine)
        _engine->interrupt();
    if (_latest && (_technology || _mode))
        _samples.changed(*_latest, {}, {});
    _technology.reset();
    _mode.reset();
}

void DriveModel::reset() {
    if (_decoder)
        _engine->interrupt();
    _technology.reset();
    _mode.reset();
    _events.forgetAll();
    _samples.forgetAll();
    _messages = 0;
    _latest.reset();
}

void DriveModel::observed(const ObservedMessage& message) {
    ++_messages;
    _latest = message.arrival;
    report({{0, message.number}, message.arrival, message});
}

bool DriveModel::wants(const CatalogueField& leaf) const {
    return _engine->wants(leaf) || std::any_of(_pinned.begin(), _pinned.end(),
                                               [&leaf](const auto& each) { return each.leaf() == &leaf; });
}

void DriveModel::undecoded(Time arrival) {
    ObservedMessage nothing{};
    nothing.arrival = arrival;
    nothing.damage = Damage::Unreadable;
    observed(nothing);
}

void DriveModel::noted(std::string_view text) {
    if (_engine && _engine->last()) // otherwise there is no moment that it could be about
        _engine->noted({}, text);
}

void DriveModel::damaged(std::string_view reason) {
    if (_engine)
        _engine->damaged({}, reason);
}

void DriveModel::finish() {
    if (_engine)
        _engine->finish();
}

void DriveModel::report(const MessageReport& report) {
    _engine->report(report);
    samplePinned(report);
    if (report.observed.damage != Damage::None)
        return;
    const RadioPicture& picture = _engine->picture();
    if (const auto technology = picture.technology(); technology != _technology || picture.mode() != _mode) {
        _technology = technology;
        _mode = picture.mode();
        _samples.changed(report.time, _technology, _mode);
    }
    const auto sample = [&](Role role, std::size_t series) {
        if (const Reading* const found = picture.find(role);
            found && found->message == report.message && found->kind == ObservedKind::Number)
            _samples.sample(series, report.time, found->number);
    };
    sample(Role::ServingLevel, servingLevelSeries);
    sample(Role::ServingQuality, servingQualitySeries);
    sampleNeighbours(report);
}

/// What a damaged message has is charted too: the panes show it.
void DriveModel::samplePinned(const MessageReport& report) {
    if (_pinned.empty())
        return;
    for (const Observation& each : report.observed.observations)
        for (std::size_t i = 0; i < _pinned.size(); ++i)
            if (_pinned[i].holds(each))
                _samples.sample(firstPinnedSeries + i, report.time, each.number);
}

void DriveModel::sampleNeighbours(const MessageReport& report) {
    const std::span<const Neighbour> all = _engine->picture().neighbours();
    for (std::size_t i = 0; i < std::min(all.size(), chartedNeighbours); ++i) {
        if (all[i].message != report.message)
            continue;
        if (all[i].level_dBm)
            _samples.sample(firstNeighbourLevelSeries + i, report.time, *all[i].level_dBm);
        if (all[i].quality_dB)
            _samples.sample(firstNeighbourQualitySeries + i, report.time, *all[i].quality_dB);
    }
}

std::span<const Neighbour> DriveModel::neighbours() const {
    return _engine ? _engine->picture().neighbours() : std::span<const Neighbour>();
}

std::vector<DriveSeries> DriveModel::series() const {
    std::vector<DriveSeries> all;
    for (const Unit unit : {Unit::DBm, Unit::DB}) {
        all.push_back({"Serving cell", unit});
        for (std::size_t i = 1; i <= chartedNeighbours; ++i)
            all.push_back({"Neighbour " + std::to_string(i), unit});
    }
    for (const PinnedRow& each : _pinned)
        all.push_back({each.path(), each.leaf() ? each.leaf()->unit : Unit::None, true});
    return all;
}

bool DriveModel::togglePin(const std::string& path) {
    const auto pinned = std::find_if(_pinned.begin(), _pinned.end(),
                                     [&path](const PinnedRow& each) { return each.path() == path; });
    if (pinned != _pinned.end()) {
        const auto index = static_cast<std::size_t>(pinned - _pinned.begin());
        _pinned.erase(pinned);
        _samples.unpinned(firstPinnedSeries + index);
        return true;
    }
    PinnedRow row(path);
    if (!_decoder || _pinned.size() >= mostPinned || !row.find(_decoder->catalogue()))
        return false;
    _pinned.push_back(std::move(row));
    _decoder->setObservationSink(this); // which wants one leaf more now
    _samples.pinned(series().back());
    return true;
}

bool DriveModel::canPin(const std::string& path) const {
    return _decoder && PinnedRow(path).find(_decoder->catalogue());
}

bool DriveModel::isPinned(const std::string& path) const {
    return std::any_of(_pinned.begin(), _pinned.end(),
                       [&path](const PinnedRow& each) { return each.path() == path; });
}

} // namespace velmora
