// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Non-Ranked GSM Set": wants no code; it is there so that the display shows a section of this name.
class NonRankedGSMSet final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Non-Ranked GSM Set"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
