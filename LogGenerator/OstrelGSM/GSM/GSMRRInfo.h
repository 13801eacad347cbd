// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GSM RR Info": the GSM radio-resource state and the serving cell's measurements.
class GSMRRInfo final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GSM RR Info"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void trace() const override;
};

} // namespace velmora
