// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/TelephonyService.h"

namespace velmora {

/// The decoder of the technology Ostrel GSM (GSM and UMTS): the template "Ostrel_GSM" with its class index.
class Ostrel_GSMLogGenerator final : public OstrelLogGenerator2 {
public:
    explicit Ostrel_GSMLogGenerator(const Clock& clock);
    ~Ostrel_GSMLogGenerator() override;
    [[nodiscard]] std::string_view technology() const override { return kVoxLogChannelTechnology_Ostrel_GSM; }
    [[nodiscard]] static std::unique_ptr<Ostrel_GSMLogGenerator> generator(const Clock& clock);
};

} // namespace velmora
