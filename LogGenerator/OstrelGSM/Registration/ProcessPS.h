// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Process PS": the packet-switched mobility-management states.
class ProcessPS final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Process PS"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void trace() const override;
};

} // namespace velmora
