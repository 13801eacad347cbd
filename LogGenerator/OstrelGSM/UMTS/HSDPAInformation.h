// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "HSDPA Info": the statistics of the HSDPA HARQ processes.
class HSDPAInformation final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "HSDPA Info"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x4221}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
