// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Equivalent PLMN List": one row per network that the phone treats as its serving one.
class EquivalentPLMNList final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Equivalent PLMN List"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x7150}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
