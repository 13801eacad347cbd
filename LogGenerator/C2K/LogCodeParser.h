// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/Publisher.h"
#include "LogMessages/Record.h"

#include <cstdint>
#include <string_view>

namespace velmora::C2K {

/// Turns the records of one log code into values. A parser keeps nothing itself: values that run on from
/// record to record live in the state dictionary, which outlives decoders.
class LogCodeParser {
public:
    virtual ~LogCodeParser() = default;
    LogCodeParser(const LogCodeParser&) = delete;
    LogCodeParser& operator=(const LogCodeParser&) = delete;

    [[nodiscard]] virtual std::uint16_t logCode() const = 0;
    /// What people call such records.
    [[nodiscard]] virtual std::string_view name() const = 0;
    /// Decodes one record, prefix removed, of whatever length. One that is rejected is one log line: it
    /// publishes nothing and leaves the state alone.
    virtual void parse(const Record& record, Dictionary& state, const Publisher& publisher) const = 0;

protected:
    LogCodeParser() = default;

    /// The length as the log lines show it.
    [[nodiscard]] static unsigned lengthOf(const Record& record) {
        return static_cast<unsigned>(record.size());
    }
};

} // namespace velmora::C2K
