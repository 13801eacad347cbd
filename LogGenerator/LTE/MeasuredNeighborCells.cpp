#include "LogGenerator/LTE/MeasuredNeighborCells.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

constexpr Field cellFields[] = {
    {"Physical Cell ID", u16At(0), integer("%d")},
    {"Filtered RSRP", u16At(2), LTE::filteredRSRP},
    {"Filtered RSRQ", u16At(4), LTE::filteredRSRQ},
};
constexpr Layout cell = layout(IntraFrequencyRecord::neighbourLength, cellFields);

} // namespace

void MeasuredNeighborCells::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, getSectionName());
    if (logCode != IntraFrequencyRecord::code) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (record.size() < IntraFrequencyRecord::minimumLength)
        return;
    clearElements();
    const IntraFrequencyRecord measurement(record);
    if (measurement.neighbours().count() > 0)
        showRows(measurement.neighbours(), cell, logCode);
}

} // namespace velmora
