// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/CodingScheme.h"

#include "Platform/SystemLog.h"

namespace velmora {

void CodingScheme::updateWithData(const Data&, std::uint32_t) {
    logLine(LogPriority::Warning, "CellChangeCounters"); // the word of that section, shared on purpose
}

} // namespace velmora
