// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANReports.h"

#include "Telephony/Drives/ServiceRecords.h"

#include <algorithm>
#include <cmath>

namespace velmora {

using namespace records;

namespace {

using Context = UTRANReportContext;
using Report = std::optional<RecordBuilder>;

/// How many cells besides the serving one the phone keeps in its monitored set.
constexpr std::size_t monitoredCells = 5;
constexpr std::size_t reportedCells = 10;
constexpr std::size_t reportedGSMCells = 6;

/// The cells but the serving one, the best `limit` of them.
std::vector<UTRANMeasurement> others(const Context& context, std::size_t limit) {
    std::vector<UTRANMeasurement> cells;
    for (const UTRANMeasurement& each : context.network.cells())
        if ((!context.phone.serving || each.cell != context.phone.serving->cell) && cells.size() < limit)
            cells.push_back(each);
    return cells;
}

std::vector<GSMMeasurement> gsmCells(const Context& context) {
    const std::vector<GSMMeasurement>& all = context.network.gsm();
    return {all.begin(), all.begin() + static_cast<std::ptrdiff_t>(std::min(reportedGSMCells, all.size()))};
}

/// The serving cell above noise and what the cells on its carrier disturb.
double signalToInterference_dB(const Context& context) {
    constexpr double noise_dBm = -98; // cells too far off to be measured among it
    double interference_mW = std::pow(10.0, noise_dBm / 10);
    for (const UTRANMeasurement& each : others(context, reportedCells))
        if (each.cell.uarfcn == context.phone.serving->cell.uarfcn)
            interference_mW += std::pow(10.0, (each.rscp_dBm - 3) / 10.0); // joint detection takes some out
    return std::clamp(context.phone.serving->rscp_dBm - 10 * std::log10(interference_mW), -11.0, 20.0);
}

/// One block in a hundred at 8 dB, ten times as many 6 dB below.
double blockErrorRate(double sir_dB) {
    return std::clamp(std::pow(10.0, -2 - (sir_dB - 8) / 6), 0.0001, 1.0);
}

/// A record of the modem whose code no client requests.
Report foreign(Context& context) {
    RecordBuilder record(0xD0F1, 13);
    for (std::size_t i = 0; i < 12; ++i)
        record.u8(13 + i, context.random.between(0, 255));
    return record;
}

Report cellArray(Context& context) {
    std::vector<DictionaryRef> cells;
    if (context.phone.serving)
        cells.push_back(utranCellInformation(*context.phone.serving, true));
    for (const UTRANMeasurement& each : others(context, monitoredCells))
        cells.push_back(utranCellInformation(each, false));
    for (const GSMMeasurement& each : gsmCells(context))
        cells.push_back(gsmCellInformation(each, false));
    context.binary = !context.binary;
    return cellInformation(cells, context.binary);
}

constexpr UTRANReport offReports[] = {{2, utranReports::rrc}, {30, utranReports::sim}};

constexpr UTRANReport searchReports[] = {
    {0.24, utranReports::neighbours}, {0.48, utranReports::gsmNeighbours},
    {1, utranReports::rrc},           {2, cellArray},
    {3, utranReports::sim},           {2, foreign},
};

constexpr UTRANReport idleReports[] = {
    {0.24, utranReports::neighbours}, {0.96, utranReports::gsmNeighbours},
    {1, utranReports::rrc},           {1, utranReports::serving},
    {2, utranReports::quality},       {2, cellArray},
    {60, utranReports::sim},          {2, foreign},
};

constexpr UTRANReport connectedReports[] = {
    {0.24, utranReports::neighbours}, {0.48, utranReports::gsmNeighbours},
    {0.24, utranReports::quality},    {0.5, utranReports::rrc},
    {1, utranReports::serving},       {2, cellArray},
    {60, utranReports::sim},          {2, foreign},
};

} // namespace

std::optional<RecordBuilder> utranReports::rrc(UTRANReportContext& context) {
    return utranRRCState(context.phone.rrc);
}

std::optional<RecordBuilder> utranReports::serving(UTRANReportContext& context) {
    if (!context.phone.serving)
        return std::nullopt;
    return utranServingCell(context.phone.serving->cell, !context.phone.registered);
}

std::optional<RecordBuilder> utranReports::neighbours(UTRANReportContext& context) {
    std::vector<UTRANNeighbour> cells;
    const std::optional<UTRANMeasurement>& serving = context.phone.serving;
    if (serving)
        cells.push_back({*serving, UTRANSet::Active, true});
    for (const UTRANMeasurement& each : others(context, reportedCells)) {
        // Searching, the phone has no list to go by: all that it finds is detected.
        UTRANSet set = UTRANSet::Detected;
        if (serving && each.cell.area.plmn != serving->cell.area.plmn)
            set = UTRANSet::None; // another network's cell
        else if (serving && cells.size() <= monitoredCells)
            set = UTRANSet::Monitored;
        const bool close =
            serving && each.cell.uarfcn == serving->cell.uarfcn && each.rscp_dBm > serving->rscp_dBm - 12;
        cells.push_back({each, set, close});
    }
    return utranNeighbours(cells);
}

std::optional<RecordBuilder> utranReports::gsmNeighbours(UTRANReportContext& context) {
    return utranGSMNeighbours(gsmCells(context));
}

std::optional<RecordBuilder> utranReports::quality(UTRANReportContext& context) {
    const UTRANPhone& phone = context.phone;
    context.worstErrorRate = 0;
    if (!phone.serving || !phone.hasChannels())
        return utranChannelQuality({}, {});
    const double sir_dB = signalToInterference_dB(context);
    const double rate = blockErrorRate(sir_dB);
    const bool hasBearer = phone.rrc == RRCState::CellFACH || phone.contexts > 0;
    context.worstErrorRate = phone.call && phone.rrc == RRCState::CellDCH ? 2 * rate
                             : hasBearer                                  ? rate
                                                                          : rate / 10;
    const auto composite = [&](int identity, int slots) {
        UTRANCompositeChannel channel{identity, slots, {}};
        for (double& ratio : channel.sir_dB)
            ratio = sir_dB + context.random.normal();
        return channel;
    };
    if (phone.rrc == RRCState::CellFACH)
        return utranChannelQuality({{1, rate}}, {composite(0, 1)});
    if (phone.call) // the signalling, and the three classes of speech bits, of which the last two bear more
        return utranChannelQuality({{1, rate / 10}, {2, rate}, {3, 2 * rate}, {4, 2 * rate}},
                                   {composite(0, 1)});
    if (phone.contexts > 0) // the signalling, and the bearer on a channel of its own
        return utranChannelQuality({{1, rate / 10}, {5, rate}}, {composite(0, 1), composite(1, 4)});
    return utranChannelQuality({{1, rate / 10}}, {composite(0, 1)});
}

std::optional<RecordBuilder> utranReports::contexts(UTRANReportContext& context) {
    std::vector<DictionaryRef> active;
    for (int number = 1; number <= context.phone.contexts; ++number)
        active.push_back(testContext(number, context.phone.identities));
    context.binary = !context.binary;
    return packetContexts(active, context.binary);
}

std::optional<RecordBuilder> utranReports::sim(UTRANReportContext& context) {
    context.binary = !context.binary;
    return simFiles(*testSIM(context.phone.registeredArea, context.phone.identities), context.binary);
}

std::span<const UTRANReport> reportsOf(const UTRANPhone& phone) {
    switch (phone.radio) {
    case UTRANPhone::Radio::Off: return offReports;
    case UTRANPhone::Radio::Searching: return searchReports;
    case UTRANPhone::Radio::Camped: break;
    }
    if (phone.rrc == RRCState::Disconnected)
        return idleReports;
    return connectedReports;
}

} // namespace velmora
