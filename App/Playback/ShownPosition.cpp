// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Playback/ShownPosition.h"

#include "App/DateFormatter.h"

#include <algorithm>
#include <optional>

namespace velmora {

Time shownTime(const RecordingIndex& index, const Player& player) {
    return player.now().value_or(index.first().value_or(Time()));
}

PlaybackBar::Shown shownPosition(const RecordingIndex& index, const Player& player, const Clock& clock) {
    PlaybackBar::Shown shown;
    if (const std::optional<Time> first = index.first()) {
        const Time moment = shownTime(index, player);
        const auto whole = static_cast<double>((*index.last() - *first).count());
        const auto before = static_cast<double>((moment - *first).count());
        const bool isAtEnd = player.position() == index.messages();
        shown.part = whole > 0 ? std::clamp(before / whole, 0.0, 1.0) : isAtEnd ? 1 : 0;
        shown.time = DateFormatter(clock, "yyyy-MM-dd HH:mm:ss").stringFromDate(moment);
    }
    return shown;
}

} // namespace velmora
