// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/NonRankedGSMSet.h"

#include "Platform/SystemLog.h"

namespace velmora {

std::span<const View> NonRankedGSMSet::views() const {
    return {};
}

void NonRankedGSMSet::trace() const {
    logLine(LogPriority::Warning, "NonRankedGSMSet");
}

void NonRankedGSMSet::unknownCode(std::uint32_t) const {}

} // namespace velmora
