// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <string>

namespace velmora {

/// Formats times in local time by a pattern: yyyy, MM, dd, HH, mm and ss stand for year, month, day, hour,
/// minute and second with leading zeros; text between apostrophes, and whatever is no letter, stands for
/// itself, and two apostrophes for one. A field of another name stands for itself too.
class DateFormatter {
public:
    /// `clock` gives the zone and must outlive the formatter.
    DateFormatter(const Clock& clock, std::string pattern);

    [[nodiscard]] std::string stringFromDate(Time moment) const;

private:
    const Clock& _clock;
    std::string _pattern;
};

} // namespace velmora
