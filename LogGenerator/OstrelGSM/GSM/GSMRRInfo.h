// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GSM RR Info": the GSM radio-resource state and the serving cell's measurements.
class GSMRRInfo final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GSM RR Info"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override {
        return {0x512C, 0x5137, 0x5072, 0x51F6};
    }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
