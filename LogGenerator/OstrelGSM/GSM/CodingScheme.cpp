// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/CodingScheme.h"

#include "Platform/SystemLog.h"

namespace velmora {

std::span<const View> CodingScheme::views() const {
    return {};
}

void CodingScheme::trace() const {
    logLine(LogPriority::Warning, "CellChangeCounters"); // that section's text, on purpose
}

void CodingScheme::unknownCode(std::uint32_t) const {}

} // namespace velmora
