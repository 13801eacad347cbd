// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LTE/IntraFrequencyList.h"

namespace velmora {

/// "Measured Neighbor Cells": one row per neighbour that connected mode measures on the serving frequency.
class MeasuredNeighborCells final : public IntraFrequencyList {
public:
    MeasuredNeighborCells();
    [[nodiscard]] std::string_view getSectionName() const override { return "Measured Neighbor Cells"; }
};

} // namespace velmora
