// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelGSM/UMTS/SearcherSet.h"

namespace velmora {

/// "Monitored Set": the UMTS searcher's monitored set. No cell is ever put into it.
class MonitoredSet final : public SearcherSet {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Monitored Set"; }

protected:
    [[nodiscard]] std::string_view traceName() const override { return "MonitoredSet"; }
};

} // namespace velmora
