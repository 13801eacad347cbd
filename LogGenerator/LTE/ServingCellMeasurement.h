// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Serving Cell Measurements": the serving cell as idle mode measures it, and what its selection depends on.
class ServingCellMeasurement final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving Cell Measurements"; }
    [[nodiscard]] std::span<const View> views() const override;
};

} // namespace velmora
