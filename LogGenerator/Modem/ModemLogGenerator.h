// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/TelephonyService.h"

namespace velmora {

/// The decoder of the technology Modem: the template "Modem" with its class index.
class ModemLogGenerator final : public OstrelLogGenerator2 {
public:
    explicit ModemLogGenerator(const Clock& clock);
    [[nodiscard]] std::string_view technology() const override { return kVoxLogChannelTechnology_Modem; }
    [[nodiscard]] static std::unique_ptr<ModemLogGenerator> generator(const Clock& clock);
};

} // namespace velmora
