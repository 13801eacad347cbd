// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/UMTSRRMeasurement.h"

#include "Platform/SystemLog.h"

namespace velmora {

std::span<const View> UMTSRRMeasurement::views() const {
    return {};
}

void UMTSRRMeasurement::trace() const {
    logLine(LogPriority::Warning, "UMTSRRMeasurement");
}

void UMTSRRMeasurement::unknownCode(std::uint32_t) const {}

} // namespace velmora
