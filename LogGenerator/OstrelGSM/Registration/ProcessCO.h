// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Process CO": the mobility-management states that both domains share.
class ProcessCO final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Process CO"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x7131, 0x7132}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
