// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogMessages/DLFVersionReport.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace velmora {

/// The common base of the binary families: keeps the raw messages since the last display and writes the
/// history's as a DLF log, the modem maker's diagnostic log file.
class OstrelLogGenerator : public LogGenerator {
public:
    explicit OstrelLogGenerator(const Clock& clock) : LogGenerator(clock) {}

    /// The DLF log of the state's history: a version report, then each entry's raw messages. Absent, with a
    /// log line, when an entry's raw messages are not bytes.
    [[nodiscard]] std::optional<Data> generateDlfFromState(const Dictionary& state) const;

    /// The history and, where it can be written, the DLF log.
    [[nodiscard]] ArrayRef getSaveContentsFromState(const Dictionary& state) const override;

protected:
    /// Raw log messages since the last display, one after another.
    std::vector<std::uint8_t> _binData;

    /// Appends a message to them, where a history is kept.
    void keepMessage(const Data& message) {
        if (!keepsHistory())
            return;
        const Bytes bytes = message.bytes();
        _binData.insert(_binData.end(), bytes.begin(), bytes.end());
    }

    /// Ends a refresh: moves the raw messages into the state under "DisplayState", starts a new collection
    /// and appends to the history, where one is kept.
    void endRefresh(Dictionary& state);
};

} // namespace velmora
