// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/CellChangeCounters.h"

#include "Platform/SystemLog.h"

namespace velmora {

std::span<const View> CellChangeCounters::views() const {
    return {};
}

void CellChangeCounters::trace() const {
    logLine(LogPriority::Warning, "CellChangeCounters");
}

void CellChangeCounters::unknownCode(std::uint32_t) const {}

} // namespace velmora
