// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/NonRankedUMTSSet.h"

#include "Platform/SystemLog.h"

namespace velmora {

std::span<const View> NonRankedUMTSSet::views() const {
    return {};
}

void NonRankedUMTSSet::trace() const {
    logLine(LogPriority::Warning, "NonRankedUMTSSet");
}

void NonRankedUMTSSet::unknownCode(std::uint32_t) const {}

} // namespace velmora
