// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellSection.h"

namespace velmora {

/// "GSM Serving Cell": identity, channel and level of the GSM cell that serves the phone.
class GSMServingCell final : public CellSection {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GSM Serving Cell"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    [[nodiscard]] const CellTable& cellTable() const override;
    void trace() const override;
};

} // namespace velmora
