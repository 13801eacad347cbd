// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "UMTS RR Info": the UMTS radio-resource state, the serving cell, transmit power and ciphering.
class UMTSRRInfo final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "UMTS RR Info"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override {
        return {0x4125, 0x4031, 0x4127, 0x4157, 0xFF0001};
    }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

private:
    /// 0x4031: the mean of the transmit powers.
    void showTransmitPower(const Record& record);
    /// 0x4127: the serving cell as the baseband knows it.
    void showCell(const Record& record);
    /// 0xFF0001: the first serving UMTS cell that the telephony service knows.
    void showServingCell(const Data& data);
};

} // namespace velmora
