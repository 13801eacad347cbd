#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Measured Neighbor Cells": one row per neighbour that connected mode measures on the serving frequency.
class MeasuredNeighborCells final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Measured Neighbor Cells"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xB179}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
