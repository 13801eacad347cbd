// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/NeighborMeasurementMisc.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::NeighborRecord;

namespace {

constexpr Field headerFields[] = {
    {"Version", u8At(13), integer("%d")},
    {"E-ARFCN", u16At(17), integer("%d")},
    {"Qrxlevmin", bitsAt(19, 0, 6), integer("%d dBm", -140, 2)},
};
constexpr Layout header = layout(NeighborRecord::minimumLength, headerFields);

} // namespace

void NeighborMeasurementMisc::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, getSectionName());
    if (logCode == NeighborRecord::code)
        show(Record(data), header);
    else
        unknownLogMessage(logCode);
}

} // namespace velmora
