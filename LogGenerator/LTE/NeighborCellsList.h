// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Neighbor Cells List": one row per neighbour that idle mode measures.
class NeighborCellsList final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighbor Cells List"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
