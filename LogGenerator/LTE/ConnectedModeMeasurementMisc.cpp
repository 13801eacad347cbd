// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ConnectedModeMeasurementMisc.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

constexpr Field servingFields[] = {
    {"E-ARFCN", u16At(17), integer("%d")},
    {"Serving Physical Cell ID", u16At(19), integer("%d")},
    {"Subframe Number", u16At(21), integer("%d")},
    {"Serving Filtered RSRP", u16At(23), LTE::filteredRSRP},
    {"Serving Filtered RSRQ", u16At(25), LTE::filteredRSRQ},
};
constexpr Layout serving = layout(IntraFrequencyRecord::minimumLength, servingFields);

} // namespace

void ConnectedModeMeasurementMisc::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, getSectionName());
    if (logCode == IntraFrequencyRecord::code)
        show(Record(data), serving);
    else
        unknownLogMessage(logCode);
}

} // namespace velmora
