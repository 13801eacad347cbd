// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LTE/IntraFrequencyList.h"

namespace velmora {

/// "Detected Cells": one row per further cell that connected mode found on the serving frequency.
class DetectedCells final : public IntraFrequencyList {
public:
    DetectedCells();
    [[nodiscard]] std::string_view getSectionName() const override { return "Detected Cells"; }
};

} // namespace velmora
