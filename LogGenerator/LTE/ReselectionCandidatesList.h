// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Reselection Candidates List": one row per cell, of any radio technology, that the phone might move to.
class ReselectionCandidatesList final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Reselection Candidates List"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
