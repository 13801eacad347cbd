// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/MachineClock.h"
#include "Recording/MessageReader.h"
#include "Tools/Decode/DecodeProgress.h"
#include "Tools/LogOverride.h"

#include <functional>
#include <optional>
#include <string>

namespace velmora {

/// The progress of one file on standard error, if that is a terminal and the file is long enough.
class ShownProgress {
public:
    /// `writesAsItGoes`: standard output is written to while the file is read. `mayShow`: asked before each
    /// line, in a process whose standard error is passed on to a terminal; without, standard error is looked
    /// at.
    ShownProgress(const MessageReader& reader, const std::string& path, bool writesAsItGoes,
                  std::function<bool()> mayShow = {});

    /// Null where no progress is shown.
    [[nodiscard]] DecodeProgress* get() { return _progress ? &*_progress : nullptr; }
    /// Clears the line, before anything else is written there.
    void clear() {
        if (_line)
            _line->clear();
    }

private:
    std::function<bool()> _mayShow;
    MachineClock _clock;
    std::optional<ProgressLine> _line;
    std::optional<DecodeProgress> _progress;
};

} // namespace velmora
