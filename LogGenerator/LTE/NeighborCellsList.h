// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Neighbor Cells List": one row per neighbour that idle mode measures.
class NeighborCellsList final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighbor Cells List"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xB180}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
