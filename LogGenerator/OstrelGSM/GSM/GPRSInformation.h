// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GPRS Information": the packet-data options that the GSM cell broadcasts.
class GPRSInformation final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GPRS Information"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override {
        return {0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137};
    }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
