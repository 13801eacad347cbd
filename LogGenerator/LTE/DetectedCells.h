#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Detected Cells": one row per further cell that connected mode found on the serving frequency.
class DetectedCells final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Detected Cells"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xB179}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
