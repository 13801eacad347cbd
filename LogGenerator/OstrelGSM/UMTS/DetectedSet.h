// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelGSM/UMTS/SearcherSet.h"

namespace velmora {

/// "Detected Set": the UMTS searcher's detected set. No cell is ever put into it.
class DetectedSet final : public SearcherSet {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Detected Set"; }

protected:
    [[nodiscard]] std::string_view traceName() const override { return "DetectedSet"; }
};

} // namespace velmora
