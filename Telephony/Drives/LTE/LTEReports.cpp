// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTEReports.h"

#include "Telephony/Drives/ServiceRecords.h"

#include <algorithm>

namespace velmora {

using namespace records;

namespace lteReports {
namespace {

using Context = LTEReportContext;
using Report = std::optional<RecordBuilder>;

/// The cells of the carrier but the serving one, those from the `first` best on, at most `limit`.
std::vector<LTEMeasurement> others(const Context& context, std::size_t carrier, std::size_t first,
                                   std::size_t limit) {
    std::vector<LTEMeasurement> cells;
    for (const LTEMeasurement& each : context.network.cells(carrier))
        if (!context.phone.serving || each.cell != context.phone.serving->cell)
            cells.push_back(each);
    const auto begin = cells.begin() + static_cast<std::ptrdiff_t>(std::min(first, cells.size()));
    return {begin, begin + std::min(static_cast<std::ptrdiff_t>(limit), cells.end() - begin)};
}

std::size_t otherCarrier(const Context& context, std::size_t turn) {
    return (context.phone.carrier + 1 + turn % (lteCarriers.size() - 1)) % lteCarriers.size();
}

/// The best cell of that technology; none where nothing of it is measured.
std::optional<ReselectionCandidate> candidate(const Context& context, RATType type) {
    const bool second = context.phone.serving && context.phone.serving->cell.area.plmn.mnc == 2;
    switch (type) {
    case RATType::LTE: {
        const std::size_t carrier = otherCarrier(context, context.candidates);
        const auto& cells = context.network.cells(carrier);
        if (cells.empty())
            return std::nullopt;
        return ReselectionCandidate{type, lteCarriers[carrier].priority, lteCarriers[carrier].downlink,
                                    cells.front().cell.physicalId};
    }
    case RATType::UTRAN: {
        if (context.network.umts().empty())
            return std::nullopt;
        const UMTSCell& cell = *context.network.umts().front().cell;
        return ReselectionCandidate{type, 2, cell.uarfcn, cell.scramblingCode};
    }
    case RATType::GERAN: {
        if (context.network.gsm().empty())
            return std::nullopt;
        const GSMCell& cell = *context.network.gsm().front().cell;
        return ReselectionCandidate{type, 1, cell.arfcn, cell.bsic, cell.arfcn < 512 ? 0 : 1};
    }
    // Each network has a partner's channel, and pilots are spread in steps of four.
    case RATType::CDMA1xRTT: return ReselectionCandidate{type, 0, second ? 384 : 283, 168, 0};
    case RATType::CDMAHRPD: return ReselectionCandidate{type, 0, second ? 450 : 425, 172, 1};
    case RATType::Other: return ReselectionCandidate{type, 7};
    }
    return std::nullopt;
}

constexpr RATType everyType[] = {RATType::LTE,       RATType::UTRAN,    RATType::GERAN,
                                 RATType::CDMA1xRTT, RATType::CDMAHRPD, RATType::Other};

Report cellArray(Context& context) {
    std::vector<DictionaryRef> cells;
    if (context.phone.serving)
        cells.push_back(lteCellInformation(*context.phone.serving, true));
    for (const LTEMeasurement& each : others(context, context.phone.carrier, 0, 6))
        cells.push_back(lteCellInformation(each, false));
    context.binary = !context.binary;
    return cellInformation(cells, context.binary);
}

/// A record of the modem whose code no client requests.
Report foreignRecord(Context& context) {
    RecordBuilder record(0xB173, 13);
    for (std::size_t i = 0; i < 16; ++i)
        record.u8(13 + i, context.random.between(0, 255));
    return record;
}

constexpr LTEReport offReports[] = {{3, sim}};

constexpr LTEReport searchReports[] = {{1, neighbours}, {2, cellArray}, {3, sim}, {2, foreignRecord}};

constexpr LTEReport idleReports[] = {
    {0.64, idleMeasurement}, {0.64, neighbours}, {1.28, candidates}, {2, servingCell},
    {4, antennas},           {3, cellArray},     {2, foreignRecord}, {60, sim},
};

constexpr LTEReport connectedReports[] = {
    {0.24, intraFrequency}, {2, servingCell}, {4, antennas}, {3, cellArray}, {2, foreignRecord}, {60, sim},
};

} // namespace

Report servingCell(Context& context) {
    if (!context.phone.serving)
        return std::nullopt;
    return lteServingCell(context.phone.serving->cell);
}

Report antennas(Context& context) {
    if (!context.phone.serving)
        return std::nullopt;
    // The widest carriers have four, the narrowest one.
    const int blocks = lteCarriers[context.phone.carrier].resourceBlocks;
    return lteAntennas(context.phone.serving->cell, blocks >= 75 ? 4 : blocks >= 15 ? 2 : 1);
}

Report intraFrequency(Context& context) {
    if (!context.phone.serving)
        return std::nullopt;
    context.subframe = (context.subframe + 240) % 10240;
    // Of the weaker cells the level is not known yet.
    return lteIntraFrequency(*context.phone.serving, context.subframe,
                             others(context, context.phone.carrier, 0, 6),
                             others(context, context.phone.carrier, 6, 3));
}

Report idleMeasurement(Context& context) {
    if (!context.phone.serving)
        return std::nullopt;
    LTEIdleMeasurement measurement;
    measurement.now = *context.phone.serving;
    measurement.average = context.phone.average;
    measurement.cyclesBelow = context.phone.cyclesBelow;
    measurement.limitedPower = context.phone.serving->cell.area.plmn.mnc == 1;
    measurement.searchesAlways = context.phone.carrier >= 4; // on the narrowest carriers
    measurement.rulesUpdated = context.random.chance(0.1);
    const int level = selectionLevel_dB(*context.phone.serving);
    measurement.rules = level < lteNonIntraSearch_dB || measurement.searchesAlways ? 3
                        : level < lteIntraSearch_dB                                ? 1
                                                                                   : 0;
    return lteIdleMeasurement(measurement);
}

Report neighbours(Context& context) {
    // Every fourth record is of another carrier.
    const std::size_t turn = context.neighbours++;
    const std::size_t carrier = turn % 4 == 3 ? otherCarrier(context, turn / 4) : context.phone.carrier;
    std::vector<LTENeighbour> cells;
    for (const LTEMeasurement& each : others(context, carrier, 0, 6)) {
        LTENeighbour cell{each, each, 0, 0, 0};
        cell.average.rsrp_dBm -= 0.5;
        cell.average.rsrq_dB = std::max(cell.average.rsrq_dB - 0.25, -19.5);
        cell.frequencyOffset = context.random.between(0, 120);
        // A cell's frames begin where they begin; only the phone's place moves them a little.
        cell.frameOffset = each.cell.physicalId * 37 % 1024;
        cell.sampleOffset = each.cell.physicalId * 601 % 307000 + context.random.between(0, 16);
        cells.push_back(cell);
    }
    if (cells.empty())
        return std::nullopt; // the record cannot express an empty list
    return lteNeighbours(lteCarriers[carrier], cells);
}

Report candidates(Context& context) {
    if (!context.phone.serving)
        return std::nullopt;
    // One candidate of each type, one after another, then several together.
    const std::size_t turn = context.candidates++ % (std::size(everyType) + 1);
    std::vector<ReselectionCandidate> list;
    if (turn < std::size(everyType)) {
        if (const auto one = candidate(context, everyType[turn]))
            list.push_back(*one);
    } else {
        for (const RATType type : {RATType::LTE, RATType::UTRAN, RATType::GERAN})
            if (const auto one = candidate(context, type))
                list.push_back(*one);
    }
    return reselectionCandidates(context.phone.serving->cell, list);
}

Report contexts(Context& context) {
    std::vector<DictionaryRef> list;
    for (int number = 1; number <= context.phone.contexts; ++number)
        list.push_back(testContext(number, context.phone.identities));
    context.binary = !context.binary;
    return packetContexts(list, context.binary);
}

Report sim(Context& context) {
    context.binary = !context.binary;
    return simFiles(*testSIM(context.phone.registeredArea, context.phone.identities), context.binary);
}

} // namespace lteReports

std::span<const LTEReport> reportsOf(const LTEPhone& phone) {
    switch (phone.radio) {
    case LTEPhone::Radio::Off: return lteReports::offReports;
    case LTEPhone::Radio::Searching: return lteReports::searchReports;
    case LTEPhone::Radio::Camped:
        return phone.connected ? std::span<const LTEReport>(lteReports::connectedReports)
                               : std::span<const LTEReport>(lteReports::idleReports);
    }
    return {};
}

} // namespace velmora
