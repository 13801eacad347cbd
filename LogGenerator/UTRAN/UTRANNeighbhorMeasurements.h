// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Neighbor Cell List": one row per UTRAN cell that the phone measures. (The class keeps the baseband's own
/// spelling.)
class UTRANNeighbhorMeasurements final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighbor Cell List"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xD00A}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
