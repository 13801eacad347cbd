// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GSM Serving Cell": identity, channel and level of the GSM cell that serves the phone.
class GSMServingCell final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GSM Serving Cell"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override {
        return {0x5134, 0x5137, 0x5076, 0xFF0001};
    }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

private:
    /// 0xFF0001: the first serving GSM cell that the telephony service knows.
    void showServingCell(const Data& data);
};

} // namespace velmora
