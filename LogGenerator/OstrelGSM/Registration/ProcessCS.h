// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Process CS": the circuit-switched mobility-management states.
class ProcessCS final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Process CS"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void trace() const override;
};

} // namespace velmora
