// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Reselection Candidates": the cell that is to be left.
class ReselectionCandidatesMisc final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Reselection Candidates"; }
    [[nodiscard]] std::span<const View> views() const override;
};

} // namespace velmora
