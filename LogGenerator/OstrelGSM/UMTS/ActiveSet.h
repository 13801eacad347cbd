// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelGSM/UMTS/SearcherSet.h"

namespace velmora {

/// "Active Set": one row per cell of the UMTS searcher's active set.
class ActiveSet final : public SearcherSet {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Active Set"; }
    [[nodiscard]] std::span<const View> views() const override;

protected:
    [[nodiscard]] std::string_view traceName() const override { return "ActiveSet"; }
    void checkCells(const Record& record) const override;
    [[nodiscard]] std::span<const Content> cellContents() const override;
    void visitCells(const Record& record, FieldVisitor& visitor) const override;
};

} // namespace velmora
