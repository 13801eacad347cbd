// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/RecordedDrive.h"

#include "Playback/QuietDecoding.h"

#include <algorithm>
#include <utility>

namespace velmora {

RecordedDrive::RecordedDrive(DriveSamples& samples, const Clock& clock, DriveModel::RuleFiles rules)
    : _model(samples, clock, std::move(rules), mostEvents) {}

RecordedDrive::~RecordedDrive() {
    setIndex(nullptr);
}

void RecordedDrive::setIndex(RecordingIndex* index) {
    if (_index)
        _index->setPass(nullptr);
    _model.setDecoder(nullptr);
    _index = index;
    if (!index)
        return;
    const QuietDecoding quiet; // what the decoders say for which rules are read
    _model.reset();
    _model.setDecoder(&index->decoder().decoder());
    index->setPass(this);
}

PlayedPicture::Memory RecordedDrive::memory() const {
    return {_model.picture()->memory(), _model.lastChecked(), _model.messages()};
}

// The events are sorted by their times, the latest first.

const Event* RecordedDrive::after(Time time) const {
    const auto& all = _model.events();
    const auto end =
        std::partition_point(all.begin(), all.end(), [time](const Event& each) { return each.time > time; });
    return end == all.begin() ? nullptr : &*(end - 1);
}

const Event* RecordedDrive::before(Time time) const {
    const auto& all = _model.events();
    const auto found =
        std::partition_point(all.begin(), all.end(), [time](const Event& each) { return each.time >= time; });
    return found == all.end() ? nullptr : &*found;
}

} // namespace velmora
