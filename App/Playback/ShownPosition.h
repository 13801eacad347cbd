// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Playback/Player.h"
#include "Toolkit/Bars/PlaybackBar.h"

namespace velmora {

/// When the latest message before the moment arrived; at the front, when the first one did.
[[nodiscard]] Time shownTime(const RecordingIndex& index, const Player& player);

/// The moment's time, and its place in what has been read of the recording, for the bar. `clock` has the
/// zone.
[[nodiscard]] PlaybackBar::Shown shownPosition(const RecordingIndex& index, const Player& player,
                                               const Clock& clock);

} // namespace velmora
