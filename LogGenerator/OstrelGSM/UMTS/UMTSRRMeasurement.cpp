// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/UMTSRRMeasurement.h"

#include "Platform/SystemLog.h"

namespace velmora {

void UMTSRRMeasurement::updateWithData(const Data&, std::uint32_t) {
    logLine(LogPriority::Warning, "UMTSRRMeasurement");
}

} // namespace velmora
