// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Process CO": the mobility-management states that both domains share.
class ProcessCO final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Process CO"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void trace() const override;
};

} // namespace velmora
