// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/Technologies/DetectorTable.h"
#include "LogGenerator/Observations/Observation.h"

#include <string>

namespace velmora {

/// A value that was reported, to be compared with later ones.
class ReportedValue {
public:
    [[nodiscard]] bool isKnown() const { return _isKnown; }
    [[nodiscard]] const std::string& text() const { return _text; }
    /// The text before the latest change.
    [[nodiscard]] const std::string& previous() const { return _previous; }
    /// Keeps the value. Whether it is another one than before; the first one is.
    bool update(const Observation& observation, ObservedText& texts);
    void forget() { _isKnown = false; }

private:
    bool _isKnown = false;
    std::int64_t _raw = 0;
    double _number = 0;
    std::string _text;
    std::string _previous;
};

/// Whether the observation's value is the row's; not whether its path is.
[[nodiscard]] bool isValue(const Observation& observation, const ValueRow& row);

} // namespace velmora
