// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GSM Set": the GSM cells that are ranked for reselection, one row each.
class GSMSet final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GSM Set"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x4005}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
