// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMReports.h"

#include "Telephony/Drives/GSM/UMTSReports.h"
#include "Telephony/Drives/ServiceRecords.h"

namespace velmora {

using namespace records;

namespace {

using Context = GSMReportContext;
using Report = std::optional<RecordBuilder>;

/// The cells but the serving one, the best `limit` of them.
std::vector<GSMMeasurement> gsmNeighbours(const Context& context, std::size_t limit) {
    std::vector<GSMMeasurement> neighbours;
    for (const GSMMeasurement& each : context.network.gsm())
        if (each.cell != context.phone.gsm.cell && neighbours.size() < limit)
            neighbours.push_back(each);
    return neighbours;
}

/// A record of the modem whose code no client requests.
Report foreignRecord(Context& context) {
    RecordBuilder record(0x5226, 13);
    for (std::size_t i = 0; i < 12; ++i)
        record.u8(13 + i, context.random.between(0, 255));
    return record;
}

Report gsmServing(Context& context) {
    if (!context.phone.gsm.cell)
        return std::nullopt;
    return gsmServingCell(*context.phone.gsm.cell);
}

Report bsics(Context& context) {
    return bsicList(gsmNeighbours(context, 6));
}

Report dedicated(Context& context) {
    if (!context.phone.gsm.cell)
        return std::nullopt;
    return dedicatedChannel(context.phone.gsm.cell->arfcn);
}

Report hopping(Context& context) {
    if (!context.phone.gsm.cell)
        return std::nullopt;
    // The cell's own channel and two more of its network's share of the band.
    const int arfcn = context.phone.gsm.cell->arfcn;
    return mobileAllocation(arfcn % 64, {arfcn, arfcn + 2, arfcn + 4});
}

Report rr(Context& context) {
    const GSMPhone& phone = context.phone;
    return rrState(phone.rr, phone.rr == RRState::DataTransfer ? 2 : 0, 1,
                   phone.connection == GSMPhone::Connection::PacketSession);
}

Report dtx(Context& context) {
    const bool call = context.phone.connection == GSMPhone::Connection::Call;
    return discontinuousTransmission(call && context.random.chance(0.6));
}

Report si13(Context&) {
    return si13Position(0);
}

Report cellOptions(Context& context) {
    return gprsCellOptions(1, 7, context.phone.area().plmn.mnc == 2 ? 1 : 0);
}

Report timers(Context&) {
    return gprsTimers(0, 2, true);
}

Report pbcch(Context&) {
    return pbcchPresence(false);
}

Report packetSI(Context& context) {
    return packetSystemInformation(1, context.random.between(0, 3), context.random.between(0, 7), 0, true);
}

Report mm(Context& context) {
    return mmState(context.phone.mm, context.phone.mmSub, context.phone.mmStatus);
}

Report gmm(Context& context) {
    return gmmState(context.phone.gmm, context.phone.gmmSub, context.phone.gmmStatus);
}

Report network(Context& context) {
    const bool registered = context.phone.registered;
    return servingNetwork(0, registered ? ServiceType::CSAndPS : ServiceType::Limited, context.phone.area());
}

Report rankedGSM(Context& context) {
    context.isRankedUMTS = false;
    return rankedGSMCells(gsmNeighbours(context, 8));
}

Report cellArray(Context& context) {
    std::vector<DictionaryRef> cells;
    if (context.phone.gsm.cell)
        cells.push_back(gsmCellInformation(context.phone.gsm, true));
    if (context.phone.umts.cell)
        cells.push_back(umtsCellInformation(context.phone.umts, true));
    for (const GSMMeasurement& each : gsmNeighbours(context, 6))
        cells.push_back(gsmCellInformation(each, false));
    for (const UMTSMeasurement& each : umtsReports::neighbours(context, 4))
        cells.push_back(umtsCellInformation(each, false));
    context.binary = !context.binary;
    return cellInformation(cells, context.binary);
}

Report sim(Context& context) {
    context.binary = !context.binary;
    return simFiles(*testSIM(context.phone.registeredArea, context.phone.identities), context.binary);
}

constexpr GSMReport offReports[] = {{2, registrationReport}, {30, sim}};

constexpr GSMReport searchReports[] = {
    {0.25, rankedGSM},         {0.2, umtsReports::searcher}, {0.25, rr}, {0.5, mm},          {0.5, gmm},
    {0.5, registrationReport}, {0.5, umtsReports::rrc},      {3, sim},   {2, foreignRecord}, {2, cellArray},
};

// The two ranked lists share a record, and each empties the other's screen. Their periods differ, so that now
// the one and now the other comes last before a screen is redrawn.

constexpr GSMReport gsmIdleReports[] = {
    {0.24, gsmMeasurementReport},
    {1, bsics},
    {1, gsmServing},
    {0.5, rr},
    {2, cellArray},
    {1, gmm},
    {1, mm},
    {1, registrationReport},
    {2, network},
    {2, si13},
    {2, cellOptions},
    {2, timers},
    {2, pbcch},
    {2, packetSI},
    {1, dtx},
    {1.1, rankedGSM},
    {1, umtsReports::rankedCells},
    {2, foreignRecord},
    {60, sim},
};

constexpr GSMReport gsmCallReports[] = {
    {0.24, gsmMeasurementReport},
    {1, bsics},
    {0.48, dedicated},
    {1, hopping},
    {0.48, dtx},
    {0.5, rr},
    {2, cellArray},
    {1, gmm},
    {0.5, mm},
    {2, registrationReport},
    {1, umtsReports::rankedCells},
    {2, foreignRecord},
    {60, sim},
};

constexpr GSMReport gsmPacketReports[] = {
    {0.24, gsmMeasurementReport},
    {1, bsics},
    {1, gsmServing},
    {0.25, rr},
    {2, cellArray},
    {0.5, gmm},
    {2, mm},
    {1, registrationReport},
    {1, network},
    {2, si13},
    {1, cellOptions},
    {0.5, timers},
    {2, pbcch},
    {1, packetSI},
    {2, dtx},
    {1.1, rankedGSM},
    {1, umtsReports::rankedCells},
    {2, foreignRecord},
    {60, sim},
};

constexpr GSMReport umtsIdleReports[] = {
    {0.2, umtsReports::searcher},
    {1, umtsReports::rankedCells},
    {1.1, rankedGSM},
    {0.5, umtsReports::rrc},
    {1, umtsReports::servingCell},
    {2, umtsReports::security},
    {1, gmm},
    {1, mm},
    {1, registrationReport},
    {2, network},
    {2, cellArray},
    {2, foreignRecord},
    {60, sim},
};

constexpr GSMReport umtsConnectedReports[] = {
    {0.2, umtsReports::searcher},
    {0.2, umtsReports::transmitPower},
    {0.4, umtsReports::hsdpa},
    {1, umtsReports::blockErrors},
    {0.5, umtsReports::rrc},
    {2, umtsReports::servingCell},
    {2, umtsReports::security},
    {1, umtsReports::rankedCells},
    {1.1, rankedGSM},
    {2, gmm},
    {2, mm},
    {2, registrationReport},
    {2, cellArray},
    {2, foreignRecord},
    {60, sim},
};

} // namespace

std::optional<RecordBuilder> gsmMeasurementReport(GSMReportContext& context) {
    const GSMMeasurement& serving = context.phone.gsm;
    if (!serving.cell)
        return std::nullopt;
    // The 1800 layer is preferred by ten decibels.
    const int c2 = serving.rssi_dBm - gsmAccessMinimum_dBm + (serving.cell->arfcn >= 512 ? 10 : 0);
    const bool hysteresis = context.phone.connection == GSMPhone::Connection::PacketSession;
    return gsmMeasurements(serving, c2, hysteresis, gsmNeighbours(context, 6));
}

std::optional<RecordBuilder> registrationReport(GSMReportContext& context) {
    return registrationState(context.phone.registration);
}

std::span<const GSMReport> reportsOf(const GSMPhone& phone) {
    switch (phone.radio) {
    case GSMPhone::Radio::Off: return offReports;
    case GSMPhone::Radio::Searching: return searchReports;
    case GSMPhone::Radio::GSM:
        switch (phone.connection) {
        case GSMPhone::Connection::None: return gsmIdleReports;
        case GSMPhone::Connection::Call: return gsmCallReports;
        case GSMPhone::Connection::PacketSession: return gsmPacketReports;
        }
        break;
    case GSMPhone::Radio::UMTS:
        return phone.connection == GSMPhone::Connection::None
                   ? std::span<const GSMReport>(umtsIdleReports)
                   : std::span<const GSMReport>(umtsConnectedReports);
    }
    return {};
}

} // namespace velmora
