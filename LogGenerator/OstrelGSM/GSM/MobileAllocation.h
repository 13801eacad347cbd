// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Mobile Allocation": the hopping sequence number and the channels that are hopped over.
class MobileAllocation final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Mobile Allocation"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x51F8}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
