// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <string>

namespace velmora {

/// Formats times in local time by a pattern: yyyy, MM, dd, HH, mm and ss are replaced by year, month, day,
/// hour, minute and second with leading zeros; text between apostrophes, everything but letters, and fields
/// of other names are copied; two apostrophes give one.
class DateFormatter {
public:
    /// `clock` has the time zone and must outlive the formatter.
    DateFormatter(const Clock& clock, std::string pattern);

    [[nodiscard]] std::string stringFromDate(Time moment) const;

private:
    const Clock& _clock;
    std::string _pattern;
};

} // namespace velmora
