// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Playback/Player.h"

#include <string>

namespace velmora {

/// What the bar above the panes says of a recording: what of it is damaged or could not be decoded, with
/// record and offset, how it has changed since it was opened, and which of its technologies is shown. Empty
/// where all is well. `change`: see PlayedFile.
[[nodiscard]] std::string playbackNotice(const PlayedFile& file, const RecordingIndex& index,
                                         const Player& player, const std::string& change);

/// The technology of the file, by its short name, that follows the shown one; empty where it has no other.
[[nodiscard]] std::string otherTechnology(const PlayedFile& file, const RecordingIndex& index);

} // namespace velmora
