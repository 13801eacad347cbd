// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "TRCH BLER": one row per transport channel with its block error measurement.
class TRCHBLERMeasurement final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "TRCH BLER"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xD00C}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
