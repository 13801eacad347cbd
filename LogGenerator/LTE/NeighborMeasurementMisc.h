// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Neighbor Measurements": the frequency on which idle mode measures neighbours.
class NeighborMeasurementMisc final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighbor Measurements"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xB180}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
