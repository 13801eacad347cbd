// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/CellChangeCounters.h"

#include "Platform/SystemLog.h"

namespace velmora {

void CellChangeCounters::updateWithData(const Data&, std::uint32_t) {
    logLine(LogPriority::Warning, "CellChangeCounters");
}

} // namespace velmora
