// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GPRS Information": the packet-data options that the GSM cell broadcasts.
class GPRSInformation final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GPRS Information"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void trace() const override;
};

} // namespace velmora
