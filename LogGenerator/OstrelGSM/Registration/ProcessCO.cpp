// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/ProcessCO.h"

#include "LogGenerator/OstrelGSM/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x7131: the main MM state (3GPP TS 24.008 4.1.2.1).
constexpr Field stateFields[] = {
    {"MM State", u8At(13), text(OstrelGSM::mmStates), {.clause = "3GPP TS 24.008 4.1.2.1"}},
};
constexpr Layout state = layout(16, stateFields);

constexpr View sectionViews[] = {
    {0x7131, state},
    {0x7132, OstrelGSM::registration},
};

} // namespace

std::span<const View> ProcessCO::views() const {
    return sectionViews;
}

void ProcessCO::trace() const {
    logLine(LogPriority::Warning, "ProcessCS"); // the circuit-switched section's text, on purpose
}

} // namespace velmora
