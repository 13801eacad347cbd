// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Connected mode LTE Intra-frequency Measurement": the serving cell as connected mode measures it.
class ConnectedModeMeasurementMisc final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override {
        return "Connected mode LTE Intra-frequency Measurement";
    }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xB179}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
