// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Playback/PlayedDrive.h"

#include <utility>

namespace velmora {

PlayedDrive::PlayedDrive(const Clock& clock, DriveModel::RuleFiles rules, Host host)
    : _recorded(_history, clock, std::move(rules)), _host(std::move(host)) {}

void PlayedDrive::setPlayer(RecordingIndex* index, const Player* player) {
    _recorded.setIndex(index);
    _index = index;
    _player = player;
    changed();
}

DriveNow PlayedDrive::now() const {
    return _player ? driveNow(_player->picture()) : DriveNow();
}

std::span<const Neighbour> PlayedDrive::neighbours() const {
    return _player ? _player->picture().neighbours() : std::span<const Neighbour>();
}

Time PlayedDrive::moment() const {
    if (!_player)
        return {};
    return _player->now().value_or(_index->first().value_or(Time()));
}

Time PlayedDrive::end() const {
    return _index ? _index->last().value_or(Time()) : Time();
}

bool PlayedDrive::togglePin(const std::string& path) {
    DriveModel& model = _recorded.model();
    const bool wasPinned = model.isPinned(path);
    if (!model.togglePin(path))
        return false;
    if (wasPinned)
        changed();
    else
        _host.readAgain(); // for the samples of what has been read already
    return true;
}

} // namespace velmora
