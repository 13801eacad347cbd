// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

namespace velmora {

/// The machine's clock, and the zone that TZ and /etc/localtime name.
class MachineClock final : public Clock {
public:
    [[nodiscard]] Time now() const override;
    [[nodiscard]] ZoneState zoneAt(Time moment) const override;
};

} // namespace velmora
