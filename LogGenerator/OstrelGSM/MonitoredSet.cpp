#include "LogGenerator/OstrelGSM/MonitoredSet.h"

#include "LogGenerator/OstrelGSM/SearcherRecord.h"
#include "Platform/SystemLog.h"

namespace velmora {

using OstrelGSM::SearcherRecord;

void MonitoredSet::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "MonitoredSet");
    if (logCode != SearcherRecord::code) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (record.size() < SearcherRecord::minimumLength)
        return;
    clearElements();
    // Whatever set a cell is of, it gives no row here.
    reportMissingEntries(SearcherRecord(record).cells(), logCode);
}

} // namespace velmora
