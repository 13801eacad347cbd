// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Serving PLMN": the network that the phone is registered with, its areas and the service it gives.
class ServingPLMN final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving PLMN"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override {
        return {0x7135, 0x7132, 0xFF0001};
    }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

private:
    /// 0x7135: PLMN, areas and service type as the network signals them.
    void showIdentity(const Record& record);
    /// 0xFF0001: the first serving GSM or UMTS cell that the telephony service knows.
    void showServingCell(const Data& data);
};

} // namespace velmora
