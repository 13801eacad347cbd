// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/TelephonyService.h"

namespace velmora {

/// The decoder of the technology Ostrel LTE: the template "LTE" with its class index.
class LTELogGenerator final : public OstrelLogGenerator2 {
public:
    explicit LTELogGenerator(const Clock& clock);
    ~LTELogGenerator() override;
    [[nodiscard]] std::string_view technology() const override { return kVoxLogChannelTechnology_Ostrel_LTE; }
    [[nodiscard]] static std::unique_ptr<LTELogGenerator> generator(const Clock& clock);
};

} // namespace velmora
