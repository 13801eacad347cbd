#include "LogGenerator/LTE/DetectedCells.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

constexpr Field cellFields[] = {
    {"Physical Cell ID", u16At(0), integer("%d")},
};
constexpr Layout cell = layout(IntraFrequencyRecord::detectedLength, cellFields);

} // namespace

void DetectedCells::updateWithData(const Data& data, std::uint32_t logCode) {
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
    if (measurement.detected().count() > 0)
        showRows(measurement.detected(), cell, logCode);
}

} // namespace velmora
