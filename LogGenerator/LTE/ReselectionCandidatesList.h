// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Reselection Candidates List": one row per cell, of any radio technology, that the phone might move to.
class ReselectionCandidatesList final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Reselection Candidates List"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xB186}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
