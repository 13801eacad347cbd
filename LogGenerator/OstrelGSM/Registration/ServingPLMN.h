// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellSection.h"

namespace velmora {

/// "Serving PLMN": the network that the phone is registered with, its areas and the type of service.
class ServingPLMN final : public CellSection {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving PLMN"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    [[nodiscard]] const CellTable& cellTable() const override;
    void trace() const override;
};

} // namespace velmora
