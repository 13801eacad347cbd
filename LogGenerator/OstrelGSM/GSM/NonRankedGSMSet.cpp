// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/NonRankedGSMSet.h"

#include "Platform/SystemLog.h"

namespace velmora {

void NonRankedGSMSet::updateWithData(const Data&, std::uint32_t) {
    logLine(LogPriority::Warning, "NonRankedGSMSet");
}

} // namespace velmora
