// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "CCTRCH SIR": one row per coded composite transport channel with its signal-to-interference ratios. It
/// reads the records of "TRCH BLER", after that section.
class CCTRCHSIRMeasurement final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "CCTRCH SIR"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xD00C}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
