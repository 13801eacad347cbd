#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"

#include "LogGenerator/CellFields.h"
#include "LogGenerator/ExtraPayload.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

constexpr Field cellFields[] = {
    {"Cell Access Restrictions", u8At(14), integer("%d")},
    {"Cell ID", i32At(21), integer("%d")},
    {"Downlink UARFCN", u16At(19), integer("%d")},
    {"Uplink UARFCN", u16At(17), integer("%d")},
    {"URA ID", u8At(15), integer("%d")},
    {"Allowed Access", bitsAt(25, 0, 1), flag("Emergency Calls Only", "All Calls")},
};
constexpr Layout cell = layout(26, cellFields); // 0xD0E2

constexpr CellField knownFields[] = {
    {kVoxCellMonitorLAC, CellNumber::Whole, "Local Area Code", integer("%d"),
     "Serving Cell Info: Failed to retrieve LAC\n"},
    {kVoxCellMonitorCellId, CellNumber::Whole, "Cell ID", integer("%d"),
     "Serving Cell Info: Failed to retrieve Cell ID\n"},
    {kVoxCellMonitorBandInfo, CellNumber::Whole, "Freq Band Indicator", integer("%d"),
     "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
    {kVoxCellMonitorSCN, CellNumber::Whole, "Cell Scrambling Code", integer("%d"),
     "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n"},
    {kVoxCellMonitorUARFCN, CellNumber::Whole, "Uplink UARFCN", integer("%d"),
     "Serving Cell Info: Failed to retrieve UARFCN\n"},
};

} // namespace

void UTRANServingCellInfo::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "Serving Cell Info");
    switch (logCode) {
    case 0xD0E2: show(Record(data), cell); break;
    case 0xFF0001: showServingCells(data); break;
    default: break;
    }
}

void UTRANServingCellInfo::showServingCells(const Data& data) const {
    const CellInfoArrayReader reader(data);
    // What is no array is passed over without the line that other sections write.
    const Array* cells = reader.parsed().asArray();
    if (!cells)
        return;
    const DictionaryRef node = dictionary();
    for (const Value& each : *cells) {
        if (!isCell(each, kVoxCellMonitorRadioAccessTechnologyUTRAN, kVoxCellMonitorCellTypeServing))
            continue;
        const Dictionary& fields = *each.asDictionary();
        writeCellFields(node.get(), fields, knownFields);
        // The service knows one channel number, which stands under both labels: that is meant.
        if (const auto uarfcn = cellNumber(fields, kVoxCellMonitorUARFCN); uarfcn && node)
            writeValue(*node, "Downlink UARFCN", integer("%d"), *uarfcn);
    }
}

} // namespace velmora
