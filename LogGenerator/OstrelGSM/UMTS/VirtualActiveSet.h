// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelGSM/UMTS/SearcherSet.h"

namespace velmora {

/// "Virtual Active Set": the UMTS searcher's virtual active set. No cell is ever put into it.
class VirtualActiveSet final : public SearcherSet {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Virtual Active Set"; }

protected:
    [[nodiscard]] std::string_view traceName() const override { return "VirtualActiveSet"; }
};

} // namespace velmora
