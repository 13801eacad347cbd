// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/UMTSReports.h"

#include <algorithm>

namespace velmora::umtsReports {

using namespace records;

namespace {

/// How often a block comes wrong at this Ec/No.
double errorProbability(double ecno_dB) {
    return std::clamp(0.02 + (-8 - ecno_dB) * 0.02, 0.005, 0.5);
}

std::vector<HARQProcess> harqProcesses(GSMReportContext& context, int count) {
    std::vector<HARQProcess> processes;
    for (int identity = 0; identity < count; ++identity) {
        HARQProcess process{identity, 0, context.random.between(8, 25), 0};
        for (int block = 0; block < process.newTransmissions; ++block)
            if (context.random.chance(2 * errorProbability(context.phone.umts.ecno_dB)))
                ++process.blockErrors;
        process.receivedBits = 7168LL * (process.newTransmissions - process.blockErrors);
        processes.push_back(process);
    }
    return processes;
}

} // namespace

std::vector<UMTSMeasurement> neighbours(const GSMReportContext& context, std::size_t limit) {
    std::vector<UMTSMeasurement> cells;
    for (const UMTSMeasurement& each : context.network.umts())
        if (each.cell != context.phone.umts.cell && cells.size() < limit)
            cells.push_back(each);
    return cells;
}

std::optional<RecordBuilder> rankedCells(GSMReportContext& context) {
    context.isRankedUMTS = true;
    return rankedUMTSCells(neighbours(context, 8));
}

std::optional<RecordBuilder> searcher(GSMReportContext& context) {
    constexpr int monitored = 1;
    constexpr int detected = 2;
    std::vector<SearchedCell> cells;
    if (context.phone.umts.cell)
        cells.push_back({context.phone.umts, 0});
    const bool soft = context.phone.rrc == RRCState::CellDCH;
    for (const UMTSMeasurement& each : neighbours(context, 7)) {
        // In soft handover cells close to the best one join the active set.
        const bool close = soft && each.rscp_dBm > context.phone.umts.rscp_dBm - 4 && cells.size() < 3;
        const bool ownCarrier =
            context.phone.umts.cell && each.cell->uarfcn == context.phone.umts.cell->uarfcn;
        cells.push_back({each, close && ownCarrier ? 0 : ownCarrier ? monitored : detected});
    }
    return searchedCells(context.network.umtsRSSI_dBm(), cells);
}

std::optional<RecordBuilder> rrc(GSMReportContext& context) {
    return rrcState(context.phone.rrc);
}

std::optional<RecordBuilder> servingCell(GSMReportContext& context) {
    if (!context.phone.umts.cell)
        return std::nullopt;
    return umtsServingCell(*context.phone.umts.cell, 1);
}

std::optional<RecordBuilder> security(GSMReportContext& context) {
    return ciphering(context.phone.rrc == RRCState::CellDCH || context.phone.rrc == RRCState::CellFACH);
}

std::optional<RecordBuilder> transmitPower(GSMReportContext& context) {
    // Open-loop: the further away, the louder.
    const double wanted = -85.0 - context.phone.umts.rscp_dBm;
    std::vector<double> powers(5);
    for (double& power : powers)
        power = std::clamp(wanted + context.random.normal(), -50.0, 24.0);
    return transmitPowers(powers);
}

std::optional<RecordBuilder> blockErrors(GSMReportContext& context) {
    const int blocks = 50;
    context.crcs += blocks;
    for (int block = 0; block < blocks; ++block)
        if (context.random.chance(errorProbability(context.phone.umts.ecno_dB)))
            ++context.crcErrors;
    return blockErrorRates(
        100, {{1, context.crcs, context.crcErrors}, {5, context.crcs / 2, context.crcErrors / 3}});
}

std::optional<RecordBuilder> hsdpa(GSMReportContext& context) {
    if (context.phone.rrc != RRCState::CellDCH ||
        context.phone.connection != GSMPhone::Connection::PacketSession)
        return std::nullopt;
    context.subFrames = (context.subFrames + 200) % 1024;
    const auto primary = harqProcesses(context, 6);
    const bool dual = context.random.chance(0.2);
    return harqStatistics(context.subFrames, primary,
                          dual ? harqProcesses(context, 6) : std::vector<HARQProcess>{});
}

} // namespace velmora::umtsReports
