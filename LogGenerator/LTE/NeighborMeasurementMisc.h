// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Neighbor Measurements": the frequency on which idle mode measures neighbours.
class NeighborMeasurementMisc final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighbor Measurements"; }
    [[nodiscard]] std::span<const View> views() const override;
};

} // namespace velmora
