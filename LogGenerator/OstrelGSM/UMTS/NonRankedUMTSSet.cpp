// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/NonRankedUMTSSet.h"

#include "Platform/SystemLog.h"

namespace velmora {

void NonRankedUMTSSet::updateWithData(const Data&, std::uint32_t) {
    logLine(LogPriority::Warning, "NonRankedUMTSSet");
}

} // namespace velmora
