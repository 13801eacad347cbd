// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/ProcessCO.h"

#include "LogGenerator/OstrelGSM/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr Field stateFields[] = {
    {"MM State", u8At(13), text(OstrelGSM::mmStates)},
};
constexpr Layout state = layout(16, stateFields); // 0x7131

} // namespace

void ProcessCO::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "ProcessCS"); // the circuit-switched section's word, shared on purpose
    const Record record(data);
    switch (logCode) {
    case 0x7132: show(record, OstrelGSM::registration); break;
    case 0x7131: show(record, state); break;
    default: unknownLogMessage(logCode);
    }
}

} // namespace velmora
