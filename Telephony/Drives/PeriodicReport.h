// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RecordBuilder.h"

#include <optional>

namespace velmora {

/// A record that the modem sends periodically; `Context` is what the technology's reports are made from.
template <class Context>
struct PeriodicReport {
    double period_s;
    /// Returns nothing where the phone's state has nothing to report.
    std::optional<RecordBuilder> (*make)(Context&);
};

} // namespace velmora
