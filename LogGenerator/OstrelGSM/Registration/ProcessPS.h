// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Process PS": the packet-switched mobility-management states.
class ProcessPS final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Process PS"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x7130, 0x7132}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
