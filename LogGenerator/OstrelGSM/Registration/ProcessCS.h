// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Process CS": the circuit-switched mobility-management states.
class ProcessCS final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Process CS"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x7131, 0x7132}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
